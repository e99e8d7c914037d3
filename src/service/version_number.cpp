#include "service/version_number.h"

#include <charconv>
#include <cmath>
#include <limits>
#include <string>

#include "common/constants.h"

namespace checker {

namespace {

bool isSkipped(char c) {
    return c == ' ' || c == '\t' || c == '\n';
}
bool isDigit(char c) {
    return c >= '0' && c <= '9';
}
char upper(char c) {
    return (c >= 'a' && c <= 'z') ? char(c - 'a' + 'A') : c;
}

int digitValue(char c, int radix) {
    int v = -1;
    if (isDigit(c))
        v = c - '0';
    else if (upper(c) >= 'A' && upper(c) <= 'F')
        v = upper(c) - 'A' + 10;
    return v < radix ? v : -1;
}

// Reads the text with the skipped characters taken out, so the number may be spread over blanks.
class Cursor {
  public:
    explicit Cursor(std::string_view text) : text_(text) { skip(); }
    bool done() const { return pos_ >= text_.size(); }
    char peek() const { return done() ? '\0' : text_[pos_]; }
    void next() {
        ++pos_;
        skip();
    }
    std::size_t position() const { return pos_; }
    void restore(std::size_t p) { pos_ = p; }

  private:
    void skip() {
        while (pos_ < text_.size() && isSkipped(text_[pos_]))
            ++pos_;
    }
    std::string_view text_;
    std::size_t pos_ = 0;
};

// "&H1F", "&O17": whole digits of the radix; no digit gives 0.
double readRadix(Cursor& c, int radix) {
    double value = 0;
    for (int d; (d = digitValue(c.peek(), radix)) >= 0; c.next())
        value = value * radix + d;
    return value;
}

constexpr long long kExponentCap = 1'000'000'000'000LL;

struct Decimal {
    double value = 0;
    bool any = false;     // at least one digit
    bool complete = true; // nothing left over after it
};

// Digits with at most one ".", then an optional exponent "E"/"D" with its own sign.
Decimal readDecimal(Cursor& c) {
    std::string mantissa = "0";
    bool seenPoint = false, any = false;
    for (;; c.next()) {
        const char ch = c.peek();
        if (isDigit(ch)) {
            mantissa.push_back(ch);
            any = true;
        } else if (ch == '.' && !seenPoint) {
            mantissa.push_back('.');
            seenPoint = true;
        } else {
            break;
        }
    }
    if (seenPoint && mantissa.back() == '.') mantissa.push_back('0');

    // The exponent counts only when digits follow it. Its size is capped far beyond any digit
    // count a text can have, so the cap changes no result but keeps the integer from overflowing.
    long long exponent = 0;
    const char e = upper(c.peek());
    if (any && (e == 'E' || e == 'D')) {
        const std::size_t before = c.position();
        c.next();
        bool negative = false;
        if (c.peek() == '+' || c.peek() == '-') {
            negative = c.peek() == '-';
            c.next();
        }
        if (isDigit(c.peek())) {
            for (; isDigit(c.peek()); c.next())
                if (exponent < kExponentCap) exponent = exponent * 10 + (c.peek() - '0');
            if (negative) exponent = -exponent;
        } else {
            c.restore(before);
        }
    }

    Decimal d;
    d.any = any;
    d.complete = c.done();
    if (!any) return d;
    const std::string text = mantissa + "e" + std::to_string(exponent);
    double value = 0;
    const auto result = std::from_chars(text.data(), text.data() + text.size(), value);
    if (result.ec == std::errc::result_out_of_range)
        value = exponent > 0 ? std::numeric_limits<double>::infinity() : 0.0;
    d.value = value;
    return d;
}

struct Number {
    double value = 0;
    bool any = false;
    bool complete = false;
};

Number readNumber(std::string_view text) {
    Cursor c(text);
    Number n;
    if (c.peek() == '&') {
        c.next();
        const char kind = upper(c.peek());
        const int radix = kind == 'H' ? 16 : kind == 'O' ? 8 : 0;
        if (radix == 0) return n;
        c.next();
        const bool any = digitValue(c.peek(), radix) >= 0;
        n.value = readRadix(c, radix);
        n.any = any;
        n.complete = any && c.done();
        return n;
    }
    double sign = 1;
    if (c.peek() == '+' || c.peek() == '-') {
        if (c.peek() == '-') sign = -1;
        c.next();
    }
    const Decimal d = readDecimal(c);
    n.value = d.any ? sign * d.value : 0;
    n.any = d.any;
    n.complete = d.any && d.complete;
    return n;
}

} // namespace

double fnVersionValue(std::string_view text) {
    const Number n = readNumber(text);
    // No negative zero: "-0" must compare and print like "0".
    return n.value == 0 ? 0.0 : n.value;
}

std::optional<bool> fnTruthValue(std::string_view text) {
    auto equalsNoCase = [&](std::string_view expected) {
        if (text.size() != expected.size()) return false;
        for (std::size_t i = 0; i < text.size(); ++i)
            if (upper(text[i]) != upper(expected[i])) return false;
        return true;
    };
    if (equalsNoCase(service::kTextTrue)) return true;
    if (equalsNoCase(service::kTextFalse)) return false;

    // A number must be the whole field; blanks may stand around it, as a number conversion
    // allows, but not inside it, and no other white space anywhere.
    const auto first = text.find_first_not_of(' ');
    if (first == std::string_view::npos) return std::nullopt;
    const auto last = text.find_last_not_of(' ');
    const std::string_view word = text.substr(first, last - first + 1);
    if (word.find_first_of(" \t\n") != std::string_view::npos) return std::nullopt;
    const Number n = readNumber(word);
    if (!n.any || !n.complete) return std::nullopt;
    return n.value != 0;
}

} // namespace checker

#include "startup/customer_id.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <limits>
#include <string>

#include "common/constants.h"
#include "common/error.h"

namespace checker {

namespace {
constexpr const char* kSource = "lngCustID";

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}
} // namespace

std::optional<double> fnPlatformNumber(std::string_view text) {
    const auto first = text.find_first_not_of(' ');
    if (first == std::string_view::npos) return std::nullopt;
    const auto last = text.find_last_not_of(' ');
    std::string_view body = text.substr(first, last - first + 1);

    bool negative = false;
    if (body.front() == '+' || body.front() == '-') {
        negative = body.front() == '-';
        body.remove_prefix(1);
    }
    // Check the shape ourselves: the parser below would accept "inf", "nan" and hex forms.
    std::size_t i = 0, digits = 0;
    while (i < body.size() && isDigit(body[i]))
        ++i, ++digits;
    if (i < body.size() && body[i] == '.') {
        ++i;
        while (i < body.size() && isDigit(body[i]))
            ++i, ++digits;
    }
    if (digits == 0) return std::nullopt;
    if (i < body.size() && (body[i] == 'e' || body[i] == 'E')) {
        ++i;
        if (i < body.size() && (body[i] == '+' || body[i] == '-')) ++i;
        std::size_t expDigits = 0;
        while (i < body.size() && isDigit(body[i]))
            ++i, ++expDigits;
        if (expDigits == 0) return std::nullopt;
    }
    if (i != body.size()) return std::nullopt;

    // The shape is checked, so strtod sees plain decimal text; the program never changes the C
    // locale, so its decimal point is ".". Too large gives HUGE_VAL, which the conversion
    // reports as an overflow; too small gives 0.
    const std::string core(body);
    const double value = std::strtod(core.c_str(), nullptr);
    return negative ? -value : value;
}

std::int32_t fnToLong32(double value, const char* source) {
    if (!std::isfinite(value)) throw overflowError(source);
    double whole = std::floor(value);
    const double fraction = value - whole;
    if (fraction > 0.5 || (fraction == 0.5 && std::fmod(whole, 2.0) != 0.0)) whole += 1.0;
    if (whole < static_cast<double>(std::numeric_limits<std::int32_t>::min()) ||
        whole > static_cast<double>(std::numeric_limits<std::int32_t>::max()))
        throw overflowError(source);
    return static_cast<std::int32_t>(whole);
}

std::int32_t fnDeriveCustID(std::string_view plain) {
    if (const auto number = fnPlatformNumber(plain)) return fnToLong32(*number, kSource);
    if (plain.empty())
        throw CheckerError(startup::kErrInvalidCall, kSource,
                           std::string(startup::kErrInvalidCallText));
    // The ANSI code of a single-byte character is its byte value.
    std::string text = std::to_string(static_cast<unsigned char>(plain.front()));
    const std::size_t tail = std::min(plain.size(), startup::kCustIdTailChars);
    text.append(plain.substr(plain.size() - tail));
    const auto number = fnPlatformNumber(text);
    if (!number) throw typeMismatchError(kSource);
    return fnToLong32(*number, kSource);
}

} // namespace checker

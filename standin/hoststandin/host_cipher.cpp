#include "host_cipher.h"

#include <cstdint>

namespace hoststandin {

namespace {
constexpr char kDigits[] = "0123456789ABCDEF";

int hexValue(char c) {
    if (c >= '0' && c <= '9') return c - '0';
    if (c >= 'A' && c <= 'F') return c - 'A' + 10;
    if (c >= 'a' && c <= 'f') return c - 'a' + 10;
    return -1;
}

std::string mix(std::string_view bytes, std::string_view key) {
    std::string out(bytes);
    for (std::size_t i = 0; i < out.size(); ++i) {
        const auto k =
            key.empty() ? std::uint8_t(0) : static_cast<std::uint8_t>(key[i % key.size()]);
        out[i] = static_cast<char>(static_cast<std::uint8_t>(out[i]) ^ k ^
                                   static_cast<std::uint8_t>(i * 29 + 11));
    }
    return out;
}
} // namespace

std::string toHex(std::string_view bytes) {
    std::string out;
    out.reserve(bytes.size() * 2);
    for (char c : bytes) {
        const auto b = static_cast<std::uint8_t>(c);
        out.push_back(kDigits[b >> 4]);
        out.push_back(kDigits[b & 15]);
    }
    return out;
}

std::optional<std::string> fromHex(std::string_view hex) {
    if (hex.size() % 2) return std::nullopt;
    std::string out;
    out.reserve(hex.size() / 2);
    for (std::size_t i = 0; i < hex.size(); i += 2) {
        const int hi = hexValue(hex[i]), lo = hexValue(hex[i + 1]);
        if (hi < 0 || lo < 0) return std::nullopt;
        out.push_back(static_cast<char>(hi * 16 + lo));
    }
    return out;
}

std::string encipher(std::string_view plain, std::string_view key) {
    return toHex(mix(plain, key));
}

std::optional<std::string> decipher(std::string_view text, std::string_view key) {
    auto bytes = fromHex(text);
    if (!bytes) return std::nullopt;
    return mix(*bytes, key);
}

} // namespace hoststandin

// The one error type of the checker: a number, a source and a description,
// as the language runtime of the original reported its errors.
#pragma once

#include <cstdint>
#include <stdexcept>
#include <string>

namespace checker {

class CheckerError : public std::runtime_error {
public:
    CheckerError(std::int32_t number, std::string source, std::string description)
        : std::runtime_error(description), number_(number), source_(std::move(source)),
          description_(std::move(description)) {}

    std::int32_t number() const noexcept { return number_; }
    const std::string& source() const noexcept { return source_; }
    const std::string& description() const noexcept { return description_; }

    // Same number and description, new source: how a trapping operation passes an error on.
    CheckerError withSource(std::string source) const {
        return CheckerError(number_, std::move(source), description_);
    }

private:
    std::int32_t number_;
    std::string source_;
    std::string description_;
};

// Runtime error numbers and their standard texts.
inline constexpr std::int32_t kErrOverflow = 6;
inline constexpr std::int32_t kErrSubscriptOutOfRange = 9;
inline constexpr std::int32_t kErrTypeMismatchNumber = 13;
inline constexpr std::int32_t kErrFileNotFound = 53;

CheckerError subscriptError(const std::string& source);
CheckerError typeMismatchError(const std::string& source);
CheckerError overflowError(const std::string& source);

} // namespace checker

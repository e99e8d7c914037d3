#include "common/error.h"

namespace checker {

CheckerError subscriptError(const std::string& source) {
    return CheckerError(kErrSubscriptOutOfRange, source, "Subscript out of range");
}

CheckerError typeMismatchError(const std::string& source) {
    return CheckerError(kErrTypeMismatchNumber, source, "Type mismatch");
}

CheckerError overflowError(const std::string& source) {
    return CheckerError(kErrOverflow, source, "Overflow");
}

} // namespace checker

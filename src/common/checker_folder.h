// The checker folder: the folder of the checker's own executable, without a trailing separator.
#pragma once

#include <string>

namespace checker {
std::string checkerFolder();
}

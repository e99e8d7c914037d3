// Command line of the update service.
#pragma once

#include <map>
#include <optional>
#include <string>

namespace updsrv {

struct Options {
    int port = 8080;
    std::map<std::string, std::string> latest; // product id -> four-part version
    std::optional<std::string> answer;         // every check and download answers this
    std::optional<std::string> date;           // the date endpoint answers this
    int status = 200;
    int delayMs = 0;
    bool drop = false;
    std::string logFile;
    bool help = false;
};

// Throws std::invalid_argument with a message for the user.
Options parseOptions(int argc, char** argv);

extern const char* const kUsage;

} // namespace updsrv

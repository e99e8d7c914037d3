#include "options.h"

#include <fstream>
#include <iterator>
#include <stdexcept>
#include <string>

#include "common/text.h"

namespace updsrv {

const char* const kUsage = R"(usage: update-server [options]

The maker's update service, for tests and the demo. Bound to 127.0.0.1 only; the first line
printed is "listening on 127.0.0.1:PORT".

Endpoints (exact paths, letter case included):
  GET  /SUPPORT/Downloads/CheckWebUpdate.asp?QUERY       check, customer code
  GET  /SUPPORT/Downloads/CheckOZProUpdate.asp?QUERY     check, customer id
  GET  /Support/downloads/UpdateString.asp?QUERY         download, customer code
  GET  /Support/downloads/OZProUpdateString.asp?QUERY    download, customer id
  POST /SUPPORT/Downloads/QVLDATETime.asp                 the service's date
Any other path or method gets 404. A request line the HTTP library refuses (such as a
second "?" in the query) gets 400 with an empty body; it is logged all the same.

Check and download answers: four comma-separated fields
  SELECT,LATEST,INSTALLED,FLAG
  SELECT     the product id the request carried (Select=)
  LATEST     the latest version of that product (--latest), empty when none is known
  INSTALLED  the installed version the request carried: MajorVersion "." MinorVersion
  FLAG       "True" when LATEST is newer than the installed major and minor version (the
             major "a.b" and the last part of LATEST compared as numbers), else "False"
The date answer is today's date as mm/dd/yyyy.

Options:
  --port N               port to listen on (default 8080; 0 picks a free one)
  --latest PRODUCT=VER   latest version of product id PRODUCT, e.g. 1=10.4.0.5 (repeatable)
  --answer TEXT          every check and download answers TEXT
  --answer-file FILE     every check and download answers the bytes of FILE
  --date TEXT            the date endpoint answers TEXT
  --status CODE          every answer carries HTTP status CODE (body unchanged)
  --delay-ms N           wait N ms before answering
  --drop                 read each request, then close the connection without answering
  --log FILE             append one line per request, "METHOD PATH?QUERY" as received
  --help                 this text
)";

namespace {

int number(const std::string& option, const std::string& text, int low, int high) {
    std::size_t used = 0;
    int value = 0;
    try {
        value = std::stoi(text, &used);
    } catch (const std::exception&) {
        used = 0;
    }
    if (used != text.size() || text.empty() || value < low || value > high)
        throw std::invalid_argument(option + ": not a number from " + std::to_string(low) + " to " +
                                    std::to_string(high) + ": " + text);
    return value;
}

} // namespace

Options parseOptions(int argc, char** argv) {
    Options o;
    for (int i = 1; i < argc; ++i) {
        const std::string arg = argv[i];
        auto value = [&]() -> std::string {
            if (i + 1 >= argc) throw std::invalid_argument(arg + " needs a value");
            return argv[++i];
        };
        if (arg == "--help" || arg == "-h") {
            o.help = true;
        } else if (arg == "--port") {
            o.port = number(arg, value(), 0, 65535);
        } else if (arg == "--latest") {
            const std::string v = value();
            const auto eq = v.find('=');
            const std::string version = eq == std::string::npos ? "" : v.substr(eq + 1);
            if (eq == std::string::npos || eq == 0 || checker::splitFields(version, '.').size() < 2)
                throw std::invalid_argument(
                    "--latest wants PRODUCT=VERSION with a dotted version: " + v);
            o.latest[v.substr(0, eq)] = version;
        } else if (arg == "--answer") {
            o.answer = value();
        } else if (arg == "--answer-file") {
            const std::string path = value();
            std::ifstream in(path, std::ios::binary);
            if (!in) throw std::invalid_argument("cannot read " + path);
            o.answer =
                std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
        } else if (arg == "--date") {
            o.date = value();
        } else if (arg == "--status") {
            o.status = number(arg, value(), 100, 599);
        } else if (arg == "--delay-ms") {
            o.delayMs = number(arg, value(), 0, 3'600'000);
        } else if (arg == "--drop") {
            o.drop = true;
        } else if (arg == "--log") {
            o.logFile = value();
        } else {
            throw std::invalid_argument("unknown option: " + arg);
        }
    }
    return o;
}

} // namespace updsrv

// The ports through which the portable core reaches the outside world.
// Each has one Win32 adapter in the product (files ending in _win32) and fakes in the unit tests.
#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace checker {

// Private-profile (INI) files, ANSI.
class ProfilePort {
public:
    virtual ~ProfilePort() = default;
    // What the platform copies into a buffer of `bufferChars` characters: at most bufferChars - 1.
    virtual std::string read(const std::string& file, std::string_view section, std::string_view key,
                             std::string_view defaultValue, std::size_t bufferChars) = 0;
    // Result not examined by any caller.
    virtual void write(const std::string& file, std::string_view section, std::string_view key,
                       std::string_view value) = 0;
};

class FilesPort {
public:
    virtual ~FilesPort() = default;
    // A plain directory search for this one name: ordinary files only (no folders, hidden, system).
    virtual bool existsPlain(const std::string& path) = 0;
    // Any file, also on a network path.
    virtual bool existsAny(const std::string& path) = 0;
    // Throws CheckerError when the copy fails.
    virtual void copyReplace(const std::string& from, const std::string& to) = 0;
    // Dotted file version ("10.3.0.3"); empty for a file without one; throws for a missing file.
    virtual std::string fileVersion(const std::string& path) = 0;
};

struct ProcessEntry {
    std::uint32_t processId = 0;
    std::string imageName; // the entry's file-name field up to its first NUL
};

class ProcessesPort {
public:
    virtual ~ProcessesPort() = default;
    // Start `path` as a program with the given show state, without waiting. Throws CheckerError.
    virtual void start(const std::string& path, int showState) = 0;
    virtual std::vector<ProcessEntry> snapshot() = 0;
    // Failures are passed over.
    virtual void terminate(std::uint32_t processId) = 0;
};

class NetworkPort {
public:
    virtual ~NetworkPort() = default;
    virtual bool isConnected() = 0;
};

// One HTTP request object, as the request object of the platform offers it.
class HttpRequest {
public:
    virtual ~HttpRequest() = default;
    // Failures throw CheckerError carrying the HTTP layer's number and description.
    virtual void open(std::string_view method, const std::string& url) = 0;
    virtual void send() = 0;
    virtual std::string responseText() = 0;
};

class HttpPort {
public:
    virtual ~HttpPort() = default;
    // Throws CheckerError when the request object cannot be created.
    virtual std::unique_ptr<HttpRequest> create() = 0;
};

struct CalendarDate {
    int year = 0, month = 0, day = 0;
    friend bool operator==(const CalendarDate&, const CalendarDate&) = default;
};

// Dates under the regional settings.
class DatesPort {
public:
    virtual ~DatesPort() = default;
    virtual CalendarDate today() = 0;
    virtual std::string shortDateText(const CalendarDate& date) = 0;
    virtual std::optional<CalendarDate> recognise(std::string_view text) = 0;
    // "mm/dd/yyyy" with the regional date separator.
    virtual std::string formatMonthDayYear(const CalendarDate& date) = 0;
};

// "Let pending window messages run once."
class MessagePump {
public:
    virtual ~MessagePump() = default;
    virtual void doEvents() = 0;
};

} // namespace checker

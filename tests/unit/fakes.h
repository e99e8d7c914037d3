// In-memory stand-ins for the ports, shared by the unit tests.
#pragma once

#include <cstdio>
#include <deque>
#include <optional>
#include <functional>
#include <map>
#include <set>
#include <string>
#include <tuple>
#include <vector>

#include "common/error.h"
#include "common/ports.h"

namespace fakes {

using namespace checker;

// INI files keyed by (file, section, key); names compared as given (tests use one spelling).
class FakeProfile : public ProfilePort {
public:
    std::map<std::tuple<std::string, std::string, std::string>, std::string> values;
    std::vector<std::string> reads; // "file|section|key|buffer"
    std::vector<std::string> writes;

    void set(const std::string& file, const std::string& section, const std::string& key,
             const std::string& value) {
        values[{file, section, key}] = value;
    }
    std::string read(const std::string& file, std::string_view section, std::string_view key,
                     std::string_view defaultValue, std::size_t bufferChars) override {
        reads.push_back(file + "|" + std::string(section) + "|" + std::string(key) + "|" +
                        std::to_string(bufferChars));
        auto it = values.find({file, std::string(section), std::string(key)});
        std::string v = it == values.end() ? std::string(defaultValue) : it->second;
        if (bufferChars == 0) return {};
        if (v.size() > bufferChars - 1) v.resize(bufferChars - 1);
        return v;
    }
    void write(const std::string& file, std::string_view section, std::string_view key,
               std::string_view value) override {
        writes.push_back(file + "|" + std::string(section) + "|" + std::string(key) + "|" +
                         std::string(value));
        values[{file, std::string(section), std::string(key)}] = std::string(value);
    }
};

class FakeFiles : public FilesPort {
public:
    std::set<std::string> plain;    // ordinary files
    std::set<std::string> special;  // hidden/system files and folders: only existsAny may see files
    std::map<std::string, std::string> versions;
    std::vector<std::pair<std::string, std::string>> copies;
    bool copyFails = false;

    bool existsPlain(const std::string& path) override { return plain.count(path) > 0; }
    bool existsAny(const std::string& path) override {
        return plain.count(path) > 0 || special.count(path) > 0;
    }
    void copyReplace(const std::string& from, const std::string& to) override {
        if (copyFails || !plain.count(from))
            throw CheckerError(70, "FileCopy", "Permission denied");
        copies.emplace_back(from, to);
        plain.insert(to);
    }
    std::string fileVersion(const std::string& path) override {
        if (!plain.count(path)) throw CheckerError(53, "GetFileVersion", "File not found");
        auto it = versions.find(path);
        return it == versions.end() ? std::string() : it->second;
    }
};

class FakeProcesses : public ProcessesPort {
public:
    std::vector<ProcessEntry> running;
    std::vector<std::uint32_t> terminated;
    std::vector<std::pair<std::string, int>> started;
    bool startFails = false;

    void start(const std::string& path, int showState) override {
        if (startFails) throw CheckerError(53, "Shell", "File not found");
        started.emplace_back(path, showState);
    }
    std::vector<ProcessEntry> snapshot() override { return running; }
    void terminate(std::uint32_t processId) override { terminated.push_back(processId); }
};

class FakeNetwork : public NetworkPort {
public:
    bool connected = true;
    bool isConnected() override { return connected; }
};

// Scripted HTTP: each request takes the next answer (or error) from the queue.
struct FakeExchange {
    std::string method, url;
};
class FakeHttp : public HttpPort {
public:
    struct Reply {
        std::string body;
        std::optional<CheckerError> error; // thrown by send()
    };
    std::deque<Reply> replies;
    std::vector<FakeExchange> exchanges;
    bool createFails = false;

    std::unique_ptr<HttpRequest> create() override;
};

class FakeRequest : public HttpRequest {
public:
    explicit FakeRequest(FakeHttp& http) : http_(http) {}
    void open(std::string_view method, const std::string& url) override {
        method_ = std::string(method);
        url_ = url;
    }
    void send() override {
        http_.exchanges.push_back({method_, url_});
        if (http_.replies.empty()) throw CheckerError(-2146697208, "", "no scripted reply");
        FakeHttp::Reply r = http_.replies.front();
        http_.replies.pop_front();
        if (r.error) throw *r.error;
        body_ = r.body;
    }
    std::string responseText() override { return body_; }

private:
    FakeHttp& http_;
    std::string method_, url_, body_;
};

inline std::unique_ptr<HttpRequest> FakeHttp::create() {
    if (createFails) throw CheckerError(429, "", "ActiveX component can't create object");
    return std::make_unique<FakeRequest>(*this);
}

// Day-first regional settings with "/" (as on a day-first Windows system), recognising
// d/m/yyyy only; enough to exercise the callers' rules.
class FakeDates : public DatesPort {
public:
    CalendarDate now{2026, 12, 6};
    char separator = '/';

    CalendarDate today() override { return now; }
    std::string shortDateText(const CalendarDate& d) override {
        char buf[32];
        std::snprintf(buf, sizeof buf, "%02d%c%02d%c%04d", d.day, separator, d.month, separator,
                      d.year);
        return buf;
    }
    std::optional<CalendarDate> recognise(std::string_view text) override {
        int d = 0, m = 0, y = 0;
        char s1 = 0, s2 = 0, extra = 0;
        const std::string t(text);
        if (std::sscanf(t.c_str(), "%d%c%d%c%d%c", &d, &s1, &m, &s2, &y, &extra) != 5)
            return std::nullopt;
        if (s1 != separator || s2 != separator || m < 1 || m > 12 || d < 1 || d > 31)
            return std::nullopt;
        return CalendarDate{y, m, d};
    }
    std::string formatMonthDayYear(const CalendarDate& d) override {
        char buf[32];
        std::snprintf(buf, sizeof buf, "%02d%c%02d%c%04d", d.month, separator, d.day, separator,
                      d.year);
        return buf;
    }
};

class FakePump : public MessagePump {
public:
    int runs = 0;
    std::function<void()> onRun; // lets a test run a "message" in the middle of a handler
    void doEvents() override {
        ++runs;
        if (onRun) onRun();
    }
};

} // namespace fakes

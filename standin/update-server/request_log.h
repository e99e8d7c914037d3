// One line per request, "METHOD PATH?QUERY" exactly as received, flushed at once so a test can
// read it while the service runs.
#pragma once

#include <cstdio>
#include <mutex>
#include <string>

namespace updsrv {

class RequestLog {
  public:
    explicit RequestLog(const std::string& path) {
        if (!path.empty()) file_ = std::fopen(path.c_str(), "a");
    }
    RequestLog(const RequestLog&) = delete;
    RequestLog& operator=(const RequestLog&) = delete;
    ~RequestLog() {
        if (file_) std::fclose(file_);
    }
    bool failed(const std::string& path) const { return !path.empty() && !file_; }
    void write(const std::string& method, const std::string& target) {
        if (!file_) return;
        const std::lock_guard<std::mutex> lock(mutex_);
        std::fwrite(method.data(), 1, method.size(), file_);
        std::fputc(' ', file_);
        std::fwrite(target.data(), 1, target.size(), file_);
        std::fputc('\n', file_);
        std::fflush(file_);
    }

  private:
    std::FILE* file_ = nullptr;
    std::mutex mutex_;
};

} // namespace updsrv

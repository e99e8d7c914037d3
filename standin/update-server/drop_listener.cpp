#include "drop_listener.h"

#include <arpa/inet.h>
#include <netinet/in.h>
#include <sys/socket.h>
#include <sys/time.h>
#include <unistd.h>

#include <chrono>
#include <string>
#include <thread>

namespace updsrv {

int bindLoopback(int port, int& boundPort) {
    const int s = ::socket(AF_INET, SOCK_STREAM, 0);
    if (s < 0) return -1;
    const int yes = 1;
    ::setsockopt(s, SOL_SOCKET, SO_REUSEADDR, &yes, sizeof yes);
    sockaddr_in addr{};
    addr.sin_family = AF_INET;
    addr.sin_port = htons(static_cast<std::uint16_t>(port));
    addr.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    socklen_t len = sizeof addr;
    if (::bind(s, reinterpret_cast<sockaddr*>(&addr), sizeof addr) != 0 || ::listen(s, 16) != 0 ||
        ::getsockname(s, reinterpret_cast<sockaddr*>(&addr), &len) != 0) {
        ::close(s);
        return -1;
    }
    boundPort = ntohs(addr.sin_port);
    return s;
}

namespace {

constexpr std::size_t kHeadLimit = 64 * 1024;

void dropOne(int client, RequestLog& log, int delayMs) {
    timeval timeout{5, 0};
    ::setsockopt(client, SOL_SOCKET, SO_RCVTIMEO, &timeout, sizeof timeout);
    std::string head;
    char buffer[4096];
    while (head.find("\r\n\r\n") == std::string::npos && head.size() < kHeadLimit) {
        const ssize_t n = ::recv(client, buffer, sizeof buffer, 0);
        if (n <= 0) break;
        head.append(buffer, static_cast<std::size_t>(n));
    }
    // Request line: METHOD SP TARGET SP VERSION.
    const std::string first = head.substr(0, head.find("\r\n"));
    const auto a = first.find(' ');
    const auto b = first.rfind(' ');
    if (a != std::string::npos && b != std::string::npos && b > a)
        log.write(first.substr(0, a), first.substr(a + 1, b - a - 1));
    if (delayMs > 0) std::this_thread::sleep_for(std::chrono::milliseconds(delayMs));
    ::close(client);
}

} // namespace

void serveDropping(int listener, RequestLog& log, int delayMs) {
    for (;;) {
        const int client = ::accept(listener, nullptr, nullptr);
        if (client < 0) continue;
        std::thread(dropOne, client, std::ref(log), delayMs).detach();
    }
}

} // namespace updsrv

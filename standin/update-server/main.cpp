// update-server: the reference update service (see --help).
#include <httplib.h>

#include <chrono>
#include <cstdio>
#include <stdexcept>
#include <thread>

#include "catalogue.h"
#include "drop_listener.h"
#include "options.h"
#include "request_log.h"

using namespace updsrv;

namespace {

constexpr const char* kCheckPaths[] = {
    R"(/SUPPORT/Downloads/CheckWebUpdate\.asp)",
    R"(/SUPPORT/Downloads/CheckOZProUpdate\.asp)",
    R"(/Support/downloads/UpdateString\.asp)",
    R"(/Support/downloads/OZProUpdateString\.asp)",
};
constexpr const char* kDatePath = "/SUPPORT/Downloads/QVLDATETime.asp";
constexpr const char* kTextPlain = "text/plain";

void announce(int port) {
    std::printf("listening on 127.0.0.1:%d\n", port);
    std::fflush(stdout);
}

void pause(const Options& o) {
    if (o.delayMs > 0) std::this_thread::sleep_for(std::chrono::milliseconds(o.delayMs));
}

std::string param(const httplib::Request& req, const char* key) {
    return req.has_param(key) ? req.get_param_value(key) : std::string();
}

} // namespace

int main(int argc, char** argv) {
    Options o;
    try {
        o = parseOptions(argc, argv);
    } catch (const std::invalid_argument& e) {
        std::fprintf(stderr, "update-server: %s\n%s", e.what(), kUsage);
        return 2;
    }
    if (o.help) {
        std::fputs(kUsage, stdout);
        return 0;
    }
    RequestLog log(o.logFile);
    if (log.failed(o.logFile)) {
        std::fprintf(stderr, "update-server: cannot write %s\n", o.logFile.c_str());
        return 1;
    }

    if (o.drop) {
        int port = 0;
        const int listener = bindLoopback(o.port, port);
        if (listener < 0) {
            std::perror("update-server: bind");
            return 1;
        }
        announce(port);
        serveDropping(listener, log, o.delayMs);
        return 0;
    }

    httplib::Server server;
    // Every request line goes to the log before it is answered. A request line the library
    // refuses (a second "?" in the query, say) never reaches routing; its 400 passes through the
    // error handler instead. The logger runs once at the end of every answer.
    static thread_local bool logged = false;
    server.set_error_handler(
        httplib::Server::HandlerWithResponse([&](const httplib::Request& req, httplib::Response&) {
            if (!logged) log.write(req.method, req.target);
            logged = true;
            return httplib::Server::HandlerResponse::Unhandled;
        }));
    server.set_logger([](const httplib::Request&, const httplib::Response&) { logged = false; });
    server.set_pre_routing_handler([&](const httplib::Request& req, httplib::Response& res) {
        log.write(req.method, req.target);
        logged = true;
        // The date query is a POST without a body and often without a length, which the
        // library's own POST routing refuses with 400; it is answered here, before that.
        if (req.method == "POST" && req.path == kDatePath) {
            pause(o);
            res.status = o.status;
            res.set_header("Connection", "close");
            res.set_content(o.date ? *o.date : todayMonthDayYear(), kTextPlain);
            return httplib::Server::HandlerResponse::Handled;
        }
        return httplib::Server::HandlerResponse::Unhandled;
    });
    for (const char* path : kCheckPaths) {
        server.Get(path, [&](const httplib::Request& req, httplib::Response& res) {
            pause(o);
            const std::string body =
                o.answer ? *o.answer
                         : checkAnswer(o.latest, param(req, "Select"), param(req, "MajorVersion"),
                                       req.has_param("MinorVersion") ? param(req, "MinorVersion")
                                                                     : param(req, "Minorversion"));
            res.status = o.status;
            res.set_content(body, kTextPlain);
        });
    }

    int port = o.port;
    if (port == 0) {
        port = server.bind_to_any_port("127.0.0.1");
    } else if (!server.bind_to_port("127.0.0.1", port)) {
        port = -1;
    }
    if (port < 0) {
        std::fprintf(stderr, "update-server: cannot listen on 127.0.0.1:%d\n", o.port);
        return 1;
    }
    announce(port);
    return server.listen_after_bind() ? 0 : 1;
}

// svcprobe: the update service client, driven from the command line for tests.
//
//   svcprobe check       BASE PROD SUBID MAJOR MINOR CUSTCODE [CDKEY]
//   svcprobe checknew    BASE PROD SUBID CUSTID MAJOR MINOR
//   svcprobe download    BASE PROD SUBID MAJOR MINOR CUSTCODE REPOHEAD CDKEY
//   svcprobe downloadnew BASE PROD SUBID MAJOR MINOR CUSTID REPOHEAD
//   svcprobe raw         BASE QUERY            the check call with QUERY as it stands
//   svcprobe twice       BASE FLAGFILE         a check call, then waits for FLAGFILE to exist
//                                              and makes a customer-id check call
//   svcprobe date        BASE                  the date query
//
// BASE "env" means the address the checker itself would use (CHECKER_UPDATE_SERVER or the
// built-in default). Output, one item a line; texts in brackets with every byte outside
// printable ASCII and every "\" written as \xNN:
//   REQUEST [query]  ADDRESS [address]  ANSWER [text]  UPDATE true|false  DATE [text]
//   ERROR number|source|description
#include <windows.h>

#include <cstdio>
#include <cstdlib>
#include <string>

#include "common/error.h"
#include "common/unique_win32.h"
#include "service/ClsGetUpdate.h"
#include "service/dates_win32.h"
#include "service/system_date.h"
#include "service/xmlhttp_win32.h"

using namespace checker;

namespace {

std::string escaped(const std::string& text) {
    std::string out = "[";
    for (unsigned char c : text) {
        if (c < 0x20 || c >= 0x7f || c == '\\') {
            char hex[8];
            std::snprintf(hex, sizeof hex, "\\x%02X", c);
            out += hex;
        } else {
            out.push_back(static_cast<char>(c));
        }
    }
    return out + "]";
}

void line(const char* tag, const std::string& text) {
    std::printf("%s %s\n", tag, escaped(text).c_str());
    std::fflush(stdout);
}

void error(const CheckerError& e) {
    std::printf("ERROR %d|%s|%s\n", static_cast<int>(e.number()), e.source().c_str(),
                e.description().c_str());
    std::fflush(stdout);
}

std::uint8_t byteArg(const char* text) {
    return static_cast<std::uint8_t>(std::atoi(text));
}
std::int32_t longArg(const char* text) {
    return static_cast<std::int32_t>(std::strtol(text, nullptr, 10));
}

// One call and what it left behind; the update flag for a check answer.
void show(ClsGetUpdate& client, const std::string& request,
          std::string (ClsGetUpdate::*call)(const std::string&), bool isCheck) {
    line("REQUEST", request);
    try {
        const std::string answer = (client.*call)(request);
        line("ANSWER", answer);
        if (isCheck) {
            try {
                std::printf("UPDATE %s\n", client.prValidateCheckInfo(answer) ? "true" : "false");
            } catch (const CheckerError& e) {
                error(e);
            }
        }
    } catch (const CheckerError& e) {
        error(e);
    }
    line("ADDRESS", client.lastAddress());
    line("LASTANSWER", client.lastAnswer());
}

int usage() {
    std::fprintf(stderr,
                 "usage: svcprobe check|checknew|download|downloadnew|raw|twice|date BASE ...\n");
    return 2;
}

} // namespace

int main(int argc, char** argv) {
    if (argc < 3) return usage();
    const std::string command = argv[1];
    const std::string base = std::string(argv[2]) == "env" ? fnUpdateServerAddress() : argv[2];
    const ComApartment apartment;

    if (command == "date") {
        XmlHttpPort http(XmlHttpPort::Creation::ProgId);
        RegionalDatesPort dates;
        line("DATE", GetSystemDate(http, dates, base));
        return 0;
    }

    XmlHttpPort http(XmlHttpPort::Creation::Msxml30Class);
    ClsGetUpdate client(http, base);
    try {
        if (command == "check" && argc >= 8) {
            const std::string cdKey = argc >= 9 ? argv[8] : "";
            show(client,
                 client.fnInputStringCheck(byteArg(argv[3]), argv[4], argv[5], argv[6], argv[7],
                                           cdKey),
                 &ClsGetUpdate::fnGetInfoCheckUpdate, true);
        } else if (command == "checknew" && argc >= 8) {
            show(client,
                 client.fnInputStringCheckNewLicence(byteArg(argv[3]), argv[4], longArg(argv[5]),
                                                     argv[6], argv[7]),
                 &ClsGetUpdate::fnGetInfoCheckUpdateNewLicence, true);
        } else if (command == "download" && argc >= 10) {
            show(client,
                 client.fnInputStringDownLoad(byteArg(argv[3]), argv[4], argv[5], argv[6], argv[7],
                                              argv[8], argv[9]),
                 &ClsGetUpdate::fnGetInfoDownload, false);
        } else if (command == "downloadnew" && argc >= 9) {
            show(client,
                 client.fnInputStringDownLoadNewLicence(byteArg(argv[3]), argv[4], argv[5], argv[6],
                                                        longArg(argv[7]), argv[8]),
                 &ClsGetUpdate::fnGetInfoDownloadNewLicence, false);
        } else if (command == "raw" && argc >= 4) {
            show(client, argv[3], &ClsGetUpdate::fnGetInfoCheckUpdate, true);
        } else if (command == "twice" && argc >= 4) {
            show(client, client.fnInputStringCheck(1, "S", "10.3", "3", "FIRST"),
                 &ClsGetUpdate::fnGetInfoCheckUpdate, true);
            std::printf("WAITING\n");
            std::fflush(stdout);
            for (int i = 0; i < 600 && ::GetFileAttributesA(argv[3]) == INVALID_FILE_ATTRIBUTES;
                 ++i)
                ::Sleep(100);
            show(client, client.fnInputStringCheckNewLicence(1, "S", 77, "10.3", "3"),
                 &ClsGetUpdate::fnGetInfoCheckUpdateNewLicence, true);
        } else {
            return usage();
        }
    } catch (const CheckerError& e) {
        error(e); // a builder's failure, or a request object that could not be made
        return 1;
    }
    return 0;
}

// Service calls, answer reading, file versions and the date query, against scripted ports.
#include <gtest/gtest.h>

#include <cstdlib>
#include <string>
#include <vector>

#include "common/constants.h"
#include "common/text.h"
#include "fakes.h"
#include "service/ClsGetUpdate.h"
#include "service/system_date.h"
#include "service/version_number.h"

using namespace checker;

namespace {

CheckerError refused() {
    return CheckerError(-2146697208, "send", "Connection refused");
}

template <typename Body> CheckerError caught(Body&& body) {
    try {
        body();
    } catch (const CheckerError& e) {
        return e;
    }
    ADD_FAILURE() << "no error";
    return CheckerError(0, "", "");
}

struct Calls : ::testing::Test {
    fakes::FakeHttp http;
    fakes::FakeFiles files;
    ClsGetUpdate client{http, "http://127.0.0.1:8080", &files};
};

} // namespace

TEST_F(Calls, EachOperationGetsItsOwnEndpointWithTheStringUnchanged) {
    for (int i = 0; i < 4; ++i)
        http.replies.push_back({"answer" + std::to_string(i), {}});
    EXPECT_EQ(client.fnGetInfoCheckUpdate("a=1&b=+"), "answer0");
    EXPECT_EQ(client.fnGetInfoCheckUpdateNewLicence(""), "answer1");
    EXPECT_EQ(client.fnGetInfoDownload("x"), "answer2");
    EXPECT_EQ(client.fnGetInfoDownloadNewLicence("y"), "answer3");
    ASSERT_EQ(http.exchanges.size(), 4u);
    EXPECT_EQ(http.exchanges[0].url,
              "http://127.0.0.1:8080/SUPPORT/Downloads/CheckWebUpdate.asp?a=1&b=+");
    EXPECT_EQ(http.exchanges[1].url,
              "http://127.0.0.1:8080/SUPPORT/Downloads/CheckOZProUpdate.asp?");
    EXPECT_EQ(http.exchanges[2].url, "http://127.0.0.1:8080/Support/downloads/UpdateString.asp?x");
    EXPECT_EQ(http.exchanges[3].url,
              "http://127.0.0.1:8080/Support/downloads/OZProUpdateString.asp?y");
    for (const auto& x : http.exchanges)
        EXPECT_EQ(x.method, "GET");
    EXPECT_EQ(client.lastAddress(), http.exchanges[3].url);
    EXPECT_EQ(client.lastAnswer(), "answer3");
}

TEST_F(Calls, FailureCarriesTheLayersNumberAndTextWithTheOperationsName) {
    const char* names[] = {"fnGetInfoCheckUpdate", "fnGetInfoCheckUpdateNewLicence",
                           "fnGetInfoDownload", "fnGetInfoDownloadNewLicence"};
    for (int i = 0; i < 4; ++i) {
        http.replies.push_back({"", refused()});
        const CheckerError e = caught([&] {
            switch (i) {
            case 0:
                client.fnGetInfoCheckUpdate("q");
                break;
            case 1:
                client.fnGetInfoCheckUpdateNewLicence("q");
                break;
            case 2:
                client.fnGetInfoDownload("q");
                break;
            default:
                client.fnGetInfoDownloadNewLicence("q");
                break;
            }
        });
        EXPECT_EQ(e.number(), -2146697208);
        EXPECT_EQ(e.source(), names[i]);
        EXPECT_EQ(e.description(), "Connection refused");
    }
}

TEST_F(Calls, FailedSecondCallKeepsFirstAnswerButTakesItsAddress) {
    http.replies.push_back({"1,10.4,x,True", {}});
    http.replies.push_back({"", refused()});
    EXPECT_EQ(client.fnGetInfoCheckUpdate("first"), "1,10.4,x,True");
    EXPECT_THROW(client.fnGetInfoCheckUpdateNewLicence("second"), CheckerError);
    EXPECT_EQ(client.lastAnswer(), "1,10.4,x,True");
    EXPECT_EQ(client.lastAddress(),
              "http://127.0.0.1:8080/SUPPORT/Downloads/CheckOZProUpdate.asp?second");
    // An empty body is an answer, not an error, and replaces the stored one.
    http.replies.push_back({"", {}});
    EXPECT_EQ(client.fnGetInfoCheckUpdate("third"), "");
    EXPECT_EQ(client.lastAnswer(), "");
}

TEST_F(Calls, RequestObjectThatCannotBeMadeKeepsItsOwnSource) {
    http.createFails = true;
    const CheckerError e = caught([&] { client.fnGetInfoCheckUpdate("q"); });
    EXPECT_EQ(e.number(), 429);
    EXPECT_EQ(e.source(), "");
    EXPECT_TRUE(http.exchanges.empty());
}

TEST(ValidateCheckInfo, FieldThreeIsTheFlag) {
    fakes::FakeHttp http;
    ClsGetUpdate client(http, "");
    EXPECT_TRUE(client.prValidateCheckInfo("a,10.4,b,True"));
    EXPECT_FALSE(client.prValidateCheckInfo("a,10.4,b,False"));
    EXPECT_FALSE(client.prValidateCheckInfo("a,10.4,b,0"));
    EXPECT_TRUE(client.prValidateCheckInfo("a,10.4,b,-1"));
    EXPECT_TRUE(client.prValidateCheckInfo("a,10.4,b,tRUE,more,fields"));
    EXPECT_FALSE(client.prValidateCheckInfo(",,,false"));

    for (const std::string& bad :
         std::vector<std::string>{"", "a,b,c", "no commas at all", std::string("\0\0\0", 3)})
        EXPECT_EQ(caught([&] { client.prValidateCheckInfo(bad); }).number(), 9) << bad;
    for (const std::string& bad : std::vector<std::string>{"a,b,c,", "a,b,c,yes", "a,b,c,True\r\n",
                                                           "a,b,c,1x", std::string("a,b,c,\0", 7)})
        EXPECT_EQ(caught([&] { client.prValidateCheckInfo(bad); }).number(), 13) << bad;
}

TEST(ValidateCheckInfo, LargeAndManyFieldAnswers) {
    fakes::FakeHttp http;
    ClsGetUpdate client(http, "");
    std::string many;
    for (int i = 0; i < 1000; ++i)
        many += (i == 3 ? "1" : "\xe9x") + std::string(i < 999 ? "," : "");
    EXPECT_TRUE(client.prValidateCheckInfo(many));
    const std::string commas(1 << 20, ',');
    EXPECT_EQ(caught([&] { client.prValidateCheckInfo(commas); }).number(), 13);
    std::string huge = "a,b,c,False,";
    huge.append(1 << 20, '\0');
    EXPECT_FALSE(client.prValidateCheckInfo(huge));
}

TEST_F(Calls, ExeVersionSplitsMajorAndLastPart) {
    files.plain = {"C:\\a.exe", "C:\\b.exe", "C:\\none.exe", "C:\\one.exe", "C:\\two.exe"};
    files.versions = {{"C:\\a.exe", "10.3.0.3"},
                      {"C:\\b.exe", "9.0.0.12"},
                      {"C:\\one.exe", "7"},
                      {"C:\\two.exe", "5.6"}};
    std::string major = "old", minor = "old";
    client.prGetExeVersion("C:\\a.exe", major, minor);
    EXPECT_EQ(major + "|" + minor, "10.3|3");
    client.prGetExeVersion("C:\\b.exe", major, minor);
    EXPECT_EQ(major + "|" + minor, "9.0|12");
    client.prGetExeVersion("C:\\two.exe", major, minor);
    EXPECT_EQ(major + "|" + minor, "5.6|6");

    for (const char* f : {"C:\\none.exe", "C:\\one.exe"})
        EXPECT_EQ(caught([&] { client.prGetExeVersion(f, major, minor); }).number(), 9);
    EXPECT_EQ(caught([&] { client.prGetExeVersion("C:\\missing.exe", major, minor); }).number(),
              53);
    EXPECT_EQ(major + "|" + minor, "5.6|6"); // failures leave the texts alone
}

TEST(SystemDate, DateAnswerIsRewrittenOtherAnswersPassUnchanged) {
    fakes::FakeHttp http;
    fakes::FakeDates dates; // day-first, "/"
    http.replies.push_back({"4/12/2026", {}});
    EXPECT_EQ(GetSystemDate(http, dates, "http://h:1"), "12/04/2026");
    ASSERT_EQ(http.exchanges.size(), 1u);
    EXPECT_EQ(http.exchanges[0].method, "POST");
    EXPECT_EQ(http.exchanges[0].url, "http://h:1/SUPPORT/Downloads/QVLDATETime.asp");

    dates.separator = '.';
    http.replies.push_back({"4.12.2026", {}});
    EXPECT_EQ(GetSystemDate(http, dates, ""), "12.04.2026");

    for (const std::string& text : std::vector<std::string>{"", "<html><body>500</body></html>",
                                                            "99/99/2026", std::string("\0", 1)}) {
        http.replies.push_back({text, {}});
        EXPECT_EQ(GetSystemDate(http, dates, ""), text);
    }
}

TEST(SystemDate, FailuresBecomeTheirTwoTexts) {
    fakes::FakeHttp http;
    fakes::FakeDates dates;
    http.replies.push_back({"", CheckerError(-2146697211, "send", "not found")});
    EXPECT_EQ(GetSystemDate(http, dates, ""), "Service provider is unavailable. Please try later");
    http.replies.push_back({"", refused()});
    EXPECT_EQ(GetSystemDate(http, dates, ""), "99999");
    http.createFails = true;
    EXPECT_EQ(GetSystemDate(http, dates, ""), "99999");
}

namespace {
void setServerVariable(const char* value) {
#ifdef _WIN32
    _putenv_s("CHECKER_UPDATE_SERVER", value);
#else
    if (*value)
        setenv("CHECKER_UPDATE_SERVER", value, 1);
    else
        unsetenv("CHECKER_UPDATE_SERVER");
#endif
}
} // namespace

TEST(UpdateServerAddress, EnvironmentWinsOverTheBuiltInDefault) {
    setServerVariable("");
    std::string fallback = CHECKER_UPDATE_SERVER_DEFAULT;
    while (!fallback.empty() && fallback.back() == '/')
        fallback.pop_back();
    EXPECT_EQ(fnUpdateServerAddress(), fallback);
    setServerVariable("http://10.0.0.9:81");
    EXPECT_EQ(fnUpdateServerAddress(), "http://10.0.0.9:81");
    setServerVariable("http://10.0.0.9:81//");
    EXPECT_EQ(fnUpdateServerAddress(), "http://10.0.0.9:81");
    setServerVariable("");
}

// Random answers built from the characters that matter to the readers: the outcome follows
// from the field count and field 3 alone, and nothing else escapes.
TEST(ValidateCheckInfo, RandomAnswersGiveTheFlagOrErrorsNineAndThirteen) {
    fakes::FakeHttp http;
    ClsGetUpdate client(http, "");
    const std::string alphabet = std::string(",,,01-+.eE&HhTRUEtrue \t\n\xe9", 26) + '\0';
    std::uint32_t seed = 12345;
    auto next = [&] { return seed = seed * 1103515245u + 12345u, (seed >> 16) & 0x7fff; };
    for (int i = 0; i < 3000; ++i) {
        std::string answer;
        const std::size_t length = next() % 40;
        for (std::size_t k = 0; k < length; ++k)
            answer.push_back(alphabet[next() % alphabet.size()]);
        const std::vector<std::string> fields = splitFields(answer, ',');
        try {
            const bool flag = client.prValidateCheckInfo(answer);
            ASSERT_GE(fields.size(), 4u) << answer;
            ASSERT_EQ(fnTruthValue(fields[3]), flag) << answer;
        } catch (const CheckerError& e) {
            if (fields.size() < 4)
                ASSERT_EQ(e.number(), 9) << answer;
            else
                ASSERT_EQ(e.number(), 13) << answer;
            ASSERT_EQ(e.source(), "prValidateCheckInfo");
        }
    }
}

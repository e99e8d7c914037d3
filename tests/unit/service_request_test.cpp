// Request strings: the four builders' field order, the blank rule, the report-heading rule,
// numbers, and hostile values.
#include <gtest/gtest.h>

#include <string>

#include "fakes.h"
#include "service/ClsGetUpdate.h"

using namespace checker;

namespace {

struct Builders : ::testing::Test {
    fakes::FakeHttp http;
    ClsGetUpdate client{http, "http://svc"};
};

} // namespace

TEST_F(Builders, WorkedExamplesByteForByte) {
    EXPECT_EQ(client.fnInputStringCheck(1, "S", "10.3", "3", "K 100", ""),
              "Select=1&txtCDKey=&MajorVersion=10.3&CustCode=K+100&ProdSubId=S&MinorVersion=3");
    EXPECT_EQ(client.fnInputStringCheckNewLicence(1, "S", 1234, "10.3", "3"),
              "Select=1&CustID=1234&MajorVersion=10.3&ProdSubId=S&MinorVersion=3");
    EXPECT_EQ(client.fnInputStringDownLoad(1, "S", "10.3", "3", "K 100", "Plans & Advice", ""),
              "Select=1&Setuptype=S&ReportHead=Plans+&+Advice&txtCDKey=&MajorVersion=10.3"
              "&UserType=Desktop&CustCode=K+100&Minorversion=3");
    EXPECT_EQ(client.fnInputStringDownLoadNewLicence(1, "S", "10.3", "3", 1234, "Plans & Advice"),
              "Select=1&Setuptype=S&ReportHead=Plans+~~+Advice&MajorVersion=10.3&CustID=1234"
              "&Minorversion=3");
    // Builders only build: nothing went out.
    EXPECT_TRUE(http.exchanges.empty());
}

TEST_F(Builders, EmptyValuesAndOmittedCDKey) {
    EXPECT_EQ(client.fnInputStringCheck(1, "S", "", "", ""),
              "Select=1&txtCDKey=&MajorVersion=&CustCode=&ProdSubId=S&MinorVersion=");
    EXPECT_EQ(client.fnInputStringCheck(4, "S", "9.0", "12", "C1"),
              client.fnInputStringCheck(4, "S", "9.0", "12", "C1", ""));
    EXPECT_EQ(client.fnInputStringDownLoadNewLicence(1, "", "", "", 0, ""),
              "Select=1&Setuptype=&ReportHead=&MajorVersion=&CustID=0&Minorversion=");
}

TEST_F(Builders, BlanksBecomePlusEverywhereOtherCharactersUnchanged) {
    EXPECT_EQ(client.fnInputStringCheck(1, "N", " 10.3 ", "3  ", "  A&B=C%#+", "K Y"),
              "Select=1&txtCDKey=K+Y&MajorVersion=+10.3+&CustCode=++A&B=C%#+&ProdSubId=N"
              "&MinorVersion=3++");
    // "&" stays in the customer-code download's heading, becomes "~~" only in the customer-id one.
    EXPECT_EQ(client.fnInputStringDownLoad(1, "S", "1", "2", "c", "&&", "k"),
              "Select=1&Setuptype=S&ReportHead=&&&txtCDKey=k&MajorVersion=1&UserType=Desktop"
              "&CustCode=c&Minorversion=2");
    EXPECT_EQ(client.fnInputStringDownLoadNewLicence(1, "S", "a&b", "2", 5, "&&x & y"),
              "Select=1&Setuptype=S&ReportHead=~~~~x+~~+y&MajorVersion=a&b&CustID=5"
              "&Minorversion=2");
    // Tabs are not blanks.
    EXPECT_EQ(client.fnInputStringCheckNewLicence(1, "S\t", 1, "", ""),
              "Select=1&CustID=1&MajorVersion=&ProdSubId=S\t&MinorVersion=");
}

TEST_F(Builders, NumbersInPlainDecimal) {
    EXPECT_EQ(client.fnInputStringCheckNewLicence(0, "S", -1, "", ""),
              "Select=0&CustID=-1&MajorVersion=&ProdSubId=S&MinorVersion=");
    EXPECT_EQ(client.fnInputStringCheckNewLicence(255, "S", INT32_MIN, "", "").substr(0, 32),
              "Select=255&CustID=-2147483648&Ma");
    EXPECT_EQ(client.fnInputStringDownLoadNewLicence(255, "S", "", "", INT32_MAX, ""),
              "Select=255&Setuptype=S&ReportHead=&MajorVersion=&CustID=2147483647&Minorversion=");
}

TEST_F(Builders, EveryPrintableCharacterAndLongValuesComeThroughWhole) {
    std::string printable;
    for (char c = ' '; c <= '~'; ++c)
        printable.push_back(c);
    std::string expected = printable;
    expected[0] = '+';
    const std::string check =
        client.fnInputStringCheck(1, "S", printable, printable, printable, printable);
    EXPECT_EQ(check, "Select=1&txtCDKey=" + expected + "&MajorVersion=" + expected +
                         "&CustCode=" + expected + "&ProdSubId=S&MinorVersion=" + expected);

    // Control characters, NULs and non-ASCII bytes are copied as they are.
    const std::string odd("\x01\x00\xff\xe9 \x7f", 6);
    const std::string down = client.fnInputStringDownLoad(1, odd, odd, odd, odd, odd, odd);
    EXPECT_EQ(down.size(), std::string("Select=1&Setuptype=&ReportHead=&txtCDKey=&MajorVersion="
                                       "&UserType=Desktop&CustCode=&Minorversion=")
                                   .size() +
                               6 * odd.size());
    EXPECT_EQ(down.find(' '), std::string::npos);

    const std::string big(1 << 20, ' ');
    const std::string huge = client.fnInputStringDownLoadNewLicence(1, "S", "", "", 1, big + "&");
    EXPECT_EQ(huge.size(), std::string("Select=1&Setuptype=S&ReportHead=&MajorVersion=&CustID=1"
                                       "&Minorversion=")
                                   .size() +
                               big.size() + 2);
    EXPECT_EQ(huge.find(' '), std::string::npos);
}

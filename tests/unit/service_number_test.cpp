// The number rule for version texts and the truth value of an answer field.
#include <gtest/gtest.h>

#include <cmath>
#include <string>
#include <vector>

#include "service/version_number.h"

using checker::fnTruthValue;
using checker::fnVersionValue;

TEST(VersionValue, ComparisonTable) {
    EXPECT_EQ(fnVersionValue("10.10"), fnVersionValue("10.1"));
    EXPECT_LT(fnVersionValue("10.10"), fnVersionValue("10.9"));
    EXPECT_LT(fnVersionValue("10.1"), fnVersionValue("10.9"));
    EXPECT_EQ(fnVersionValue("10.3"), fnVersionValue("10.30"));
    EXPECT_EQ(fnVersionValue(""), 0.0);
    EXPECT_EQ(fnVersionValue(std::string("\0\0\0", 3)), 0.0);
    EXPECT_EQ(fnVersionValue("10.3 "), 10.3);
    EXPECT_EQ(fnVersionValue("&H1F"), 31.0);
}

TEST(VersionValue, LeadingNumberRule) {
    EXPECT_EQ(fnVersionValue(" 1 0 .\t3\n"), 10.3); // blanks, tabs, line feeds anywhere
    EXPECT_EQ(fnVersionValue("10.3.0.3"), 10.3);    // a second "." stops
    EXPECT_EQ(fnVersionValue("10.3abc"), 10.3);
    EXPECT_EQ(fnVersionValue(std::string("10\0.5", 5)), 10.0);
    EXPECT_EQ(fnVersionValue("10,5"), 10.0); // "." whatever the regional settings
    EXPECT_EQ(fnVersionValue("-2.5"), -2.5);
    EXPECT_EQ(fnVersionValue("+7"), 7.0);
    EXPECT_EQ(fnVersionValue("- 7"), -7.0);
    EXPECT_EQ(fnVersionValue(".5"), 0.5);
    EXPECT_EQ(fnVersionValue("5."), 5.0);
    EXPECT_EQ(fnVersionValue("1E3"), 1000.0);
    EXPECT_EQ(fnVersionValue("1.5d2"), 150.0);
    EXPECT_EQ(fnVersionValue("2E-1"), 0.2);
    EXPECT_EQ(fnVersionValue("3E"), 3.0);
    EXPECT_EQ(fnVersionValue("3E+x"), 3.0);
    EXPECT_EQ(fnVersionValue("&o17"), 15.0);
    EXPECT_EQ(fnVersionValue("&h ff"), 255.0);
    EXPECT_EQ(fnVersionValue("&O9"), 0.0);
    EXPECT_EQ(fnVersionValue("&X1"), 0.0);
    EXPECT_EQ(fnVersionValue("&"), 0.0);
    EXPECT_EQ(fnVersionValue("abc"), 0.0);
    EXPECT_EQ(fnVersionValue("-"), 0.0);
    EXPECT_EQ(fnVersionValue("."), 0.0);
    EXPECT_FALSE(std::signbit(fnVersionValue("-0")));
}

TEST(VersionValue, ExtremeTextsStayFiniteOrSaturate) {
    EXPECT_TRUE(std::isinf(fnVersionValue("1E999999999999999999")));
    EXPECT_EQ(fnVersionValue("1E-999999999999"), 0.0);
    // A million digits scaled back by a matching exponent.
    EXPECT_DOUBLE_EQ(fnVersionValue(std::string(1 << 20, '9') + "E-1048570"), 1e6);
    EXPECT_EQ(fnVersionValue(std::string(1 << 20, ' ') + "4"), 4.0);
    EXPECT_EQ(fnVersionValue("0." + std::string(1 << 20, '0') + "1"), 0.0);
}

TEST(TruthValue, WordsInAnyCaseOrNumbers) {
    EXPECT_EQ(fnTruthValue("True"), true);
    EXPECT_EQ(fnTruthValue("tRuE"), true);
    EXPECT_EQ(fnTruthValue("FALSE"), false);
    EXPECT_EQ(fnTruthValue(" 1 "), true);
    EXPECT_EQ(fnTruthValue("0"), false);
    EXPECT_EQ(fnTruthValue("0.0"), false);
    EXPECT_EQ(fnTruthValue("-1"), true);
    EXPECT_EQ(fnTruthValue("2.5E1"), true);
    EXPECT_EQ(fnTruthValue("&H0"), false);
    EXPECT_EQ(fnTruthValue("&HA"), true);

    for (const std::string& bad :
         std::vector<std::string>{"", " ", " True", "False ", "Yes", "Truee", "1x", "1 2", "1.2.3",
                                  "&H", "+", ".", "True\r\n", "1\t", std::string("1\0", 2)})
        EXPECT_FALSE(fnTruthValue(bad).has_value()) << "[" << bad << "]";
}

// The customer id derivation, the password and connection texts, and the installed-version split.
#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <string>

#include "common/error.h"
#include "startup/customer_id.h"
#include "startup/host_database.h"

using namespace checker;

namespace {
std::int32_t errorNumberOf(std::string_view text) {
    try {
        fnDeriveCustID(text);
    } catch (const CheckerError& e) {
        return e.number();
    }
    return -1;
}
} // namespace

TEST(PlatformNumber, AcceptsBlanksSignPointAndExponentOnly) {
    EXPECT_EQ(*fnPlatformNumber(" 4711 "), 4711.0);
    EXPECT_EQ(*fnPlatformNumber("-12"), -12.0);
    EXPECT_EQ(*fnPlatformNumber("+.5"), 0.5);
    EXPECT_EQ(*fnPlatformNumber("5."), 5.0);
    EXPECT_EQ(*fnPlatformNumber("1.5E3"), 1500.0);
    EXPECT_EQ(*fnPlatformNumber("2e-1"), 0.2);
    for (const char* bad : {"", "   ", ".", "-", "1e", "1e+", "0x10", "inf", "nan", "1,000", "1 2",
                            "\t5", "12a", "--1", "1..2", "e5"})
        EXPECT_FALSE(fnPlatformNumber(bad)) << bad;
    EXPECT_FALSE(fnPlatformNumber(std::string("5\0", 2)));
    EXPECT_TRUE(std::isinf(*fnPlatformNumber("1e400"))); // a number, too large for anything
}

TEST(ToLong32, RoundsHalvesToEvenAndReportsOverflow) {
    EXPECT_EQ(fnToLong32(2.5, "t"), 2);
    EXPECT_EQ(fnToLong32(3.5, "t"), 4);
    EXPECT_EQ(fnToLong32(-2.5, "t"), -2);
    EXPECT_EQ(fnToLong32(-3.5, "t"), -4);
    EXPECT_EQ(fnToLong32(2.4999, "t"), 2);
    EXPECT_EQ(fnToLong32(2.5001, "t"), 3);
    EXPECT_EQ(fnToLong32(2147483647.0, "t"), std::numeric_limits<std::int32_t>::max());
    EXPECT_EQ(fnToLong32(-2147483648.5, "t"), std::numeric_limits<std::int32_t>::min());
    EXPECT_THROW(fnToLong32(2147483647.5, "t"), CheckerError); // rounds up to 2^31
    EXPECT_THROW(fnToLong32(-2147483649.0, "t"), CheckerError);
    EXPECT_THROW(fnToLong32(std::numeric_limits<double>::infinity(), "t"), CheckerError);
}

TEST(CustomerId, NumbersConvertAsTheyStand) {
    EXPECT_EQ(fnDeriveCustID("4711"), 4711);
    EXPECT_EQ(fnDeriveCustID(" 4711 "), 4711);
    EXPECT_EQ(fnDeriveCustID("4711.5"), 4712);
    EXPECT_EQ(fnDeriveCustID("4712.5"), 4712);
    EXPECT_EQ(fnDeriveCustID("-7"), -7);
    EXPECT_EQ(fnDeriveCustID("2147483647"), 2147483647);
    EXPECT_EQ(errorNumberOf("2147483648"), kErrOverflow);
    EXPECT_EQ(errorNumberOf("1e400"), kErrOverflow);
}

TEST(CustomerId, OtherTextsTakeTheFirstCodeAndTheLastFiveCharacters) {
    EXPECT_EQ(fnDeriveCustID("X-10042"), 8810042);
    EXPECT_EQ(fnDeriveCustID("CUST-000-12345"), 6712345);
    EXPECT_EQ(fnDeriveCustID(".e5"), 4600000);         // five characters or fewer: "46" + ".e5"
    EXPECT_EQ(fnDeriveCustID("\xE9-00001"), 23300001); // ANSI code above 127 stays positive
    EXPECT_EQ(fnDeriveCustID("ID:00002.5"), 73002);    // "73002.5", half to even
}

TEST(CustomerId, TextsThatStayNoNumberAreErrorsNotIdentities) {
    EXPECT_EQ(errorNumberOf("AB"), kErrTypeMismatchNumber);       // "65AB"
    EXPECT_EQ(errorNumberOf("ABC 12.5"), kErrTypeMismatchNumber); // "65 12.5": inner blank
    EXPECT_EQ(errorNumberOf(std::string{'A', '\0', '1', '2'}), kErrTypeMismatchNumber);
    EXPECT_EQ(errorNumberOf(std::string{'7', '\0'}), kErrTypeMismatchNumber); // "557\0"
    EXPECT_EQ(errorNumberOf(""), 5);
    EXPECT_EQ(errorNumberOf("X.1e99"), kErrOverflow); // "88.1e99"
    // Blanks only: code 32 followed by blanks, which the number rule allows around a number.
    EXPECT_EQ(fnDeriveCustID("   "), 32);
    EXPECT_EQ(errorNumberOf(std::string(255, 'x')), kErrTypeMismatchNumber);
}

TEST(HostDatabaseTexts, PasswordIsTheFirstTildeField) {
    EXPECT_EQ(fnPasswordFromPlan("pw~a~b"), "pw");
    EXPECT_EQ(fnPasswordFromPlan("whole"), "whole");
    EXPECT_EQ(fnPasswordFromPlan("~x"), "");
    try {
        fnPasswordFromPlan("");
        FAIL() << "empty text has no first field";
    } catch (const CheckerError& e) {
        EXPECT_EQ(e.number(), kErrSubscriptOutOfRange);
    }
}

TEST(HostDatabaseTexts, ConnectionFilterAndFindTexts) {
    EXPECT_EQ(fnConnectionString("C:\\a\\data\\Ozp.ACCDB", "p;w"),
              "Provider=Microsoft.ACE.OLEDB.12.0;Data Source=C:\\a\\data\\Ozp.ACCDB;"
              "Persist Security Info=False;Jet OLEDB:Database Password=p;w");
    EXPECT_EQ(fnPlanFilter(999), "Plan = 999");
    EXPECT_EQ(fnPlanFilter(89), "Plan = 89");
    EXPECT_EQ(fnPlanFind(14), "plan = 14");
}

TEST(InstalledVersion, MajorIsFirstTwoPartsMinorIsTheLast) {
    CustomerRecord r;
    EXPECT_TRUE(fnApplyInstalledVersion("10.3.0.3", r));
    EXPECT_EQ(r.strMajorVersion, "10.3");
    EXPECT_EQ(r.strMinorVersion, "3");
    EXPECT_TRUE(fnApplyInstalledVersion("7.1", r));
    EXPECT_EQ(r.strMajorVersion, "7.1");
    EXPECT_EQ(r.strMinorVersion, "1");
    CustomerRecord untouched;
    EXPECT_FALSE(fnApplyInstalledVersion("", untouched)); // the silent end
    EXPECT_TRUE(untouched.strMajorVersion.empty());
    EXPECT_THROW(fnApplyInstalledVersion("7", untouched), CheckerError);
}

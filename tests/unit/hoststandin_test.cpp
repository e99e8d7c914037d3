// The host stand-ins' portable parts: the cipher the host and hostkit share, and the database
// file and query texts the ADO stand-in reads. A fault here would make the end-to-end tests
// prove the wrong thing.
#include <gtest/gtest.h>

#include "host_cipher.h"
#include "host_secrets.h"
#include "standin_db.h"

using namespace hoststandin;

TEST(HostCipher, RoundTripsEveryByteAndRefusesWhatIsNotCiphertext) {
    std::string all;
    for (int i = 0; i < 256; ++i)
        all.push_back(static_cast<char>(i));
    EXPECT_EQ(*decipher(encipher(all, kSecretKey), kSecretKey), all);
    EXPECT_EQ(*decipher("", kSecretKey), "");
    EXPECT_NE(encipher("4711", kSecretKey), toHex("4711")); // really enciphered
    EXPECT_NE(*decipher(encipher("4711", kSecretKey), "another"), "4711");
    EXPECT_FALSE(decipher("ABC", kSecretKey));   // odd length
    EXPECT_FALSE(decipher(" 4711", kSecretKey)); // blanks are not hex digits
    EXPECT_FALSE(decipher("GG", kSecretKey));
}

TEST(StandInDatabase, RoundTripsTablesNullsAndAnyText) {
    Database db;
    db.password = "p w~;";
    db.tables.push_back({"PlanIDs", {"Plan", "Settings"}, {}});
    db.tables[0].rows.push_back({Cell(999), Cell(Null{})});
    db.tables[0].rows.push_back({Cell(-14), Cell(std::string("a\0\n b", 5))});
    const auto back = parse(serialize(db));
    ASSERT_TRUE(back);
    EXPECT_EQ(back->password, db.password);
    ASSERT_EQ(back->tables.size(), 1u);
    EXPECT_EQ(back->tables[0].columns, db.tables[0].columns);
    EXPECT_EQ(back->tables[0].rows, db.tables[0].rows);
}

TEST(StandInDatabase, RefusesEmptyTruncatedAndDamagedFiles) {
    Database db;
    db.tables.push_back({"PlanIDs", {"Plan", "Settings"}, {{Cell(1), Cell(std::string("x"))}}});
    const std::string good = serialize(db);
    ASSERT_TRUE(parse(good));
    EXPECT_FALSE(parse(""));
    for (std::size_t cut = 0; cut + 1 < good.size(); cut += 7)
        EXPECT_FALSE(parse(good.substr(0, cut))) << cut; // every shorter file
    std::string cell = good;
    cell.replace(cell.find("I1"), 2, "I1x");
    EXPECT_FALSE(parse(cell));
    std::string extra = good + "row I2 N\n";
    EXPECT_FALSE(parse(extra));
    std::string wide = good;
    wide.replace(wide.find("row I1"), 6, "row I1 N");
    EXPECT_FALSE(parse(wide)); // more cells than columns
}

TEST(StandInQueries, SelectAndConditionsAsTheCheckerWritesThem) {
    auto all = parseSelect("Select * from PlanIDs ");
    ASSERT_TRUE(all);
    EXPECT_TRUE(all->columns.empty());
    EXPECT_EQ(all->table, "PlanIDs");
    auto two = parseSelect("Select settings,plan from planids");
    ASSERT_TRUE(two);
    EXPECT_EQ(two->columns, (std::vector<std::string>{"settings", "plan"}));
    EXPECT_FALSE(parseSelect("Select from PlanIDs"));
    EXPECT_FALSE(parseSelect("Delete * from PlanIDs"));

    auto c = parseCondition("plan = 14");
    ASSERT_TRUE(c);
    EXPECT_EQ(c->column, "plan");
    EXPECT_TRUE(matches(Cell(14), c->value));
    EXPECT_FALSE(matches(Cell(140), c->value));
    EXPECT_FALSE(matches(Cell(Null{}), c->value));
    EXPECT_FALSE(parseCondition("Plan = 14x"));
    EXPECT_FALSE(parseCondition("Plan 14"));
    EXPECT_EQ(*findColumn({"Plan", "Settings"}, "SETTINGS"), 1u);

    const std::string cs = "Provider=Microsoft.ACE.OLEDB.12.0;Data Source=C:\\a b\\x.accdb;"
                           "Persist Security Info=False;Jet OLEDB:Database Password=pw";
    EXPECT_EQ(*connectionValue(cs, "data source"), "C:\\a b\\x.accdb");
    EXPECT_EQ(*connectionValue(cs, "Jet OLEDB:Database Password"), "pw");
    EXPECT_FALSE(connectionValue(cs, "User ID"));
}

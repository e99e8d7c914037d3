// The two PlanIDs reads of start-up against an in-memory table: which rows are read, when the
// customer row is left alone, nulls, missing rows, and the installed version.
#include <gtest/gtest.h>

#include <map>

#include "common/error.h"
#include "fakes.h"
#include "startup/host_database.h"

using namespace checker;

namespace {

using Rows = std::vector<std::pair<int, std::optional<std::string>>>; // Plan, stored Settings

// Plain form: the stored text with a "enc:" prefix removed; anything else is refused.
struct FakeHostDatabase : HostDatabasePort {
    Rows rows;
    std::vector<std::string> calls;

    struct Recordset : PlanRecordset {
        FakeHostDatabase& db;
        std::vector<std::size_t> view;
        std::size_t cursor = 0;
        bool open = true;
        explicit Recordset(FakeHostDatabase& d) : db(d) { showAll(); }
        void showAll() {
            view.clear();
            for (std::size_t i = 0; i < db.rows.size(); ++i)
                view.push_back(i);
            cursor = 0;
        }
        int planIn(const std::string& criteria) {
            return std::stoi(criteria.substr(criteria.find('=') + 1));
        }
        void clearFilter() override {
            db.calls.push_back("clearFilter");
            showAll();
        }
        void filter(const std::string& criteria) override {
            db.calls.push_back("filter " + criteria);
            std::vector<std::size_t> kept;
            for (std::size_t i : view)
                if (db.rows[i].first == planIn(criteria)) kept.push_back(i);
            view = kept;
            cursor = 0;
        }
        bool eof() override { return cursor >= view.size(); }
        std::optional<std::string> current() {
            if (eof()) throw CheckerError(3021, "ADODB.Field", "Either BOF or EOF is True");
            return db.rows[view[cursor]].second;
        }
        std::optional<std::string> field(std::string_view column) override {
            db.calls.push_back("field " + std::string(column));
            return current();
        }
        std::optional<std::string> firstField() override {
            db.calls.push_back("firstField");
            return current();
        }
        void findFirst(const std::string& criteria) override {
            db.calls.push_back("find " + criteria);
            for (cursor = 0; cursor < view.size(); ++cursor)
                if (db.rows[view[cursor]].first == planIn(criteria)) return;
        }
        bool isOpen() override { return open; }
        void close() override {
            db.calls.push_back("close");
            open = false;
        }
    };

    std::unique_ptr<PlanRecordset> open(std::string_view sql) override {
        calls.push_back("open " + std::string(sql));
        return std::make_unique<Recordset>(*this);
    }
    std::string plainSettings(const std::string& stored) override {
        calls.push_back("plain " + stored);
        if (stored.rfind("enc:", 0) != 0)
            throw CheckerError(5, "DecryptURL", "Not an enciphered text");
        return stored.substr(4);
    }
};

std::int32_t errorOf(const std::function<void()>& f) {
    try {
        f();
    } catch (const CheckerError& e) {
        return e.number();
    }
    return 0;
}

HostProfile standAlone() {
    HostProfile p;
    p.lngInstallType = 1;
    p.bytCustPlan = 14;
    return p;
}

} // namespace

TEST(SettingsRead, RowWithCustomerIdFlagReadsTheCustomerRow) {
    FakeHostDatabase db;
    db.rows = {{1, "enc:x"}, {89, "enc:OTHER"}, {999, "enc:1"}, {14, "enc:X-10042"}};
    CustomerRecord r;
    fnReadSettings(db, 14, r);
    EXPECT_TRUE(r.blnUseCustID);
    EXPECT_EQ(r.lngCustID, 8810042);
    EXPECT_EQ(db.calls, (std::vector<std::string>{"open Select * from PlanIDs ", "clearFilter",
                                                  "filter Plan = 999", "field Settings",
                                                  "clearFilter", "filter Plan = 14",
                                                  "field Settings", "plain enc:X-10042", "close"}));
}

TEST(SettingsRead, NoFlagRowOrANullOneLeavesTheCustomerRowAlone) {
    for (const Rows& rows : {Rows{{14, "enc:4711"}}, Rows{{999, std::nullopt}, {14, "enc:4711"}}}) {
        FakeHostDatabase db;
        db.rows = rows;
        CustomerRecord r;
        fnReadSettings(db, 14, r);
        EXPECT_FALSE(r.blnUseCustID);
        EXPECT_EQ(r.lngCustID, 0);
        for (const auto& call : db.calls)
            EXPECT_EQ(call.find("14"), std::string::npos) << call;
        EXPECT_EQ(db.calls.back(), "close");
    }
}

TEST(SettingsRead, MissingOrNullCustomerRowIsAnError) {
    FakeHostDatabase missing;
    missing.rows = {{999, "enc:1"}, {89, "enc:4711"}};
    CustomerRecord r;
    EXPECT_EQ(errorOf([&] { fnReadSettings(missing, 14, r); }), 3021);
    FakeHostDatabase null;
    null.rows = {{999, "enc:1"}, {14, std::nullopt}};
    EXPECT_EQ(errorOf([&] { fnReadSettings(null, 14, r); }), 94);
    FakeHostDatabase notANumber;
    notANumber.rows = {{999, "enc:1"}, {14, "enc:AB"}};
    EXPECT_EQ(errorOf([&] { fnReadSettings(notANumber, 14, r); }), kErrTypeMismatchNumber);
}

TEST(GetVersion, VersionThenTheTrimmedStoredCustomerTextInPlainForm) {
    fakes::FakeFiles files;
    files.plain.insert("C:\\app\\OZPLICNew.EXE");
    files.versions["C:\\app\\OZPLICNew.EXE"] = "10.3.0.3";
    FakeHostDatabase db;
    db.rows = {{14, "  enc: C-7  "}, {89, "enc:other"}};
    CustomerRecord r;
    ASSERT_TRUE(fnGetVersion(files, db, standAlone(), "C:\\app", r));
    EXPECT_EQ(r.strMajorVersion, "10.3");
    EXPECT_EQ(r.strMinorVersion, "3");
    EXPECT_EQ(r.strCustCode, " C-7"); // the plain text itself is not trimmed
    EXPECT_EQ(db.calls,
              (std::vector<std::string>{"open Select settings,plan from planids", "find plan = 14",
                                        "firstField", "plain enc: C-7", "close"}));
}

TEST(GetVersion, SecondProductUsesItsOwnExecutableAndRow) {
    fakes::FakeFiles files;
    files.plain.insert("C:\\app\\OrvelDo.EXE");
    files.versions["C:\\app\\OrvelDo.EXE"] = "2.1.5.9";
    FakeHostDatabase db;
    db.rows = {{14, "enc:main"}, {89, "enc:second"}};
    HostProfile p;
    p.lngInstallType = 4;
    p.bytCustPlan = 89;
    CustomerRecord r;
    ASSERT_TRUE(fnGetVersion(files, db, p, "C:\\app", r));
    EXPECT_EQ(r.strMajorVersion, "2.1");
    EXPECT_EQ(r.strMinorVersion, "9");
    EXPECT_EQ(r.strCustCode, "second");
}

TEST(GetVersion, NoVersionEndsBeforeTheDatabaseAndBadVersionsAreErrors) {
    fakes::FakeFiles files;
    files.plain.insert("C:\\app\\OZPLICNew.EXE"); // present, no version
    FakeHostDatabase db;
    db.rows = {{14, "enc:4711"}};
    CustomerRecord r;
    EXPECT_FALSE(fnGetVersion(files, db, standAlone(), "C:\\app", r));
    EXPECT_TRUE(db.calls.empty());
    files.versions["C:\\app\\OZPLICNew.EXE"] = "7"; // one part: no second part
    EXPECT_EQ(errorOf([&] { fnGetVersion(files, db, standAlone(), "C:\\app", r); }),
              kErrSubscriptOutOfRange);
    fakes::FakeFiles none;
    EXPECT_EQ(errorOf([&] { fnGetVersion(none, db, standAlone(), "C:\\app", r); }), 53);
    db.rows = {{14, std::nullopt}};
    files.versions["C:\\app\\OZPLICNew.EXE"] = "1.2.3.4";
    EXPECT_EQ(errorOf([&] { fnGetVersion(files, db, standAlone(), "C:\\app", r); }), 94);
    db.rows = {{89, "enc:x"}};
    EXPECT_EQ(errorOf([&] { fnGetVersion(files, db, standAlone(), "C:\\app", r); }), 3021);
}

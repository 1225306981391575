// Operations and transactions: record order, kinds, rollback, misuse.

#include <sqlite3.h>

#include <gtest/gtest.h>

#include "FailureOf.h"
#include "HostTestRecords.h"
#include "TempHost.h"
#include "trellis/host/ExecLog.h"
#include "trellis/host/records/FirewallRecords.h"
#include "trellis/host/records/SwitchRecords.h"

using namespace Trellis::Host;

namespace {

const Operation kWrite("HostTest::Write");
const Operation kRead("HostTest::Read");

std::vector<std::string> CounterNames() {
    return kRead.Read([](Transaction& t) { return t.Names<CounterRecord>(); });
}

PortGroupRecord GroupOn(const std::string& vswitch, const std::string& name) {
    PortGroupRecord group;
    group.name = name;
    group.vswitch = vswitch;
    return group;
}

struct Unrelated {
    int code;
};

}  // namespace

TEST(HostTransaction, RecordsKeepTheirPlaceAndKindsStaySeparate) {
    TempHost host;
    kWrite.Write([](Transaction& t) {
        for (const char* name : {"a", "b", "c"}) t.Put(CounterRecord{name, 1});
        // The same name in another kind is another record.
        FirewallRulesetRecord ruleset;
        ruleset.name = "b";
        t.Put(ruleset);
    });
    kWrite.Write([](Transaction& t) { t.Put(CounterRecord{"b", 2}); });  // replaced in place
    EXPECT_EQ(CounterNames(), (std::vector<std::string>{"a", "b", "c"}));
    EXPECT_EQ(CounterValue("b"), 2);

    EXPECT_TRUE(kWrite.Write([](Transaction& t) { return t.Erase<CounterRecord>("b"); }));
    EXPECT_FALSE(kWrite.Write([](Transaction& t) { return t.Erase<CounterRecord>("b"); }));
    kWrite.Write([](Transaction& t) { t.Put(CounterRecord{"b", 3}); });  // a new record goes last
    EXPECT_EQ(CounterNames(), (std::vector<std::string>{"a", "c", "b"}));
    kRead.Read([](Transaction& t) {
        EXPECT_TRUE(t.Contains<FirewallRulesetRecord>("b"));
        EXPECT_FALSE(t.Contains<FirewallRulesetRecord>("a"));
        EXPECT_EQ(t.Count<FirewallRulesetRecord>(), DefaultRulesetNames().size() + 1);
        try {
            t.Require<CounterRecord>("zz");
            ADD_FAILURE() << "found";
        } catch (const Gantry::Lib::GantryException& e) {
            EXPECT_STREQ(e.what(), "No test.counter \"zz\" on the host");
        }
    });
}

TEST(HostTransaction, ChildrenFollowTheirParentThroughPutAndErase) {
    TempHost host;
    auto childrenOf = [](const char* parent) {
        return kRead.Read([&](Transaction& t) {
            std::vector<std::string> names;
            for (const PortGroupRecord& child : t.ChildrenOf<PortGroupRecord>(parent)) names.push_back(child.name);
            EXPECT_EQ(t.CountChildrenOf<PortGroupRecord>(parent), names.size());
            return names;
        });
    };
    kWrite.Write([](Transaction& t) {
        for (const PortGroupRecord& record : {GroupOn("a", "g1"), GroupOn("b", "g2"), GroupOn("a", "g3")}) t.Put(record);
    });
    EXPECT_EQ(childrenOf("a"), (std::vector<std::string>{"g1", "g3"}));
    kWrite.Write([](Transaction& t) { t.Put(GroupOn("b", "g1")); });  // in place, with its new parent
    EXPECT_EQ(childrenOf("a"), (std::vector<std::string>{"g3"}));
    EXPECT_EQ(childrenOf("b"), (std::vector<std::string>{"g1", "g2"}));
    kWrite.Write([](Transaction& t) { t.Erase<PortGroupRecord>("g3"); });
    EXPECT_EQ(childrenOf("a"), std::vector<std::string>{});
}

TEST(HostTransaction, AFailedOperationChangesNothingAndItsExceptionPassesUnchanged) {
    TempHost host;
    Increment("n");
    try {
        kWrite.Write([](Transaction& t) {
            t.Put(CounterRecord{"n", 50});
            t.EraseAll<FirewallRulesetRecord>();
            throw Unrelated{42};
        });
        ADD_FAILURE() << "no exception";
    } catch (const Unrelated& e) {
        EXPECT_EQ(e.code, 42);
    }
    EXPECT_EQ(CounterValue("n"), 1);
    EXPECT_EQ(kRead.Read([](Transaction& t) { return t.Count<FirewallRulesetRecord>(); }),
              DefaultRulesetNames().size());
    Increment("n");  // the connection is usable again
    EXPECT_EQ(CounterValue("n"), 2);
}

TEST(HostTransaction, MisuseIsRefused) {
    TempHost host;
    // A change inside a read operation.
    EXPECT_THROW(kRead.Read([](Transaction& t) { t.Put(CounterRecord{"x", 1}); }), std::logic_error);
    // An operation inside another one.
    EXPECT_THROW(kWrite.Write([](Transaction&) { Increment("x"); }), std::logic_error);
    EXPECT_THROW(kRead.Read([](Transaction&) { kIncrement.Check(); }), std::logic_error);
    EXPECT_EQ(CounterValue("x"), 0);

    // A damaged record is reported as the host's failure, with its place.
    sqlite3* db = nullptr;
    ASSERT_EQ(sqlite3_open(host.Path().c_str(), &db), SQLITE_OK);
    ASSERT_EQ(sqlite3_exec(db,
                           "INSERT INTO records (kind, name, data)"
                           " VALUES ('test.counter', 'bad', '{\"name\":\"bad\",\"value\":\"7\"}')",
                           nullptr, nullptr, nullptr),
              SQLITE_OK);
    sqlite3_close(db);
    try {
        CounterValue("bad");
        ADD_FAILURE() << "read";
    } catch (const Gantry::Lib::GantryException& e) {
        EXPECT_NE(std::string(e.what()).find("test.counter \"bad\".value: expected an integer"), std::string::npos)
            << e.what();
    }
    // So is one whose data is not JSON at all, looked up or listed.
    ASSERT_EQ(sqlite3_open(host.Path().c_str(), &db), SQLITE_OK);
    ASSERT_EQ(sqlite3_exec(db,
                           "DELETE FROM records WHERE name = 'bad';"
                           "INSERT INTO records (kind, name, data) VALUES ('test.counter', 'torn', '{\"name\":\"to');"
                           "INSERT INTO exec_log (command_line, options, status) VALUES ('true', '[true]', 0)",
                           nullptr, nullptr, nullptr),
              SQLITE_OK);
    sqlite3_close(db);
    const std::string torn = "The host store holds a damaged record: test.counter \"torn\": its data is not valid JSON";
    EXPECT_EQ(FailureOf([] { CounterValue("torn"); }), torn);
    EXPECT_EQ(FailureOf([] { kRead.Read([](Transaction& t) { return t.List<CounterRecord>(); }); }), torn);
    EXPECT_EQ(FailureOf([] { ReadExecLog(); }),
              "The host store holds a damaged record: exec log entry 1: its options are not three flags");

    CloseHost();
    EXPECT_THROW(CounterValue("x"), Gantry::Lib::GantryException);
    try {
        kIncrement.Check();
    } catch (const Gantry::Lib::GantryException& e) {
        EXPECT_STREQ(e.what(), "No host is open");
    }
    host.Reopen();
}

TEST(HostTransaction, ReadingOneKindSeeksItsRecordsOnly) {
    // What a command costs must follow what it reads, not the size of the host.
    TempHost host;
    sqlite3* db = nullptr;
    ASSERT_EQ(sqlite3_open_v2(host.Path().c_str(), &db, SQLITE_OPEN_READONLY, nullptr), SQLITE_OK);
    for (const char* sql : {"SELECT rowid, name FROM records WHERE kind = ?",
                            "SELECT rowid, name, data FROM records WHERE kind = ?",
                            "SELECT data FROM records WHERE kind = ? AND name = ?",
                            "SELECT name, data FROM records WHERE kind = ? AND parent = ? ORDER BY rowid",
                            "SELECT rowid, json_extract(data, ?1) FROM records WHERE kind = ?2 AND parent = ?3 AND "
                            "json_type(data, ?1) = 'text'",
                            "SELECT rowid, json_extract(data, ?1), json_extract(data, ?2) FROM records WHERE kind = ?3 "
                            "AND parent = ?4 AND json_type(data, ?1) = 'text' AND json_type(data, ?2) = 'text'"}) {
        SCOPED_TRACE(sql);
        sqlite3_stmt* plan = nullptr;
        ASSERT_EQ(sqlite3_prepare_v2(db, (std::string("EXPLAIN QUERY PLAN ") + sql).c_str(), -1, &plan, nullptr),
                  SQLITE_OK);
        std::string steps;
        while (sqlite3_step(plan) == SQLITE_ROW)
            steps += reinterpret_cast<const char*>(sqlite3_column_text(plan, 3)) + std::string("\n");
        sqlite3_finalize(plan);
        EXPECT_NE(steps.find("INDEX"), std::string::npos) << steps;
        // The names of a kind come from the index alone, no record is read.
        if (std::string(sql).find("data") == std::string::npos)
            EXPECT_NE(steps.find("COVERING INDEX"), std::string::npos) << steps;
        EXPECT_EQ(steps.find("TEMP B-TREE"), std::string::npos) << steps;
        EXPECT_EQ(steps.find("SCAN"), std::string::npos) << steps;
    }
    sqlite3_close(db);
}

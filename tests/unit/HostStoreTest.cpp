// The host store: refusal of files that are not host stores, migration,
// concurrent writers, a writer killed mid-transaction, what a killed creator
// leaves. First use, alone and concurrent, a text file for a host and paths
// that name no file are proven through haldensim in
// tests/cli/haldensim.test.sh.

#include <signal.h>
#include <sqlite3.h>
#include <sys/wait.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <iterator>

#include <gtest/gtest.h>

#include "ChildProcesses.h"
#include "HostTestRecords.h"
#include "TempHost.h"
#include "host/Schema.h"
#include "trellis/host/Description.h"
#include "trellis/host/HostSession.h"
#include "trellis/host/records/FirewallRecords.h"
#include "trellis/host/records/ModuleRecord.h"
#include "trellis/host/records/PortRecord.h"
#include "trellis/host/records/SwitchRecords.h"

using namespace Trellis::Host;

namespace {

std::string ReadBytes(const std::string& path) {
    std::ifstream in(path, std::ios::binary);
    return std::string(std::istreambuf_iterator<char>(in), {});
}

void WriteBytes(const std::string& path, const std::string& bytes) {
    std::ofstream(path, std::ios::binary | std::ios::trunc) << bytes;
}

// Runs SQL on a store file directly, as a tool outside the library would.
void RunSql(const std::string& path, const std::string& sql) {
    sqlite3* db = nullptr;
    ASSERT_EQ(sqlite3_open(path.c_str(), &db), SQLITE_OK);
    char* error = nullptr;
    int rc = sqlite3_exec(db, sql.c_str(), nullptr, nullptr, &error);
    std::string message = error ? error : "";
    sqlite3_free(error);
    sqlite3_close(db);
    ASSERT_EQ(rc, SQLITE_OK) << message;
}

const Operation kPutMany("HostTest::PutMany");

}  // namespace

TEST(HostStore, RefusesFilesThatAreNotHostStoresAndLeavesThemUntouched) {
    TempHost scratch;
    CloseHost();
    std::string validHost = ReadBytes(scratch.Path());
    ASSERT_GT(validHost.size(), 4096u);

    struct Case {
        const char* name;
        std::function<void(const std::string&)> make;
        const char* problem;
    };
    std::vector<Case> cases = {
        {"empty", [](const std::string& p) { WriteBytes(p, ""); }, "not a host store"},
        {"foreign", [](const std::string& p) { RunSql(p, "CREATE TABLE notes (text TEXT); INSERT INTO notes VALUES ('hi')"); },
         "not a host store"},
        {"newer",
         [&](const std::string& p) {
             WriteBytes(p, validHost);
             RunSql(p, "PRAGMA user_version = 99");
         },
         "newer version (schema 99"},
        {"corrupt",
         [&](const std::string& p) {
             std::string damaged = validHost;
             for (std::size_t i = 100; i < 600; ++i) damaged[i] = static_cast<char>(0xa5);  // the schema page
             WriteBytes(p, damaged);
         },
         "damaged"},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        std::string path = scratch.Dir() + "/" + c.name + ".db";
        c.make(path);
        std::string before = ReadBytes(path);
        try {
            OpenHost(path);
            ADD_FAILURE() << "opened";
        } catch (const HostOpenError& e) {
            EXPECT_NE(std::string(e.what()).find(path), std::string::npos) << e.what();
            EXPECT_NE(std::string(e.what()).find(c.problem), std::string::npos) << e.what();
        }
        EXPECT_EQ(ReadBytes(path), before);
        EXPECT_THROW(ExportHost(), Gantry::Lib::GantryException);  // no host is open
    }
}

TEST(HostStore, MigratesAnOlderStoreInOneStep) {
    TempHost scratch;
    CloseHost();
    // The bare store of version 1, as it was first shipped, with one record
    // of its own that must survive.
    std::string path = scratch.Dir() + "/old.db";
    RunSql(path,
           "PRAGMA application_id = 1214344292;"
           "CREATE TABLE records (kind TEXT NOT NULL, name TEXT NOT NULL, data TEXT NOT NULL, UNIQUE (kind, name));"
           "CREATE INDEX records_by_kind ON records (kind);"
           "CREATE TABLE faults (operation TEXT NOT NULL UNIQUE, message TEXT, status INTEGER, remaining INTEGER);"
           "CREATE TABLE exec_log (id INTEGER PRIMARY KEY, command_line TEXT NOT NULL, options TEXT NOT NULL,"
           "  status INTEGER NOT NULL);"
           "INSERT INTO records VALUES ('test.counter', 'kept', '{\"name\":\"kept\",\"value\":7}');"
           "PRAGMA user_version = 1;");

    OpenHost(path);
    EXPECT_EQ(CounterValue("kept"), 7);
    const Operation read("HostTest::ReadFirewall");
    read.Read([](Transaction& t) {
        EXPECT_EQ(t.Names<FirewallRulesetRecord>(), DefaultRulesetNames());
        EXPECT_TRUE(t.Require<ModuleRecord>("haldenfw").loaded);
        EXPECT_TRUE(t.Require<FirewallStateRecord>(FirewallStateRecord::kName).enabled);
    });
    CloseHost();
    sqlite3* db = nullptr;
    ASSERT_EQ(sqlite3_open(path.c_str(), &db), SQLITE_OK);
    sqlite3_stmt* stmt = nullptr;
    sqlite3_prepare_v2(db, "PRAGMA user_version", -1, &stmt, nullptr);
    ASSERT_EQ(sqlite3_step(stmt), SQLITE_ROW);
    EXPECT_EQ(sqlite3_column_int(stmt, 0), LatestSchemaVersion());
    sqlite3_finalize(stmt);
    // The index of kinds alone is gone: records of a kind are found through
    // the index of (kind, name).
    sqlite3_prepare_v2(db, "SELECT name FROM sqlite_master WHERE type = 'index' ORDER BY name", -1, &stmt, nullptr);
    std::vector<std::string> indexes;
    while (sqlite3_step(stmt) == SQLITE_ROW) indexes.push_back(reinterpret_cast<const char*>(sqlite3_column_text(stmt, 0)));
    sqlite3_finalize(stmt);
    EXPECT_EQ(indexes, (std::vector<std::string>{"records_by_parent", "sqlite_autoindex_faults_1",
                                                 "sqlite_autoindex_records_1"}));
    sqlite3_close(db);

    // A second open finds nothing to do and seeds nothing twice.
    OpenHost(path);
    const Operation count("HostTest::CountRulesets");
    EXPECT_EQ(count.Read([](Transaction& t) { return t.Count<FirewallRulesetRecord>(); }),
              DefaultRulesetNames().size());
}

TEST(HostStore, AStoreWithoutParentsGetsTheParentOfEveryPortGroupAndPort) {
    TempHost host;
    ImportScaledDefaultHost(3);
    const std::string before = ExportHost();
    CloseHost();
    // The layout of version 3: records without the parent column and its index.
    RunSql(host.Path(), "DROP INDEX records_by_parent; ALTER TABLE records DROP COLUMN parent; PRAGMA user_version = 3");

    host.Reopen();
    EXPECT_EQ(ExportHost(), before);
    const Operation read("HostTest::ReadChildren");
    read.Read([](Transaction& t) {
        std::vector<std::string> groups;
        for (const PortGroupRecord& group : t.ChildrenOf<PortGroupRecord>("switch1")) groups.push_back(group.name);
        EXPECT_EQ(groups, (std::vector<std::string>{"Host Management-1", "Guest Network-1"}));
        for (const char* vswitch : {"switch0", "switch1", "switch2"}) {
            EXPECT_EQ(t.CountChildrenOf<PortGroupRecord>(vswitch), 2u) << vswitch;
            EXPECT_EQ(t.CountChildrenOf<PortRecord>(vswitch), 4u) << vswitch;  // an uplink's and three clients'
        }
        for (const char* dvswitch : {"dvSwitch0", "dvSwitch2", "dvSwitch4"}) {
            EXPECT_EQ(t.CountChildrenOf<PortRecord>(dvswitch), 4u) << dvswitch;  // three uplinks' and a VM's
        }
    });
}

TEST(HostStore, ConcurrentWritersLoseNoUpdate) {
    TempHost host;
    CloseHost();  // every process opens its own connection
    const int kPerChild = 150;
    std::vector<int> statuses = RunInChildren(3, [&](int child) {
        host.Reopen();
        for (int i = 0; i < kPerChild; ++i) {
            Increment("shared");                                          // read-modify-write of one record
            Increment("child" + std::to_string(child) + "-" + std::to_string(i));  // new records
        }
        return 0;
    });
    EXPECT_EQ(statuses, std::vector<int>(3, 0));
    host.Reopen();
    EXPECT_EQ(CounterValue("shared"), 3 * kPerChild);
    EXPECT_EQ(kReadCounter.Read([](Transaction& t) { return t.Count<CounterRecord>(); }), 1u + 3 * kPerChild);
}

TEST(HostStore, WriterKilledMidTransactionLeavesTheStoreUsableAndUnchanged) {
    TempHost host;
    Increment("before");
    std::string before = ExportHost();
    CloseHost();

    int ready[2];
    ASSERT_EQ(pipe(ready), 0);
    pid_t child = fork();
    ASSERT_GE(child, 0);
    if (child == 0) {
        host.Reopen();
        kPutMany.Write([&](Transaction& t) {
            for (int i = 0; i < 2000; ++i) t.Put(CounterRecord{"doomed" + std::to_string(i), i});
            t.EraseAll<FirewallRulesetRecord>();
            (void)!write(ready[1], "x", 1);
            pause();  // killed here, inside the transaction
        });
        _exit(0);
    }
    char byte;
    ASSERT_EQ(read(ready[0], &byte, 1), 1);
    kill(child, SIGKILL);
    int status = 0;
    waitpid(child, &status, 0);
    ASSERT_TRUE(WIFSIGNALED(status));

    host.Reopen();
    EXPECT_EQ(ExportHost(), before);
    EXPECT_EQ(CounterValue("before"), 1);
    EXPECT_EQ(CounterValue("doomed5"), 0);
    Increment("after");  // the write lock died with the writer
    EXPECT_EQ(CounterValue("after"), 1);
}

TEST(HostStore, AnImportRemovesWhatAKilledCreatorLeftAndSparesAllElse) {
    TempHost host;
    CloseHost();
    pid_t gone = fork();
    ASSERT_GE(gone, 0);
    if (gone == 0) _exit(0);
    ASSERT_EQ(waitpid(gone, nullptr, 0), gone);  // reaped: no process has that id now
    const std::string dead = host.Path() + ".new-" + std::to_string(gone) + "-0";
    const std::string live = host.Path() + ".new-" + std::to_string(getpid()) + "-0";
    const std::vector<std::string> abandoned = {dead, dead + "-journal", dead + "-wal", dead + "-shm"};
    const std::vector<std::string> kept = {live, live + "-wal", dead + "-backup", host.Path() + ".new-notes",
                                           host.Dir() + "/other.db.new-" + std::to_string(gone) + "-0"};
    for (const std::string& file : abandoned) WriteBytes(file, "half a host");
    for (const std::string& file : kept) WriteBytes(file, "half a host");
    host.Reopen();  // an open writes nothing, not even a removal
    for (const std::string& file : abandoned) EXPECT_TRUE(std::filesystem::exists(file)) << file;
    ImportHost(ExportHost());
    for (const std::string& file : abandoned) EXPECT_FALSE(std::filesystem::exists(file)) << file;
    for (const std::string& file : kept) EXPECT_TRUE(std::filesystem::exists(file)) << file;
}

TEST(HostStore, AHeldHostKeepsOtherProcessesOutUntilItsRelease) {
    TempHost host;
    // Another process's read, without waiting: SQLITE_BUSY while the host is held.
    auto readElsewhere = [&host] {
        return RunInChildren(1, [&host](int) {
            sqlite3* db = nullptr;
            if (sqlite3_open_v2(host.Path().c_str(), &db, SQLITE_OPEN_READONLY, nullptr) != SQLITE_OK) return 2;
            int rc = sqlite3_exec(db, "SELECT count(*) FROM records", nullptr, nullptr, nullptr);
            sqlite3_close(db);
            return rc;
        })[0];
    };
    HoldHost();
    Increment("held");  // operations run as before while the host is held
    EXPECT_EQ(readElsewhere(), SQLITE_BUSY);
    ReleaseHost();
    EXPECT_EQ(readElsewhere(), SQLITE_OK);
    EXPECT_EQ(CounterValue("held"), 1);
}

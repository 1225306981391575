// Fault injection: arming, firing before any work, counting across
// processes, Trellis_Exec's status and log.

#include <cstdlib>
#include <numeric>

#include <gtest/gtest.h>

#include "ChildProcesses.h"
#include "FailureOf.h"
#include "HostTestRecords.h"
#include "TempHost.h"
#include "trellis/host/ExecLog.h"
#include "trellis/host/Faults.h"
#include "trellis/util/Exec.h"

using namespace Trellis::Host;
using Trellis::Util::Trellis_Exec;

// The other refusals are proven through haldensim in tests/cli/haldensim.test.sh.
TEST(HostFaults, ABadFaultIsRefusedAndNothingIsArmed) {
    TempHost host;
    try {
        ArmFault({"HostTest::Increment", "", 3, {}});
        ADD_FAILURE() << "armed";
    } catch (const std::invalid_argument& e) {
        EXPECT_STREQ(e.what(), "HostTest::Increment takes a message, not a status");
    }
    EXPECT_TRUE(ListFaults().empty());
}

TEST(HostFaults, AMessageFaultFailsTheOperationBeforeAnyWork) {
    TempHost host;
    ArmFault({"HostTest::Increment", "Resource busy", 0, 2});
    ArmFault({"HostTest::ReadCounter", "Cannot read", 0, {}});

    bool ran = false;
    auto write = [&] { kIncrement.Write([&](Transaction&) { ran = true; }); };
    EXPECT_EQ(FailureOf(write), "Resource busy");
    EXPECT_EQ(ListFaults()[0].remaining, 1);
    EXPECT_EQ(FailureOf([] { kIncrement.Check(); }), "Resource busy");
    EXPECT_FALSE(ran);
    // Disarmed after two calls; the other fault stays for every call.
    EXPECT_EQ(FailureOf(write), "");
    EXPECT_TRUE(ran);
    for (int i = 0; i < 3; ++i) EXPECT_EQ(FailureOf([] { CounterValue("n"); }), "Cannot read");
    EXPECT_EQ(ListFaults(), (std::vector<Fault>{{"HostTest::ReadCounter", "Cannot read", 0, {}}}));

    // Arming again replaces; clearing disarms all.
    ArmFault({"HostTest::ReadCounter", "Other", 0, 1});
    EXPECT_EQ(FailureOf([] { CounterValue("n"); }), "Other");
    ArmFault({"HostTest::Increment", "x", 0, {}});
    ClearFaults();
    EXPECT_EQ(FailureOf([] { Increment("n"); }), "");
    EXPECT_EQ(CounterValue("n"), 1);
}

TEST(HostFaults, TrellisExecLogsTheCommandAndReturnsTheFaultStatus) {
    TempHost host;
    EXPECT_EQ(Trellis_Exec("/etc/init.d/xfrd restart", false, true, false), 0);
    ArmFault({"Trellis_Exec", "", 3, 1});
    EXPECT_EQ(Trellis_Exec("/etc/init.d/xfrd restart", false, true, false), 3);
    EXPECT_EQ(Trellis_Exec("true", true, false, true), 0);
    EXPECT_EQ(FailureOf([] { Trellis_Exec("echo \xff", false, false, false); }),
              "Trellis_Exec: the command line is not valid UTF-8");  // and nothing is logged
    EXPECT_EQ(ReadExecLog(), (std::vector<ExecEntry>{{"/etc/init.d/xfrd restart", {false, true, false}, 0},
                                                     {"/etc/init.d/xfrd restart", {false, true, false}, 3},
                                                     {"true", {true, false, true}, 0}}));
}

TEST(HostFaults, ACountedFaultFiresExactlyItsTimesAcrossProcesses) {
    TempHost host;
    ArmFault({"Trellis_Exec", "", 7, 5});
    ArmFault({"HostTest::Increment", "busy", 0, 4});
    CloseHost();
    std::vector<int> failures = RunInChildren(3, [&](int) {
        host.Reopen();
        int failed = 0;
        for (int i = 0; i < 10; ++i) {
            if (Trellis_Exec("probe", false, true, false) != 0) ++failed;
            if (!FailureOf([] { Increment("n"); }).empty()) ++failed;
        }
        return failed;
    });
    EXPECT_EQ(std::accumulate(failures.begin(), failures.end(), 0), 5 + 4);
    host.Reopen();
    EXPECT_TRUE(ListFaults().empty());
    EXPECT_EQ(CounterValue("n"), 30 - 4);
    std::vector<ExecEntry> log = ReadExecLog();
    EXPECT_EQ(log.size(), 30u);
    EXPECT_EQ(std::count_if(log.begin(), log.end(), [](const ExecEntry& e) { return e.status == 7; }), 5);
}

TEST(HostFaults, AFaultArmedByAnotherProcessReachesAnOpenHost) {
    TempHost host;
    Increment("n");  // the armed faults are known to this process now
    auto haldensim = [&](const std::string& arguments) {
        return std::system((std::string(HALDENSIM_PATH) + " --host '" + host.Path() + "' " + arguments).c_str());
    };
    ASSERT_EQ(haldensim("fault add --operation Trellis_Exec --status 9"), 0);
    EXPECT_EQ(Trellis_Exec("probe", false, true, false), 9);
    ASSERT_EQ(haldensim("fault clear"), 0);
    EXPECT_EQ(Trellis_Exec("probe", false, true, false), 0);
}

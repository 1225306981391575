// network vswitch standard uplink add and remove.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "SwitchTestSupport.h"
#include "TempHost.h"
#include "VirtualSwitchStandardUplinkAdd.h"
#include "VirtualSwitchStandardUplinkRemove.h"
#include "trellis/host/Description.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using namespace SwitchTest;
using Trellis::Host::ArmFault;
using Errors = std::vector<std::string>;

TEST(VirtualSwitchStandardUplink, AddsAndRemovesANic) {
    TempHost host;
    CommandRun run = RunCommand<VirtualSwitchStandardUplinkAdd>({"-v", "switch0", "-u", "pnet1"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
    EXPECT_EQ(Switch("switch0")["uplinks"], Json({"pnet0", "pnet1"}));
    // The teaming policy is a separate matter: it still names pnet0 alone.
    EXPECT_EQ(Switch("switch0")["policy"]["teaming"]["uplinkOrder"], Json({"pnet0"}));

    run = RunCommand<VirtualSwitchStandardUplinkRemove>({"--vswitch-name", "switch0", "--uplink-name", "pnet0"});
    EXPECT_EQ(run.Json(), "true");
    EXPECT_EQ(Switch("switch0")["uplinks"], Json({"pnet1"}));
}

TEST(VirtualSwitchStandardUplink, PassesOnWhatTheHostSays) {
    TempHost host;
    const std::string before = Trellis::Host::ExportHost();
    struct Case {
        bool add;
        std::vector<std::string> words;
        std::string error;
    };
    const std::vector<Case> cases = {
        {true, {"-v", "nosuch", "-u", "pnet1"}, "Virtual switch nosuch does not exist"},
        {false, {"-v", "nosuch", "-u", "pnet0"}, "Virtual switch nosuch does not exist"},
        {true, {"-v", "switch0", "-u", "pnet0"},
         "Unable to add uplink pnet0 to virtual switch switch0: it is already an uplink of this switch"},
        {true, {"-v", "switch0", "-u", "eth0"},
         "Unable to add uplink eth0 to virtual switch switch0: there is no physical NIC of that name"},
        {false, {"-v", "switch0", "-u", "pnet2"},
         "Unable to remove uplink pnet2 from virtual switch switch0: it is not an uplink of this switch"},
    };
    for (const Case& c : cases) {
        CommandRun run = c.add ? RunCommand<VirtualSwitchStandardUplinkAdd>(c.words)
                               : RunCommand<VirtualSwitchStandardUplinkRemove>(c.words);
        EXPECT_EQ(run.errors, Errors{c.error});
        EXPECT_FALSE(run.HasResult());
    }
    ArmFault({"VirtualSwitch::AddUplink", "driver not ready", 0, 1});
    EXPECT_EQ(RunCommand<VirtualSwitchStandardUplinkAdd>({"-v", "switch0", "-u", "pnet1"}).errors,
              Errors{"driver not ready"});
    ArmFault({"NetworkFactory::GetVirtualSwitchById", "no factory", 0, 1});
    EXPECT_EQ(RunCommand<VirtualSwitchStandardUplinkRemove>({"-v", "switch0", "-u", "pnet0"}).errors,
              Errors{"no factory"});
    EXPECT_TRUE(Trellis::Host::ExportHost() == before);
}

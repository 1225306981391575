// network vswitch standard uplink add and remove: the teaming order left
// alone, a NIC that another switch holds, and the host's failures. The other
// refusals with their texts are proven in tests/cli/vswitch.test.sh.

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

TEST(VirtualSwitchStandardUplink, HostFailuresPassOutAndChangeNothing) {
    TempHost host;
    const std::string before = Trellis::Host::ExportHost();
    ArmFault({"VirtualSwitch::AddUplink", "driver not ready", 0, 1});
    CommandRun run = RunCommand<VirtualSwitchStandardUplinkAdd>({"-v", "switch0", "-u", "pnet1"});
    EXPECT_EQ(run.errors, Errors{"driver not ready"});
    EXPECT_FALSE(run.HasResult());
    ArmFault({"NetworkFactory::GetVirtualSwitchById", "no factory", 0, 1});
    EXPECT_EQ(RunCommand<VirtualSwitchStandardUplinkRemove>({"-v", "switch0", "-u", "pnet0"}).errors,
              Errors{"no factory"});
    EXPECT_TRUE(Trellis::Host::ExportHost() == before);
}

TEST(VirtualSwitchStandardUplink, ANicThatIsAnUplinkOfAnotherSwitchIsRefused) {
    TempHost host([](TempHost::Json& d) { d["standardSwitches"].push_back(SwitchEntry("switch1", 64)); });
    const std::string before = Trellis::Host::ExportHost();
    CommandRun run = RunCommand<VirtualSwitchStandardUplinkAdd>({"-v", "switch1", "-u", "pnet0"});
    EXPECT_EQ(run.errors, Errors{"Unable to add uplink pnet0 to virtual switch switch1: "
                                 "it is already an uplink of virtual switch switch0"});
    EXPECT_FALSE(run.HasResult());
    EXPECT_TRUE(Trellis::Host::ExportHost() == before);
}

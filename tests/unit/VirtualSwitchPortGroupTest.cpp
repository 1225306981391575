// network vswitch standard portgroup list, add, remove and set: the VLAN id's
// bounds and default, a removal through the wrong switch, and the host's
// failures. The round trip and the other refusals with their texts are proven
// in tests/cli/vswitch.test.sh.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "SwitchTestSupport.h"
#include "TempHost.h"
#include "VirtualSwitchPortGroupList.h"
#include "VirtualSwitchPortGroupRemove.h"
#include "VirtualSwitchPortGroupSet.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/ParameterSpec.h"
#include "plinth/cli/UsageError.h"
#include "trellis/host/Description.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using namespace SwitchTest;
using Trellis::Host::ArmFault;
using Errors = std::vector<std::string>;

TEST(VirtualSwitchPortGroupSet, TheVlanIdTakesItsBoundsAndZeroWhenLeftOut) {
    TempHost host;
    EXPECT_EQ(RunCommand<VirtualSwitchPortGroupSet>({"-p", "Guest Network", "--vlan-id", "4095"}).Json(), "true");
    EXPECT_EQ(PortGroup("Guest Network")["vlanId"], 4095);
    // Without an id the command sets what the framework gives for a missing int.
    EXPECT_EQ(RunCommand<VirtualSwitchPortGroupSet>({"-p", "Guest Network"}).Json(), "true");
    EXPECT_EQ(PortGroup("Guest Network")["vlanId"], 0);
    EXPECT_THROW(RunCommand<VirtualSwitchPortGroupSet>({"-p", "Guest Network", "-v", "-1"}), Plinth::Cli::UsageError);

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> vlanId =
        VirtualSwitchPortGroupSet::New()->GetInputSpec()->GetParameters().at(1);
    EXPECT_EQ(vlanId->GetName(), "vlan-id");
    EXPECT_EQ(vlanId->GetDescription(), "The vlan id for this port group. This value is in the range (0 - 4095)");
}

TEST(VirtualSwitchPortGroupRemove, ASwitchThatDoesNotHoldTheGroupRefusesAndKeepsIt) {
    TempHost host([](TempHost::Json& d) { d["standardSwitches"].push_back(SwitchEntry("switch1", 64)); });
    const std::string before = Trellis::Host::ExportHost();
    CommandRun run = RunCommand<VirtualSwitchPortGroupRemove>({"-p", "Host Management", "-v", "switch1"});
    EXPECT_EQ(run.errors, Errors{"Unable to remove port group Host Management from virtual switch switch1: "
                                 "the switch has no port group of that name"});
    EXPECT_FALSE(run.HasResult());
    EXPECT_TRUE(Trellis::Host::ExportHost() == before);
}

TEST(VirtualSwitchPortGroup, HostFailuresPassOutAndChangeNothing) {
    TempHost host;
    const std::string before = Trellis::Host::ExportHost();
    ArmFault({"PortGroup::SetVlanId", "vlan table full", 0, 1});
    CommandRun run = RunCommand<VirtualSwitchPortGroupSet>({"-p", "Guest Network", "-v", "10"});
    EXPECT_EQ(run.errors, Errors{"vlan table full"});
    EXPECT_FALSE(run.HasResult());
    ArmFault({"PortGroupImpl::GetActiveClients", "port table busy", 0, 1});
    run = RunCommand<VirtualSwitchPortGroupList>();
    EXPECT_EQ(run.errors, Errors{"port table busy"});
    EXPECT_FALSE(run.HasResult());
    EXPECT_TRUE(Trellis::Host::ExportHost() == before);
}

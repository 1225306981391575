// network vswitch standard portgroup list, add, remove and set.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "SwitchTestSupport.h"
#include "TempHost.h"
#include "VirtualSwitchPortGroupAdd.h"
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

TEST(VirtualSwitchPortGroupList, ListsEveryGroupWithItsClients) {
    TempHost host([](TempHost::Json& d) {
        d["standardSwitches"].push_back(SwitchEntry("switch1", 64));
        d["portGroups"].push_back(PortGroupEntry("Storage", "switch1", 20));
    });
    CommandRun run = RunCommand<VirtualSwitchPortGroupList>();
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Parsed(), Json::parse(R"([
      {"Name": "Host Management", "Virtual Switch": "switch0", "Active Clients": 1, "VLAN ID": 0},
      {"Name": "Guest Network", "Virtual Switch": "switch0", "Active Clients": 1, "VLAN ID": 0},
      {"Name": "Storage", "Virtual Switch": "switch1", "Active Clients": 0, "VLAN ID": 20}])"));

    ArmFault({"PortGroupImpl::GetActiveClients", "port table busy", 0, 1});
    run = RunCommand<VirtualSwitchPortGroupList>();
    EXPECT_EQ(run.errors, Errors{"port table busy"});
    EXPECT_FALSE(run.HasResult());
}

TEST(VirtualSwitchPortGroupList, AHostWithoutGroupsListsNothing) {
    TempHost host([](TempHost::Json& d) {
        d["portGroups"] = Json::array();
        d["ports"] = Json::array();
    });
    CommandRun run = RunCommand<VirtualSwitchPortGroupList>();
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "[]");
}

TEST(VirtualSwitchPortGroup, AddSetAndRemoveRoundTrip) {
    TempHost host;
    const std::string before = Trellis::Host::ExportHost();
    CommandRun run = RunCommand<VirtualSwitchPortGroupAdd>({"-p", "Storage", "-v", "switch0"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
    EXPECT_EQ(PortGroup("Storage")["vswitch"], "switch0");

    EXPECT_EQ(RunCommand<VirtualSwitchPortGroupSet>({"-p", "Storage", "--vlan-id", "4095"}).Json(), "true");
    EXPECT_EQ(PortGroup("Storage")["vlanId"], 4095);
    // Without an id the command sets what the framework gives for a missing int.
    EXPECT_EQ(RunCommand<VirtualSwitchPortGroupSet>({"-p", "Storage"}).Json(), "true");
    EXPECT_EQ(PortGroup("Storage")["vlanId"], 0);

    run = RunCommand<VirtualSwitchPortGroupRemove>({"--portgroup-name", "Storage", "--vswitch-name", "switch0"});
    EXPECT_EQ(run.Json(), "true");
    EXPECT_TRUE(Trellis::Host::ExportHost() == before);
}

TEST(VirtualSwitchPortGroup, RefusalsNameTheirObjectAndChangeNothing) {
    TempHost host;
    const std::string before = Trellis::Host::ExportHost();
    CommandRun run = RunCommand<VirtualSwitchPortGroupAdd>({"-p", "Storage", "-v", "nosuch"});
    EXPECT_EQ(run.errors, Errors{"Virtual switch nosuch does not exist"});
    EXPECT_FALSE(run.HasResult());
    run = RunCommand<VirtualSwitchPortGroupAdd>({"-p", "Guest Network", "-v", "switch0"});
    EXPECT_EQ(run.errors, Errors{"Unable to add port group Guest Network to virtual switch switch0: a port group of "
                                 "that name already exists on virtual switch switch0"});
    run = RunCommand<VirtualSwitchPortGroupRemove>({"-p", "Guest Network", "-v", "switch0"});
    EXPECT_EQ(run.errors,
              Errors{"Unable to remove port group Guest Network from virtual switch switch0: it has 1 active client"});
    run = RunCommand<VirtualSwitchPortGroupRemove>({"-p", "Storage", "-v", "switch0"});
    EXPECT_EQ(run.errors, Errors{"Unable to remove port group Storage from virtual switch switch0: the switch has no "
                                 "port group of that name"});
    run = RunCommand<VirtualSwitchPortGroupSet>({"-p", "Storage", "-v", "10"});
    EXPECT_EQ(run.errors, Errors{"Unable to find a port group with the name Storage"});
    EXPECT_FALSE(run.HasResult());
    EXPECT_THROW(RunCommand<VirtualSwitchPortGroupSet>({"-p", "Guest Network", "-v", "4096"}),
                 Plinth::Cli::UsageError);
    EXPECT_THROW(RunCommand<VirtualSwitchPortGroupSet>({"-p", "Guest Network", "-v", "-1"}), Plinth::Cli::UsageError);

    ArmFault({"PortGroup::SetVlanId", "vlan table full", 0, 1});
    EXPECT_EQ(RunCommand<VirtualSwitchPortGroupSet>({"-p", "Guest Network", "-v", "10"}).errors,
              Errors{"vlan table full"});
    ArmFault({"VirtualSwitch::AddPortGroup", "out of memory", 0, 1});
    EXPECT_EQ(RunCommand<VirtualSwitchPortGroupAdd>({"-p", "Storage", "-v", "switch0"}).errors,
              Errors{"out of memory"});
    EXPECT_TRUE(Trellis::Host::ExportHost() == before);
}

TEST(VirtualSwitchPortGroupSet, TheVlanHelpShowsTheHostsRange) {
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = VirtualSwitchPortGroupSet::New()->GetInputSpec();
    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> vlanId = inputSpec->GetParameters().at(1);
    EXPECT_EQ(vlanId->GetName(), "vlan-id");
    EXPECT_EQ(vlanId->GetDescription(), "The vlan id for this port group. This value is in the range (0 - 4095)");
}

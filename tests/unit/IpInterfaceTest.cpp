// network ip interface add, remove, list and set: an interface on a port
// group and on a DVPort with the ports they take and free, the refusals of a
// connection point in the order they are made, the tags and the daemon of the
// dedicated stacks, every kind of point in the list, and each host failure
// once. Round trips through the binary are in tests/cli/interface.test.sh.

#include <ctime>
#include <functional>
#include <string>
#include <tuple>
#include <utility>
#include <vector>

#include <algorithm>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "InterfaceTestSupport.h"
#include "IpInterfaceAdd.h"
#include "IpInterfaceList.h"
#include "IpInterfaceRemove.h"
#include "IpInterfaceSet.h"
#include "TempHost.h"
#include "VirtualSwitchDVSKorvexList.h"
#include "VirtualSwitchPortGroupList.h"
#include "VirtualSwitchStandardList.h"
#include "gantry/lib/GantryException.h"
#include "plinth/cli/UsageError.h"
#include "trellis/host/Description.h"
#include "trellis/host/ExecLog.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using namespace InterfaceTest;
using Trellis::Host::ArmFault;
using Trellis::Host::ExportHost;
using Words = std::vector<std::string>;

namespace {

const std::string kNoPoint =
    "A connection point of either vswitch port group name or dvs-name/dvport-id should be specified. If connection "
    "point is DVPort, --dvs-name and --dvport-id must be specified at the same time.";
const std::string kTwoPoints = "Only one connection point can be specified, vswitch port group or DVPort.";
const std::string kNoWay =
    "Please correctly and uniquely specify a way to remove it. A Tessel network interface can be uniquely specified "
    "by --interface-name or --portgroup-name or --dvs-name/--dvport-id. i.e. Providing its name or its connection "
    "point are two ways to uniquely specify a Tessel network interface.";

// tsl1 on DVPort 2 of dvSwitch0 in "glide", tsl2 on an opaque network,
// tsl3 attached nowhere.
void WithEveryKindOfPoint(Json& d) {
    AddNetstack(d, "glide");
    AddNic(d, 1, "glide", Json::array(), "");
    d["tesselNics"][1]["connectionPoint"] = {{"dvSwitch", "dvSwitch0"}, {"dvPort", "2"}, {"connectionId", 17}};
    d["ports"].push_back({{"id", 33554601}, {"portset", "dvSwitch0"}, {"dvPort", "2"}, {"clientKind", "tesselNic"},
                          {"clientName", "tsl1"}});
    AddNic(d, 2, "defaultTcpipStack", Json::array(), "");
    d["tesselNics"][2]["connectionPoint"] = {
        {"opaqueNetwork", {{"networkId", "net-7"}, {"networkType", "overlay"}, {"externalId", "ext-7"}}}};
    AddNic(d, 3, "defaultTcpipStack", Json::array(), "");
}

// The ports in use as switch0, its port group "Guest Network" and DVPort 1
// of dvSwitch0 count them.
std::vector<Json> PortCounts() {
    Json groups = RunCommand<VirtualSwitchPortGroupList>().Parsed();
    Json guest = groups[0]["Name"] == "Guest Network" ? groups[0] : groups[1];
    return {RunCommand<VirtualSwitchStandardList>({"-v", "switch0"}).Parsed()[0]["Used Ports"],
            guest["Active Clients"],
            RunCommand<VirtualSwitchDVSKorvexList>({"-v", "dvSwitch0"}).Parsed()[0]["DVPort"][1]["In Use"]};
}

}  // namespace

TEST(IpInterfaceAdd, TakesAPortOnAPortGroupOrADVPortThatRemoveFreesAgain) {
    TempHost host;
    std::vector<Json> before = PortCounts();
    const long long start = std::time(nullptr);
    ExpectDone(
        RunCommand<IpInterfaceAdd>({"-p", "Guest Network", "-M", "00:50:56:AA:00:01", "-m", "9000", "-i", "tsl7"}));
    ExpectDone(RunCommand<IpInterfaceAdd>({"--dvs-name", "dvSwitch0", "--dvport-id", "1"}));
    Json nics = Nics();
    ExpectFields(nics["tsl7"], R"({"macAddress":"00:50:56:aa:00:01","mtu":9000,"netstack":"defaultTcpipStack",
        "connectionPoint":{"portGroup":"Guest Network"},"tags":[]})");
    // The lowest free name and the default MTU; the free port had no
    // connection, so it got one from the clock.
    ExpectFields(nics["tsl1"], R"({"mtu":1500,"netstack":"defaultTcpipStack"})");
    Json point = nics["tsl1"]["connectionPoint"];
    ExpectFields(point, R"({"dvSwitch":"dvSwitch0","dvPort":"1"})");
    EXPECT_GE(point["connectionId"].get<long long>(), start);
    EXPECT_EQ(PortCounts(), (std::vector<Json>{before[0].get<int>() + 1, before[1].get<int>() + 1, true}));

    ExpectDone(RunCommand<IpInterfaceRemove>({"-p", "Guest Network"}));
    ExpectDone(RunCommand<IpInterfaceRemove>({"-s", "dvSwitch0", "-P", "1"}));
    EXPECT_EQ(PortCounts(), before);
    EXPECT_EQ(Nics().size(), 1u);
}

TEST(IpInterfaceAdd, RefusesAConnectionPointInTheOrderOfItsChecksAndLeavesTheHostAsItWas) {
    TempHost host;
    const std::string before = ExportHost();
    const std::string badMac = "01:00:5e:00:00:01";
    for (auto const& [words, text] : std::vector<std::pair<Words, std::string>>{
             {{}, kNoPoint},
             {{"-s", "dvSwitch0", "-M", badMac}, kNoPoint},
             {{"-p", "Guest Network", "-P", "1"}, kNoPoint},
             {{"-p", "", "-s", "", "-P", ""}, kTwoPoints},
             {{"-p", "nosuch", "-M", badMac}, "Invalid unicast MAC address specified."},
             {{"-p", "nosuch"}, "Invalid vswitch port group name nosuch. Error was: Port group nosuch does not exist"},
             {{"-s", "nosuch", "-P", "1"},
              "Unable to retrieve DVS info by specified DVS name nosuch. Error was: Distributed switch nosuch does not "
              "exist"},
             {{"-s", "dvSwitch0", "-P", "99"}, "Invalid vswitch port group or DVPort parameters."},
             {{"-p", "Guest Network", "-i", "tsl0"},
              "Unable to add Tessel network interface. Error was : Unable to add interface tsl0: an interface of that "
              "name exists already"},
             {{"-p", "Guest Network", "-N", ""},
              "Unable to add Tessel network interface. Error was : Unable to add interface tsl1: there is no netstack "
              "instance "},
         }) {
        SCOPED_TRACE(testing::PrintToString(words));
        ExpectFailure(RunCommand<IpInterfaceAdd>(words), text);
    }
    for (const Words& words : {Words{"-p", "Guest Network", "-i", "tsl256"}, Words{"-p", "Guest Network", "-m", "1279"},
                               Words{"-p", "Guest Network", "-m", "9001"}})
        EXPECT_THROW(RunCommand<IpInterfaceAdd>(words), Plinth::Cli::UsageError);
    // The name's pattern as the reference tables write it, their "\|" escapes for "|" aside.
    std::string documented = "tsl([0-9]\\|[1-9][0-9]\\|1[0-9][0-9]\\|2[0-4][0-9]\\|25[0-5])";
    documented.erase(std::remove(documented.begin(), documented.end(), '\\'), documented.end());
    const auto inputSpec = IpInterfaceAdd::New()->GetInputSpec();
    for (const auto& parameter : inputSpec->GetParameters())
        if (parameter->GetName() == "interface-name")
            EXPECT_EQ(parameter->GetConstraint()->GetStringRegex(), documented);
    EXPECT_EQ(ExportHost(), before);
    // The port has a connection before the host refuses it, and keeps it.
    ExpectFailure(RunCommand<IpInterfaceAdd>({"-s", "dvSwitch0", "-P", "0"}),
                  "Unable to add Tessel network interface. Error was : Unable to add interface tsl1: DVPort 0 of "
                  "dvSwitch0 is in use by web01.eth1");
    EXPECT_EQ(Nics().size(), 1u);
    EXPECT_TRUE(Json::parse(ExportHost())["distributedSwitches"][0]["ports"][0].contains("connectionId"));
}

TEST(IpInterfaceAdd, OnADedicatedStackTakesItsTagFromTheDefaultStackOnly) {
    TempHost host([](Json& d) {
        AddNetstack(d, "glide");
        AddNetstack(d, "backup");
        d["tesselNics"][0]["tags"] = {"Management", "Glide"};
        AddNic(d, 1, "backup", {"Glide"});
    });
    ExpectDone(RunCommand<IpInterfaceAdd>({"-p", "Guest Network", "-N", "glide", "-i", "tsl2"}));
    Json nics = Nics();
    EXPECT_EQ(nics["tsl0"]["tags"], Json({"Management"}));
    EXPECT_EQ(nics["tsl1"]["tags"], Json({"Glide"}));
    EXPECT_EQ(nics["tsl2"]["tags"], Json({"Glide"}));
    EXPECT_EQ(nics["tsl2"]["netstack"], "glide");
    EXPECT_TRUE(Trellis::Host::ReadExecLog().empty());
}

TEST(IpInterfaceAdd, RestartsTheFileCopyDaemonForTheProvisioningStackAndKeepsTheInterfaceWhenItFails) {
    TempHost host([](Json& d) { AddNetstack(d, "MeridonProvisioning"); });
    ExpectDone(RunCommand<IpInterfaceAdd>({"-p", "Guest Network", "-N", "MeridonProvisioning"}));
    ArmFault({"Trellis_Exec", "", 3, {}});
    CommandRun run = RunCommand<IpInterfaceAdd>({"-p", "Guest Network", "-N", "MeridonProvisioning"});
    EXPECT_EQ(run.errors,
              Errors{"Unable to start the XFR daemon. Take a look at /var/log/xfrd.log for more information."});
    EXPECT_EQ(run.Json(), "true");
    Json nics = Nics();
    EXPECT_EQ(nics["tsl1"]["tags"], Json({"Provisioning"}));
    EXPECT_EQ(nics["tsl2"]["tags"], Json({"Provisioning"}));
    const Trellis::Host::ExecEntry restart{"/etc/init.d/xfrd restart", {false, true, false}, 0};
    Trellis::Host::ExecEntry failed = restart;
    failed.status = 3;
    EXPECT_EQ(Trellis::Host::ReadExecLog(), (std::vector<Trellis::Host::ExecEntry>{restart, failed}));
}

TEST(IpInterfaceList, ShowsEachKindOfConnectionPointAndADetachedInterfaceWithoutItsNetstack) {
    TempHost host(WithEveryKindOfPoint);
    Json all = RunCommand<IpInterfaceList>().Parsed();
    ASSERT_EQ(all.size(), 4u);
    ExpectFields(all[1], R"({"Portset":"dvSwitch0","Portgroup":"N/A","Netstack Instance":"glide",
        "VDS Name":"dvSwitch0","VDS UUID":"50 2f 8c 1a 3e 77 4b 90-a1 0c 5d e2 7f 33 91 04","VDS Port":"2",
        "VDS Connection":17,"Opaque Network ID":"N/A","Port ID":33554601})");
    ExpectFields(all[2], R"({"Portset":"N/A","Portgroup":"N/A","Netstack Instance":"defaultTcpipStack",
        "VDS Name":"N/A","VDS Connection":-1,"Opaque Network ID":"net-7","Opaque Network Type":"overlay",
        "External ID":"ext-7","Port ID":null})");
    ExpectFields(all[3], R"({"Name":"tsl3","Portset":"N/A","Portgroup":"N/A","Netstack Instance":"N/A",
        "VDS Connection":-1,"External ID":"N/A","MTU":1500,"Enabled":true,"Port ID":null})");
    EXPECT_EQ(RunCommand<IpInterfaceList>({"-N", ""}).Parsed(), all);
    EXPECT_EQ(RunCommand<IpInterfaceList>({"--netstack", "glide"}).Parsed(), Json::array({all[1]}));
}

TEST(IpInterfaceRemove, TakesANameFromAnyNetstackOrAPointFromTheOneGiven) {
    TempHost host([](Json& d) {
        AddNetstack(d, "glide");
        AddNic(d, 1, "glide", Json::array());
        AddNic(d, 2, "glide", Json::array(), "Host Management");
    });
    for (const Words& words : {Words{}, Words{"-N", "glide"}, Words{"-i", "tsl1", "-P", "1"}})
        ExpectFailure(RunCommand<IpInterfaceRemove>(words), kNoWay);
    ExpectFailure(RunCommand<IpInterfaceRemove>({"-s", "dvSwitch0"}), kNoPoint);
    ExpectFailure(RunCommand<IpInterfaceRemove>({"-p", "a", "-s", "b", "-P", "c"}), kTwoPoints);
    EXPECT_THROW(RunCommand<IpInterfaceRemove>({"-i", "eth0"}), Plinth::Cli::UsageError);

    CommandRun run = RunCommand<IpInterfaceRemove>({"-i", "tsl9"});
    EXPECT_EQ(run.errors, Errors{"Unable to find Tessel network interface with the name tsl9"});
    EXPECT_EQ(run.Json(), "false");

    ExpectDone(RunCommand<IpInterfaceRemove>({"-i", "tsl1", "-N", "defaultTcpipStack"}));
    // Without --netstack, or with an empty one, the point is sought in the
    // default stack, where tsl0 is and tsl2 is not.
    ExpectDone(RunCommand<IpInterfaceRemove>({"-p", "Host Management", "-N", ""}));
    Json nics = Nics();
    EXPECT_EQ(nics.size(), 1u);
    EXPECT_TRUE(nics.contains("tsl2"));
    ExpectDone(RunCommand<IpInterfaceRemove>({"-p", "Host Management", "-N", "glide"}));
    EXPECT_TRUE(Nics().empty());
}

TEST(IpInterfaceSet, EnablesAndSetsTheMtuButRefusesANegativeOneAfterEnabling) {
    TempHost host;
    ExpectDone(RunCommand<IpInterfaceSet>({"-i", "tsl0", "-m", "9000"}));
    ExpectFailure(RunCommand<IpInterfaceSet>({"-i", "tsl0", "-e", "false", "-m", "-1"}),
                  "MTU size should be a positive value");
    Json nic = Nics()["tsl0"];
    EXPECT_EQ(nic["enabled"], false);
    EXPECT_EQ(nic["mtu"], 9000);
    const std::string before = ExportHost();
    ExpectDone(RunCommand<IpInterfaceSet>({"-i", "tsl0"}));
    EXPECT_EQ(ExportHost(), before);
    ExpectDone(RunCommand<IpInterfaceSet>({"-i", "tsl0", "-e", "true"}));
    EXPECT_EQ(Nics()["tsl0"]["enabled"], true);
    // 0 is no negative value: the host refuses it.
    ExpectFailure(RunCommand<IpInterfaceSet>({"-i", "tsl0", "-m", "0"}),
                  "Invalid MTU 0 for interface tsl0: the MTU must be from 1280 to 9000");
    ExpectFailure(RunCommand<IpInterfaceSet>({"-i", "tsl9", "-e", "true"}),
                  "Unable to find an interface with name tsl9");
}

TEST(IpInterfaceCommands, ReportEachHostFailureInTheirOwnWords) {
    TempHost host(WithEveryKindOfPoint);
    using Run = std::function<CommandRun()>;
    auto command = [](auto make, Words words) -> Run { return [make, words] { return make(words); }; };
    Run addOnGroup = command(RunCommand<IpInterfaceAdd>, {"-p", "Guest Network", "-N", "glide"});
    Run addOnDVPort = command(RunCommand<IpInterfaceAdd>, {"-s", "dvSwitch0", "-P", "1"});
    Run removeByName = command(RunCommand<IpInterfaceRemove>, {"-i", "tsl3"});
    Run removeByGroup = command(RunCommand<IpInterfaceRemove>, {"-p", "Host Management"});
    Run removeByDVPort = command(RunCommand<IpInterfaceRemove>, {"-s", "dvSwitch0", "-P", "2", "-N", "glide"});
    Run list = command(RunCommand<IpInterfaceList>, {});
    Run set = command(RunCommand<IpInterfaceSet>, {"-i", "tsl0", "-e", "false", "-m", "1500"});
    const std::string dvs = "Unable to retrieve DVS info by specified DVS name dvSwitch0. Error was: busy";
    const std::string adding = "Unable to add Tessel network interface. Error was : busy";
    const std::string removing = "Unable to remove Tessel network interface. Error was : busy";
    for (auto const& [operation, run, text] : std::vector<std::tuple<std::string, Run, std::string>>{
             {"PortGroupImpl::PortGroupImpl", addOnGroup,
              "Invalid vswitch port group name Guest Network. Error was: busy"},
             {"DVSwitch::GetId", addOnDVPort, dvs},
             {"DVPortImpl::SetConnectionId", addOnDVPort, dvs},
             {"TesselNicInfoImpl::TesselNicInfoImpl", addOnGroup, adding},
             {"TslNic::AddTag", addOnGroup, adding},
             {"TslNic::Activate", addOnGroup, adding},
             {"TesselNicInfoImpl::TesselNicInfoImpl", removeByName, removing},
             {"TslNic::Remove", removeByName, removing},
             {"DVPortImpl::GetConnectionId", removeByDVPort, dvs},
             {"TesselNicInfoImpl::RemoveTesselNic", removeByDVPort, removing},
             {"ConnectionPoint::GetType", list, "busy"},
             {"VirtualSwitchInfoImpl::GetDVSwitchByName", list, "busy"},
             {"PortImpl::GetPortId", list, "busy"},
             {"TslNic::SetMtu", set, "busy"},
         }) {
        SCOPED_TRACE(operation);
        ArmFault({operation, "busy", 0, 1});
        ExpectFailure(run(), text);
        Trellis::Host::ClearFaults();
    }
    // Failures outside the guarded blocks leave the commands.
    for (auto const& [operation, run] : std::vector<std::pair<std::string, Run>>{
             {"ConnectionPoint::IsValid", addOnGroup},
             {"ConnectionPoint::IsValid", removeByGroup},
             {"TesselNicInfoImpl::TesselNicInfoImpl", list},
             {"TesselNicInfoImpl::TesselNicInfoImpl", set},
         }) {
        SCOPED_TRACE(operation);
        ArmFault({operation, "busy", 0, 1});
        EXPECT_THROW(run(), Gantry::Lib::GantryException);
    }
}

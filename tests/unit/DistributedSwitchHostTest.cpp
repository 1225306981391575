// The host side of distributed switches, VMs and ports in use: what a
// description may hold, the ports uplinks get, handles on names, the uplink
// ports a switch reports, the LACP timeout, and the step that brings all of it
// to an older host.

#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>
#include <sqlite3.h>

#include "SwitchTestSupport.h"
#include "TempHost.h"
#include "gantry/network/DVPortParam.h"
#include "gantry/network/NetworkFactory.h"
#include "trellis/host/Description.h"
#include "trellis/host/HostSession.h"
#include "trellis/network/DVPortImpl.h"
#include "trellis/network/DVSwitchImpl.h"
#include "trellis/network/PnicImpl.h"
#include "trellis/network/PortImpl.h"
#include "trellis/network/VirtualSwitchImpl.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"
#include "util/OwnedVector"

using namespace SwitchTest;
using Names = std::vector<std::string>;

namespace {

std::unique_ptr<Trellis::Network::DVSwitchImpl> DVSwitch(const std::string& name) {
    return std::unique_ptr<Trellis::Network::DVSwitchImpl>(
        dynamic_cast<Trellis::Network::DVSwitchImpl*>(Gantry::Network::NetworkFactory::GetDVSwitchByName(name)));
}

Json& PortWithId(Json& d, int id) {
    for (Json& port : d["ports"])
        if (port["id"] == id) return port;
    throw std::logic_error("no such port");
}

}  // namespace

TEST(DistributedSwitchHost, TheDescriptionRefusesWhatCannotBe) {
    TempHost host;
    const std::string before = Trellis::Host::ExportHost();
    struct Case {
        std::function<void(Json&)> edit;
        std::string refusal;
    };
    const std::vector<Case> cases = {
        {[](Json& d) { d["distributedSwitches"][1]["name"] = "switch0"; },
         "distributedSwitches[1].name: a standard switch is named \"switch0\""},
        {[](Json& d) { d["distributedSwitches"][1]["id"] = d["distributedSwitches"][0]["id"]; },
         "distributedSwitches[1].id: duplicate identity \"50 2f 8c 1a 3e 77 4b 90-a1 0c 5d e2 7f 33 91 04\""},
        {[](Json& d) { d["distributedSwitches"][0]["ports"][8]["nic"] = "pnet0"; },
         "distributedSwitches[0].ports: \"pnet0\" is already an uplink of \"switch0\""},
        {[](Json& d) { d["distributedSwitches"][0]["ports"][9]["nic"] = "pnet4"; },
         "distributedSwitches[0].ports[10].nic: \"pnet4\" is already connected to \"dvSwitch0\""},
        {[](Json& d) { d["distributedSwitches"][0]["ports"][11]["uplinkName"] = "lag1-2"; },
         "distributedSwitches[0].ports: uplink \"lag1-2\" is no port of LAG \"lag1\" (ports lag1-0 to 2 less one)"},
        {[](Json& d) { d["distributedSwitches"][0]["lacpGroups"][0]["nics"][0]["portState"] = 63; },
         "distributedSwitches[0].lacpGroups[0].nics[0].portState: the timeout bit (2) follows shortTimeout and is "
         "not given"},
        {[](Json& d) { d["worlds"][1]["name"] = "web01"; }, "worlds[1].name: duplicate VM \"web01\""},
        {[](Json& d) { PortWithId(d, 33554438)["worldId"] = 4242; }, "ports[3].worldId: no VM's world 4242"},
        {[](Json& d) { PortWithId(d, 33554438)["clientName"] = "web01.eth7"; },
         "ports[3].clientName: expected an adapter of \"db01\" (\"db01.eth0\")"},
        {[](Json& d) { PortWithId(d, 33554438).erase("worldId"); },
         "ports[3].worldId: expected the world of the VM that owns the adapter"},
        {[](Json& d) { PortWithId(d, 33554451)["dvPort"] = "10"; },
         "ports[7].dvPort: DVPort 10 is an uplink port"},
        {[](Json& d) { PortWithId(d, 33554438)["portset"] = "dvSwitch0"; },
         "ports[3].dvPort: expected the DVPort on \"dvSwitch0\""},
        {[](Json& d) {
             Json second = PortWithId(d, 33554451);
             second["id"] = 33554460;
             d["ports"].push_back(second);
         },
         "ports[8].dvPort: DVPort 0 is already in use"},
        {[](Json& d) { PortWithId(d, 33554448)["clientName"] = "pnet5"; },
         "ports[4].clientName: DVPort 8 has no NIC \"pnet5\""},
        {[](Json& d) { PortWithId(d, 33554437)["stats"]["bytesSent"] = 9223372036854775808ull; },
         "ports[2].stats.bytesSent: expected an integer from 0 to 9223372036854775807"},
        {[](Json& d) { PortWithId(d, 33554437)["stats"]["broadcastReceived"] = 12512102; },
         "ports[2].stats: more multicast and broadcast packets received than packets received"},
    };
    for (const Case& c : cases) EXPECT_EQ(DescriptionRefusal(c.edit), c.refusal);
    EXPECT_TRUE(Trellis::Host::ExportHost() == before);
}

TEST(DistributedSwitchHost, AnUplinkHasAPortWhileItIsConnectedAndANicServesOneSwitch) {
    TempHost host;
    std::unique_ptr<Gantry::Network::VirtualSwitch> vswitch(
        Gantry::Network::NetworkFactory::GetVirtualSwitchById("switch0"));
    vswitch->AddUplink("pnet1");
    Trellis::Network::PnicImpl pnet1("pnet1");
    std::unique_ptr<Trellis::Network::PortImpl> port(pnet1.GetUplinkPort());
    EXPECT_EQ(port->GetPortId(), 33554452);  // past the highest port id in use
    EXPECT_EQ(port->GetClientType(), Trellis::Network::PortImpl::CLIENT_TYPE_UPLINK);
    EXPECT_EQ(port->GetTeamUplink(), "pnet1");
    EXPECT_EQ(port->GetMacAddresses().front().GetStringAddress(), "00:00:00:00:00:00");
    EXPECT_EQ(vswitch->GetUsedPorts(), 5);  // two uplinks and three clients, each counted once

    vswitch->RemoveUplink("pnet1");
    EXPECT_EQ(FailureOf([&] { delete pnet1.GetUplinkPort(); }), "Physical NIC pnet1 has no uplink port on any switch");
    EXPECT_EQ(FailureOf([&] { vswitch->AddUplink("pnet3"); }),
              "Unable to add uplink pnet3 to virtual switch switch0: it is already an uplink of distributed switch "
              "dvSwitch0");
    Trellis::Network::VirtualSwitchInfoImpl info;
    EXPECT_EQ(FailureOf([&] {
                  delete info.AddVirtualSwitchWithPolicy({}, {}, {}, {}, "dvSwitch1", 128);
              }),
              "Unable to create virtual switch dvSwitch1: a distributed switch of that name already exists");

    // Removing a switch takes its uplinks' ports with it.
    delete info.AddVirtualSwitchWithPolicy({}, {}, {}, {}, "spare", 16);
    std::unique_ptr<Gantry::Network::VirtualSwitch> spare(Gantry::Network::NetworkFactory::GetVirtualSwitchById("spare"));
    spare->AddUplink("pnet2");
    info.RemoveVirtualSwitch("spare");
    EXPECT_EQ(FailureOf([&] { delete Trellis::Network::PnicImpl("pnet2").GetUplinkPort(); }),
              "Physical NIC pnet2 has no uplink port on any switch");
}

TEST(DistributedSwitchHost, HandlesReadNothingUntilAskedAndThenFailWithTheHostsText) {
    TempHost host;
    EXPECT_EQ(DVSwitch("nosuch"), nullptr);
    Trellis::Network::DVSwitchImpl missing("nosuch", Gantry::Network::Portset::DEF_NUM_PORTS);
    EXPECT_EQ(missing.GetName(), "nosuch");
    EXPECT_EQ(FailureOf([&] { missing.GetMtu(); }), "Distributed switch nosuch does not exist");
    EXPECT_EQ(FailureOf([&] { missing.SetLacpTimeout(1, true, ""); }), "Distributed switch nosuch does not exist");

    Trellis::Network::DVSwitchImpl handle("dvSwitch0", Gantry::Network::Portset::DEF_NUM_PORTS);
    EXPECT_EQ(handle.GetNumPorts(), 12);  // the switch's own, once read
    EXPECT_EQ(handle.GetUplinks(), (Names{"pnet3", "pnet4", "pnet5"}));
    Trellis::Util::OwnedVector<Trellis::Network::PortImpl> ports(handle.GetPorts());
    EXPECT_EQ(ports.Items().size(), 4u);
    Trellis::Network::VirtualSwitchImpl legacy("switch0", Gantry::Network::Portset::DEF_NUM_PORTS);
    EXPECT_EQ(legacy.GetMtu(), 1500);
    EXPECT_EQ(Trellis::Util::OwnedVector<Trellis::Network::PortImpl>(legacy.GetPorts()).Items().size(), 4u);

    const std::string id = handle.GetId();
    EXPECT_EQ(Trellis::Network::DVPortImpl(id, "0").GetDVPortgroupId(), "dvportgroup-101");
    EXPECT_EQ(FailureOf([&] { Trellis::Network::DVPortImpl(id, "99").GetDVPortgroupId(); }),
              "DVPort 99 does not exist on the distributed switch " + id);
    EXPECT_EQ(FailureOf([&] { delete Gantry::Network::NetworkFactory::GetDVPort({id, "12"}); }),
              "DVPort 12 does not exist on the distributed switch " + id);
    std::vector<std::string> clients;
    std::unique_ptr<Gantry::Network::DVPort> port(Gantry::Network::NetworkFactory::GetDVPort({id, "0"}));
    EXPECT_TRUE(port->IsInUse(clients));
    EXPECT_EQ(clients, Names{"web01.eth1"});
}

TEST(DistributedSwitchHost, UplinkPortsByNameAndByMapAndTheLacpTimeout) {
    TempHost host;
    auto dvs = DVSwitch("dvSwitch0");
    std::vector<std::string> keys;
    for (const auto& entry : dvs->GetUplinkPortParams()) keys.push_back(entry.first);
    EXPECT_EQ(keys, (Names{"lag1-0", "lag1-1", "uplink1"}));  // uplink2 has no NIC
    Names nics, portNames;
    dvs->GetUplinkPortNames(nics, portNames);
    EXPECT_EQ(nics, (Names{"pnet3", "pnet4", "pnet5"}));
    EXPECT_EQ(portNames, (Names{"uplink1", "uplink2", "lag1-0", "lag1-1"}));
    EXPECT_EQ(dvs->GetUplinkPort("lag1-9"), nullptr);

    EXPECT_EQ(FailureOf([&] { dvs->SetLacpTimeout(7, true, ""); }),
              "Unable to set the LACP timeout on distributed switch dvSwitch0: it has no running LAG 7");
    EXPECT_EQ(FailureOf([&] { dvs->SetLacpTimeout(1, true, "pnet3"); }),
              "Unable to set the LACP timeout on distributed switch dvSwitch0: LAG 1 has no NIC pnet3");
    dvs->SetLacpTimeout(1, true, "pnet4");
    auto* groups = DVSwitch("dvSwitch0")->GetLacpGroups();
    const Gantry::Network::LacpNic& pnet4 = *(*groups)[0]->nics[0];
    const Gantry::Network::LacpNic& pnet5 = *(*groups)[0]->nics[1];
    EXPECT_STREQ(pnet4.localFlags, "FA");
    EXPECT_EQ(pnet4.portState, 61 | Gantry::Network::LACP_STATE_TIMEOUT);
    EXPECT_STREQ(pnet5.localFlags, "SA");
    EXPECT_EQ(pnet5.portState, 61);
    dvs->FreeLacpGroups(groups);
}

TEST(DistributedSwitchHost, AnOlderHostGetsWorldsForItsVmsAndTheDefaultDistributedSwitches) {
    TempHost host;
    Trellis::Host::CloseHost();
    // A host of version 4: no worlds, no distributed switches, and a VM of its own.
    sqlite3* db = nullptr;
    ASSERT_EQ(sqlite3_open(host.Path().c_str(), &db), SQLITE_OK);
    ASSERT_EQ(sqlite3_exec(db,
                           "DELETE FROM records WHERE kind IN ('world', 'vswitch.distributed', 'vswitch.dvport')"
                           "  OR (kind = 'port' AND parent = 'dvSwitch0');"
                           "UPDATE records SET data = json_remove(data, '$.worldId') WHERE kind = 'port';"
                           "UPDATE records SET data = json_set(data, '$.clientName', 'app07.eth0')"
                           "  WHERE kind = 'port' AND name = '33554438';"
                           "PRAGMA user_version = 4;",
                           nullptr, nullptr, nullptr),
              SQLITE_OK);
    sqlite3_close(db);

    host.Reopen();
    EXPECT_EQ(Section("worlds"), Json::parse(R"([{"id": 69312, "name": "web01"}, {"id": 69540, "name": "db01"},
        {"id": 1000, "name": "hostd", "system": true}, {"id": 1001, "name": "sshd", "system": true},
        {"id": 1002, "name": "ntpd", "system": true}, {"id": 69541, "name": "app07"}])"));
    Json ports = Section("ports");
    EXPECT_EQ(ports[3]["worldId"], 69541);
    EXPECT_EQ(Section("distributedSwitches").size(), 2u);
    EXPECT_EQ(ports.size(), 8u);
}

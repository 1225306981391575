// network vswitch dvs korvex list and the LACP commands: the configuration
// walked by the uplink ports with a NIC and by the uplink ports' names, the
// running groups as status and stats show them, and each host failure once.
// The default host's rows in every formatter, the refusals of unknown names
// and a timeout that the next status shows are in tests/cli/dvs.test.sh.

#include <functional>
#include <set>
#include <stdexcept>
#include <string>
#include <tuple>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "LacpGetConfig.h"
#include "LacpGetStats.h"
#include "LacpGetStatus.h"
#include "LacpSetTimeout.h"
#include "TempHost.h"
#include "VirtualSwitchDVSKorvexList.h"
#include "gantry/lib/GantryException.h"
#include "trellis/host/Description.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using Json = TempHost::Json;
using Trellis::Host::ArmFault;
using Errors = std::vector<std::string>;

namespace {

Json& Named(Json& list, const std::string& key, const Json& value) {
    for (Json& entry : list)
        if (entry[key] == value) return entry;
    throw std::runtime_error("no entry " + value.dump());
}
Json& Dvs(Json& d, const std::string& name) { return Named(d["distributedSwitches"], "name", name); }
Json& UplinkPort(Json& d, const std::string& id) { return Named(Dvs(d, "dvSwitch0")["ports"], "id", id); }

// The host's ports without those that match.
void DropPorts(Json& d, const std::function<bool(const Json&)>& match) {
    Json kept = Json::array();
    for (const Json& port : d["ports"])
        if (!match(port)) kept.push_back(port);
    d["ports"] = kept;
}

void WithoutDistributedSwitches(Json& d) {
    d["distributedSwitches"] = Json::array();
    DropPorts(d, [](const Json& port) { return port.contains("dvPort"); });
}

// dvSwitch0 with no NIC on any uplink port, and so without LAGs or running
// groups.
void WithoutUplinkNics(Json& d) {
    Json& dvs = Dvs(d, "dvSwitch0");
    for (Json& port : dvs["ports"]) port.erase("nic");
    dvs["lags"] = Json::array();
    dvs["lacpGroups"] = Json::array();
    DropPorts(d, [](const Json& port) { return port.contains("dvPort") && port["clientKind"] == "uplink"; });
}

// One NIC of a running group, whose partner shows the port state and age given.
Json LacpNic(const std::string& name, int partnerState, long long age) {
    return Json{{"name", name}, {"state", "bundled"}, {"shortTimeout", false}, {"portNumber", 1},
                {"portPriority", 255}, {"adminKey", 9}, {"operKey", 9}, {"portState", 61},
                {"partner", {{"flags", "SA"}, {"deviceId", "00:1c:73:aa:bb:01"}, {"age", age}, {"portNumber", 17},
                             {"portPriority", 32768}, {"operKey", 1}, {"portState", partnerState}}},
                {"counters", {{"rxLacpdus", 1}, {"txLacpdus", 2}, {"rxErrors", 3}, {"txErrors", 4}}}};
}

// The rows of a run as (switch, LAG id, NIC), for status and stats alike.
std::set<std::tuple<std::string, int, std::string>> NicsOfStatus(const Json& lags) {
    std::set<std::tuple<std::string, int, std::string>> nics;
    for (const Json& lag : lags)
        for (const Json& nic : lag["Nic List"]) nics.insert(std::make_tuple(lag["DVSwitch"].get<std::string>(), lag["LAG ID"].get<int>(),
                                        nic["Nic"].get<std::string>()));
    return nics;
}
std::set<std::tuple<std::string, int, std::string>> NicsOfStats(const Json& rows) {
    std::set<std::tuple<std::string, int, std::string>> nics;
    for (const Json& row : rows) nics.insert(std::make_tuple(row["DVSwitch"].get<std::string>(), row["LAG ID"].get<int>(),
                                                             row["NIC"].get<std::string>()));
    return nics;
}

void ExpectFailure(const CommandRun& run, const std::string& text) {
    EXPECT_EQ(run.errors, Errors{text});
    EXPECT_FALSE(run.HasResult());
}

}  // namespace

TEST(VirtualSwitchDVSKorvexList, ListsEachSwitchWithItsPortsOrOnlyTheOneNamed) {
    TempHost host;
    CommandRun run = RunCommand<VirtualSwitchDVSKorvexList>();
    EXPECT_EQ(run.errors, Errors{});
    Json all = run.Parsed();
    ASSERT_EQ(all.size(), 2u);
    Json dvs = all[0];
    EXPECT_EQ(dvs["Name"], "dvSwitch0");
    EXPECT_EQ(dvs["Korvex Branded"], true);
    EXPECT_EQ(dvs["Uplinks"], Json({"pnet3", "pnet4", "pnet5"}));
    ASSERT_EQ(dvs["DVPort"].size(), 12u);
    EXPECT_EQ(dvs["DVPort"][1], Json::parse(R"({"Port ID":"1","In Use":false,"DVPortgroup ID":"dvportgroup-101",
                                                 "Client":[]})"));
    EXPECT_EQ(dvs["DVPort"][11], Json::parse(R"({"Port ID":"11","In Use":true,"DVPortgroup ID":"dvportgroup-100",
                                                  "Client":["pnet5"]})"));

    run = RunCommand<VirtualSwitchDVSKorvexList>({"-v", "dvSwitch1"});
    ASSERT_EQ(run.Parsed().size(), 1u);
    EXPECT_EQ(run.Parsed()[0], all[1]);
    ExpectFailure(RunCommand<VirtualSwitchDVSKorvexList>({"--vds-name", "nosuch"}), "Unable to access all vDS");
}

TEST(VirtualSwitchDVSKorvexList, AHostWithoutDistributedSwitchesListsNothingAndAFailureDropsTheList) {
    TempHost host(WithoutDistributedSwitches);
    EXPECT_EQ(RunCommand<VirtualSwitchDVSKorvexList>().Json(), "[]");
    const std::string none = "LACP is supported on Korvex DVSwitch only, and there is no DVSwitch configured on host.";
    ExpectFailure(RunCommand<LacpGetConfig>(), none);
    ExpectFailure(RunCommand<LacpGetStatus>(), none);
    ExpectFailure(RunCommand<LacpGetStats>(), none);
    Trellis::Host::ImportHost(TempHost::Edited([](Json&) {}));
    for (const char* operation : {"VirtualSwitchInfoImpl::GetDVSwitches", "DVSwitch::GetId", "DVSwitch::GetMtu",
                                  "DVSwitch::GetBeaconTimeout", "DVSwitch::GetCdpStatus",
                                  "DVSwitchImpl::IsKorvexBranded", "DVSwitch::GetDVPorts", "DVPort::IsInUse",
                                  "DVPort::GetPortGroupId", "DVPort::GetPortId"}) {
        SCOPED_TRACE(operation);
        ArmFault({operation, "vds busy", 0, 1});
        ExpectFailure(RunCommand<VirtualSwitchDVSKorvexList>(), "vds busy");
    }
    ArmFault({"NetworkFactory::GetDVSwitchByName", "no factory", 0, 1});
    ExpectFailure(RunCommand<VirtualSwitchDVSKorvexList>({"-v", "dvSwitch0"}), "no factory");
    ArmFault({"VirtualSwitchInfoImpl::VirtualSwitchInfoImpl", "no switches", 0, 1});
    EXPECT_THROW(RunCommand<VirtualSwitchDVSKorvexList>(), Gantry::Lib::GantryException);
}

TEST(LacpGetConfig, AGroupTakesItsSettingFromItsLastPortAndALagIsEnabledWhateverItsPorts) {
    TempHost host([](Json& d) {
        UplinkPort(d, "10")["lacp"] = {{"enabled", true}, {"mode", "passive"}};  // lag1-0
        UplinkPort(d, "8")["lacp"] = {{"enabled", false}, {"mode", "active"}};   // uplink1, the last key
        Dvs(d, "dvSwitch0")["lags"].push_back(
            {{"id", "7"}, {"name", "lag7"}, {"mode", "passive"}, {"loadBalance", 20}, {"uplinkCount", 0}});
    });
    CommandRun run = RunCommand<LacpGetConfig>();
    // The field list is joined from the field names when the plug-in loads.
    EXPECT_EQ(run.hints.at("fields:LACP"), "DVS Name,LAG Name,LAG ID,NICs,Enabled,Mode,Load balance");
    Json rows = run.Parsed();
    ASSERT_EQ(rows.size(), 3u);
    EXPECT_EQ(rows[0]["NICs"], "lag1-0");
    EXPECT_EQ(rows[0]["Enabled"], false);
    EXPECT_EQ(rows[0]["Mode"], "");
    EXPECT_EQ(rows[1]["NICs"], "pnet4,pnet5");
    EXPECT_EQ(rows[1]["Enabled"], true);
    EXPECT_EQ(rows[2], Json::parse(R"({"DVS Name":"dvSwitch0","LAG Name":"lag7","LAG ID":7,"NICs":"",
                                        "Enabled":true,"Mode":"Passive","Load balance":"Src portID"})"));
}

TEST(LacpGetConfig, GoesByTheUplinkNamesWhenNoUplinkPortHasANic) {
    TempHost host([](Json& d) {
        WithoutUplinkNics(d);
        UplinkPort(d, "9")["portGroupId"] = "dvportgroup-099";
        UplinkPort(d, "9")["lacp"]["mode"] = "passive";
    });
    CommandRun run = RunCommand<LacpGetConfig>({"-s", "dvSwitch0"});
    EXPECT_EQ(run.errors, Errors{});
    // One row for each port group with LACP on, in group order; no NICs.
    EXPECT_EQ(run.Parsed(), Json::parse(R"([
        {"DVS Name":"dvSwitch0","LAG Name":"default_uplink_pg_lag","LAG ID":0,"NICs":null,"Enabled":true,
         "Mode":"Passive","Load balance":"---"},
        {"DVS Name":"dvSwitch0","LAG Name":"default_uplink_pg_lag","LAG ID":0,"NICs":null,"Enabled":true,
         "Mode":"Active","Load balance":"---"}])"));
}

TEST(LacpGetConfig, AHostFailureIsReportedWithItsTextOnEitherWalk) {
    TempHost host;
    for (const char* operation : {"VirtualSwitchInfoImpl::GetDVSwitches", "DVSwitch::GetUplinkPortParams",
                                  "NetworkFactory::GetDVPort", "DVPort::GetPortGroupId", "DVPort::GetLacpConfig",
                                  "DVSwitch::GetLagConfigs", "DVPort::GetUplinkName", "Portset::GetName"}) {
        SCOPED_TRACE(operation);
        ArmFault({operation, "lacp busy", 0, 1});
        ExpectFailure(RunCommand<LacpGetConfig>(), "lacp busy");
    }
    ArmFault({"NetworkFactory::GetDVSwitchByName", "no factory", 0, 1});
    ExpectFailure(RunCommand<LacpGetConfig>({"--dvs", "dvSwitch0"}), "no factory");

    Trellis::Host::ImportHost(TempHost::Edited(WithoutUplinkNics));
    for (const char* operation : {"DVSwitch::GetUplinkPortNames", "DVSwitch::GetUplinkPort"}) {
        SCOPED_TRACE(operation);
        ArmFault({operation, "names busy", 0, 1});
        ExpectFailure(RunCommand<LacpGetConfig>(), "names busy");
    }
}

TEST(LacpGetStatus, ShowsBothSidesOfEachNicWithStateWordsAndAge) {
    TempHost host([](Json& d) {
        Dvs(d, "dvSwitch0")["lacpGroups"] = Json::array(
            {{{"lagId", 1}, {"mode", "active"},
              {"nics", {LacpNic("pnet4", 61, 3661), LacpNic("pnet5", 0, 4294967295LL)}}},
             {{"lagId", 2}, {"mode", "passive"}, {"nics", {LacpNic("pnet3", 255, 0)}}}});
    });
    CommandRun run = RunCommand<LacpGetStatus>();
    EXPECT_EQ(run.errors, Errors{});
    Json lags = run.Parsed();
    ASSERT_EQ(lags.size(), 2u);
    EXPECT_EQ(lags[0]["DVSwitch"], "dvSwitch0");
    EXPECT_EQ(lags[0]["Mode"], "Active");
    EXPECT_EQ(lags[1]["Mode"], "Passive");
    EXPECT_EQ(lags[1]["Flags"], Json({"S - Device is sending Slow LACPDUs", "F - Device is sending fast LACPDUs",
                                      "A - Device is in active mode", "P - Device is in passive mode"}));
    EXPECT_EQ(lags[0]["Nic List"][0], Json::parse(R"({"Nic":"pnet4","State":"bundled",
        "Local Information":{"Port State":"ACT,AGG,SYN,COL,DIST,","Flags":"SA","Admin Key":9,"Oper Key":9,
                             "Port Priority":255,"Port Number":1},
        "Partner Information":{"Device ID":"00:1c:73:aa:bb:01","Port State":"ACT,AGG,SYN,COL,DIST,","Flags":"SA",
                               "Age":"01:01:01","Oper Key":1,"Port Priority":32768,"Port Number":17}})"));
    EXPECT_EQ(lags[0]["Nic List"][1]["Partner Information"]["Port State"], "");
    EXPECT_EQ(lags[0]["Nic List"][1]["Partner Information"]["Age"], "1193046:28:15");
    EXPECT_EQ(lags[1]["Nic List"][0]["Partner Information"]["Port State"], "ACT,FTO,AGG,SYN,COL,DIST,DEF,EXP,");
    EXPECT_EQ(lags[1]["Nic List"][0]["Partner Information"]["Age"], "00:00:00");
    EXPECT_EQ(run.hints.at("table-columns:PartnerInfo"), "Device ID,Port State,Flags,Age,Oper Key,Port Priority,Port Number");

    CommandRun stats = RunCommand<LacpGetStats>();
    EXPECT_EQ(stats.Parsed()[0], Json::parse(R"({"DVSwitch":"dvSwitch0","NIC":"pnet4","LAG ID":1,
        "Tx LACPDUs":2,"Tx Errors":4,"Rx LACPDUs":1,"Rx Errors":3})"));
    EXPECT_EQ(stats.hints.at("fields:LACP"), "Uplink, Tx LACPDUs, Tx Errors, Rx LACPDUs, Rx Errors");
}

TEST(LacpGetStats, CountsTheNicsOfTheGroupsThatStatusShows) {
    TempHost host;
    Json status = RunCommand<LacpGetStatus>().Parsed();
    Json stats = RunCommand<LacpGetStats>().Parsed();
    EXPECT_EQ(NicsOfStats(stats), NicsOfStatus(status));
    EXPECT_EQ(NicsOfStats(stats).size(), 3u);
    EXPECT_EQ(RunCommand<LacpGetStats>({"--dvs", "dvSwitch0"}).Json(), RunCommand<LacpGetStats>().Json());

    Trellis::Host::ImportHost(TempHost::Edited([](Json& d) {
        Dvs(d, "dvSwitch0")["lacpGroups"] = Json::array({{{"lagId", 1}, {"mode", "active"}, {"nics", Json::array()}}});
    }));
    ExpectFailure(RunCommand<LacpGetStats>(), "No pnic is connected to DVSwitch.");
    EXPECT_EQ(RunCommand<LacpGetStatus>().Parsed()[0]["Nic List"], Json::array());
}

TEST(LacpGetStatus, AFailureInsideOrAroundTheGroupsIsReportedWithItsText) {
    TempHost host;
    for (const char* operation : {"DVSwitch::GetLacpGroups", "DVSwitch::FreeLacpGroups", "Portset::GetName"}) {
        SCOPED_TRACE(operation);
        ArmFault({operation, "groups busy", 0, 1});
        ExpectFailure(RunCommand<LacpGetStatus>(), "groups busy");
        ArmFault({operation, "groups busy", 0, 1});
        ExpectFailure(RunCommand<LacpGetStats>(), "groups busy");
    }
}

TEST(LacpSetTimeout, TheHostRefusesAnUnknownSwitchAndAFailureChangesNothing) {
    TempHost host;
    const std::string before = Trellis::Host::ExportHost();
    ExpectFailure(RunCommand<LacpSetTimeout>({"-s", "nosuch", "-l", "1", "-t", "true"}),
                  "Distributed switch nosuch does not exist");
    ArmFault({"DVSwitch::SetLacpTimeout", "lacp daemon down", 0, 1});
    ExpectFailure(RunCommand<LacpSetTimeout>({"-s", "dvSwitch0", "-l", "1", "-t", "true"}), "lacp daemon down");
    ArmFault({"NetworkFactory::GetDVSwitchByName", "no factory", 0, 1});
    ExpectFailure(RunCommand<LacpSetTimeout>({"-s", "dvSwitch0", "-l", "1", "-t", "true"}), "no factory");
    EXPECT_TRUE(Trellis::Host::ExportHost() == before);
}

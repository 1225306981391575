// network nic coalesce, cso, tso, sg, pauseParams, software and ring, and
// network sriovnic: what a set changes and what it leaves, how list and get
// show the host's NICs, the unset boolean the setters deliver, and each
// command's report of a host failure. Refusals as the user sees them are in
// tests/cli/nictuning.test.sh.

#include <functional>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "InterfaceTestSupport.h"
#include "NicCoalesceGet.h"
#include "NicCoalesceSet.h"
#include "NicCsoGet.h"
#include "NicCsoSet.h"
#include "NicPauseParamsList.h"
#include "NicPauseParamsSet.h"
#include "NicRingCurrentGet.h"
#include "NicRingCurrentSet.h"
#include "NicRingPresetGet.h"
#include "NicSgGet.h"
#include "NicSgSet.h"
#include "NicSoftwareList.h"
#include "NicSoftwareSet.h"
#include "NicTsoGet.h"
#include "NicTsoSet.h"
#include "SriovNicList.h"
#include "TempHost.h"
#include "VfList.h"
#include "VfStats.h"
#include "gantry/lib/GantryException.h"
#include "plinth/cli/UsageError.h"
#include "trellis/host/Description.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using namespace InterfaceTest;
using Trellis::Host::ArmFault;

namespace {

const std::vector<std::string> kAllNics = {"pnet0", "pnet1", "pnet2", "pnet3", "pnet4", "pnet5", "pnet6"};

// What a setter delivers: the boolean it never gives a value.
void ExpectUnsetResult(const CommandRun& run) {
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "null");
}

// The one entry of a get for one NIC.
template <class Get>
Json Entry(const std::string& option, const std::string& nic) {
    return RunCommand<Get>({option, nic}).Parsed().at(0);
}

std::vector<std::string> NicsListed(const CommandRun& run) {
    std::vector<std::string> names;
    for (const Json& entry : run.Parsed()) names.push_back(entry.begin().value().get<std::string>());
    return names;
}

}  // namespace

TEST(NicOffloads, EachSetChangesItsOwnOffloadsAndLeavesTheOthers) {
    TempHost host;
    EXPECT_EQ(RunCommand<NicCsoGet>({"-n", "pnet1"}).Json(),
              R"([{"NIC":"pnet1","RX Checksum Offload":"on","TX Checksum Offload":"on"}])");
    EXPECT_EQ(RunCommand<NicTsoGet>({"-n", "pnet1"}).Json(), R"([{"NIC":"pnet1","Value":"off"}])");
    EXPECT_EQ(RunCommand<NicSgGet>({"-n", "pnet1"}).Json(), R"([{"NIC":"pnet1","Value":"on"}])");

    ExpectUnsetResult(RunCommand<NicCsoSet>({"-n", "pnet1", "-e", "0"}));
    EXPECT_EQ(Entry<NicCsoGet>("-n", "pnet1"),
              Json::parse(R"({"NIC":"pnet1","RX Checksum Offload":"off","TX Checksum Offload":"off"})"));
    EXPECT_EQ(Entry<NicTsoGet>("-n", "pnet1")["Value"], "off");
    EXPECT_EQ(Entry<NicSgGet>("-n", "pnet1")["Value"], "on");

    ExpectUnsetResult(RunCommand<NicTsoSet>({"-n", "pnet1", "-e", "1"}));
    ExpectUnsetResult(RunCommand<NicSgSet>({"-n", "pnet1", "-e", "0"}));
    EXPECT_EQ(Entry<NicTsoGet>("-n", "pnet1")["Value"], "on");
    EXPECT_EQ(Entry<NicSgGet>("-n", "pnet1")["Value"], "off");
    EXPECT_EQ(Entry<NicCsoGet>("-n", "pnet1")["RX Checksum Offload"], "off");
    // Another NIC is not touched.
    EXPECT_EQ(Entry<NicSgGet>("-n", "pnet0")["Value"], "on");
}

TEST(NicOffloads, GetWithoutANicListsEveryNicInTheHostsOrder) {
    TempHost host;
    for (const CommandRun& run : {RunCommand<NicCsoGet>(), RunCommand<NicTsoGet>(), RunCommand<NicSgGet>()})
        EXPECT_EQ(NicsListed(run), kAllNics);
    // The checksum offloads can differ, though cso set never makes them.
    EXPECT_EQ(RunCommand<NicCsoGet>().Parsed().at(5),
              Json::parse(R"({"NIC":"pnet5","RX Checksum Offload":"on","TX Checksum Offload":"off"})"));
    EXPECT_EQ(RunCommand<NicTsoGet>().Parsed().at(6)["Value"], "off");
}

TEST(NicOffloads, UnknownNicsAndValuesOutsideTheRange) {
    TempHost host;
    ExpectFailure(RunCommand<NicCsoGet>({"-n", "nope"}), "Pnic with name nope not found");
    ExpectFailure(RunCommand<NicSgSet>({"-n", "nope", "-e", "1"}), "Pnic with name nope not found");
    EXPECT_THROW(RunCommand<NicTsoSet>({"-n", "pnet0", "-e", "2"}), Plinth::Cli::UsageError);
    // The device refuses what it cannot do; disabling is always accepted.
    ExpectFailure(RunCommand<NicTsoSet>({"-n", "pnet6", "-e", "1"}),
                  "Physical NIC pnet6 does not support TCP segmentation offload");
    ExpectUnsetResult(RunCommand<NicTsoSet>({"-n", "pnet6", "-e", "0"}));
}

TEST(NicCoalesce, SetChangesTheValuesGivenAndKeepsTheRest) {
    TempHost host;
    EXPECT_EQ(RunCommand<NicCoalesceGet>({"-n", "pnet0"}).Json(),
              R"([{"NIC":"pnet0","RX microseconds":"16","RX maximum frames":"32","TX microseconds":"16",)"
              R"("TX Maximum frames":"32","Adaptive RX":"On","Adaptive TX":"Off","Sample interval seconds":"5"}])");

    ExpectUnsetResult(RunCommand<NicCoalesceSet>({"-n", "pnet0", "-t", "64"}));
    EXPECT_EQ(Entry<NicCoalesceGet>("-n", "pnet0"),
              Json::parse(R"({"NIC":"pnet0","RX microseconds":"16","RX maximum frames":"32","TX microseconds":"64",
                  "TX Maximum frames":"32","Adaptive RX":"On","Adaptive TX":"Off","Sample interval seconds":"5"})"));

    ExpectUnsetResult(RunCommand<NicCoalesceSet>(
        {"-n", "pnet0", "-r", "1", "-R", "2", "-t", "3", "-T", "4", "-a", "false", "-A", "true", "-i", "6"}));
    EXPECT_EQ(Entry<NicCoalesceGet>("-n", "pnet0"),
              Json::parse(R"({"NIC":"pnet0","RX microseconds":"1","RX maximum frames":"2","TX microseconds":"3",
                  "TX Maximum frames":"4","Adaptive RX":"Off","Adaptive TX":"On","Sample interval seconds":"6"})"));

    // Only the NIC: what was read goes back, and nothing changes.
    std::string before = Trellis::Host::ExportHost();
    ExpectUnsetResult(RunCommand<NicCoalesceSet>({"-n", "pnet0"}));
    EXPECT_EQ(Trellis::Host::ExportHost(), before);

    EXPECT_THROW(RunCommand<NicCoalesceSet>({"-n", "pnet0", "-i", "0"}), Plinth::Cli::UsageError);
    EXPECT_THROW(RunCommand<NicCoalesceSet>({"-n", "pnet0", "-i", "3601"}), Plinth::Cli::UsageError);
    ExpectFailure(RunCommand<NicCoalesceSet>({"-n", "nope", "-i", "3600"}), "Pnic with name nope not found");
    EXPECT_EQ(NicsListed(RunCommand<NicCoalesceGet>()), kAllNics);
}

TEST(NicPauseParams, ListShowsTheNegotiatedResolutionOnlyWhenBothSidesHaveOne) {
    TempHost host;
    CommandRun run = RunCommand<NicPauseParamsList>();
    EXPECT_EQ(NicsListed(run), kAllNics);
    const Json nics = run.Parsed();
    EXPECT_EQ(nics[0], Json::parse(R"({"NIC":"pnet0","Pause Params Supported":true,"Auto Negotiation":true,
        "Pause RX":true,"Pause TX":true,"Auto Negotiation Resolution Avail":true,
        "RX Auto Negotiation Resolution":true,"TX Auto Negotiation Resolution":true})"));
    // No autonegotiation: no resolution.
    ExpectFields(nics[1], R"({"Auto Negotiation":false,"Pause RX":true,"Auto Negotiation Resolution Avail":false,
        "RX Auto Negotiation Resolution":false,"TX Auto Negotiation Resolution":false})");
    // A partner that pauses only one way: resolution 2 for TX.
    ExpectFields(nics[3], R"({"Auto Negotiation Resolution Avail":true,"RX Auto Negotiation Resolution":true,
        "TX Auto Negotiation Resolution":false})");
    EXPECT_EQ(nics[5], Json::parse(R"({"NIC":"pnet5","Pause Params Supported":false,"Auto Negotiation":false,
        "Pause RX":false,"Pause TX":false,"Auto Negotiation Resolution Avail":false,
        "RX Auto Negotiation Resolution":false,"TX Auto Negotiation Resolution":false})"));
    EXPECT_EQ(RunCommand<NicPauseParamsList>({"-n", "pnet3"}).Parsed(), Json::array({nics[3]}));
    ExpectFailure(RunCommand<NicPauseParamsList>({"-n", "nope"}), "NIC with name nope not found");
}

TEST(NicPauseParams, SetChangesTheDirectionsGivenAndTheDeviceDecidesSupport) {
    TempHost host;
    ExpectUnsetResult(RunCommand<NicPauseParamsSet>({"-n", "pnet0", "-r", "false"}));
    ExpectFields(Entry<NicPauseParamsList>("-n", "pnet0"),
                 R"({"Pause RX":false,"Pause TX":true,"Auto Negotiation":true})");
    ExpectUnsetResult(RunCommand<NicPauseParamsSet>({"-n", "pnet0", "-a", "false", "-t", "false", "-r", "true"}));
    ExpectFields(Entry<NicPauseParamsList>("-n", "pnet0"),
                 R"({"Pause RX":true,"Pause TX":false,"Auto Negotiation":false})");

    // Nothing is checked before the device: pnet5 has no pause frames.
    std::string before = Trellis::Host::ExportHost();
    ExpectFailure(RunCommand<NicPauseParamsSet>({"-n", "pnet5", "-a", "true"}),
                  "Physical NIC pnet5 does not support pause frames");
    ExpectUnsetResult(RunCommand<NicPauseParamsSet>({"-n", "pnet5"}));
    EXPECT_EQ(Trellis::Host::ExportHost(), before);
    ExpectFailure(RunCommand<NicPauseParamsSet>({"-n", "nope"}), "NIC with name nope not found");
}

TEST(NicRing, GetsShowPresetsOrCurrentSizesAndSetChangesOnlyTheRingsGiven) {
    TempHost host;
    EXPECT_EQ(RunCommand<NicRingPresetGet>({"-n", "pnet5"}).Json(),
              R"({"RX":1024,"RX Mini":256,"RX Jumbo":8192,"TX":1024})");
    EXPECT_EQ(RunCommand<NicRingCurrentGet>({"-n", "pnet5"}).Json(),
              R"({"RX":512,"RX Mini":128,"RX Jumbo":4096,"TX":512})");

    ExpectUnsetResult(RunCommand<NicRingCurrentSet>({"-n", "pnet5", "-r", "1000", "-m", "200", "-j", "8000"}));
    ExpectUnsetResult(RunCommand<NicRingCurrentSet>({"-n", "pnet5", "-t", "300"}));
    EXPECT_EQ(RunCommand<NicRingCurrentGet>({"-n", "pnet5"}).Json(),
              R"({"RX":1000,"RX Mini":200,"RX Jumbo":8000,"TX":300})");

    std::string before = Trellis::Host::ExportHost();
    ExpectFailure(RunCommand<NicRingCurrentSet>({"-n", "pnet0", "-r", "8192"}),
                  "Physical NIC pnet0 cannot have a RX ring of 8192 entries: its maximum is 4096");
    EXPECT_EQ(Trellis::Host::ExportHost(), before);
    // Without a ring the device is not called: a fault armed on it stays.
    ArmFault({"Pnic::SetRingParams", "ring busy", 0, 1});
    ExpectUnsetResult(RunCommand<NicRingCurrentSet>({"-n", "pnet0"}));
    EXPECT_EQ(Trellis::Host::ListFaults().size(), 1u);

    for (const CommandRun& run : {RunCommand<NicRingPresetGet>({"-n", "nope"}),
                                  RunCommand<NicRingCurrentGet>({"-n", "nope"}),
                                  RunCommand<NicRingCurrentSet>({"-n", "nope", "-t", "1"})})
        ExpectFailure(run, "NIC with name nope not found");
}

TEST(NicSoftware, EachFlagReachesItsOwnFeatureAndLeavesTheOthers) {
    TempHost host;
    const std::vector<std::pair<std::string, std::string>> features = {
        {"ipv4cso", "IPv4 CSO"},       {"ipv4tso", "IPv4 TSO"},
        {"sg", "Scatter Gather"},      {"obo", "Offset Based Offload"},
        {"vxlanencap", "VXLAN Encap"}, {"geneveoffload", "Geneve Offload"},
        {"ipv6tso", "IPv6 TSO"},       {"ipv6tsoext", "IPv6 TSO Ext"},
        {"ipv6cso", "IPv6 CSO"},       {"ipv6csoext", "IPv6 CSO Ext"},
        {"highdma", "High DMA"},       {"sgsp", "Scatter Gather MP"},
        {"tagging", "VLAN Tagging"},   {"untagging", "VLAN Untagging"}};
    Json expected = Json::object({{"NIC", "pnet2"}});
    for (const auto& [flag, field] : features) expected[field] = "off";
    EXPECT_EQ(RunCommand<NicSoftwareList>().Parsed().at(2), expected);

    // One flag at a time: each turns on its field alone, in the field order.
    for (const auto& [flag, field] : features) {
        SCOPED_TRACE(flag);
        ExpectUnsetResult(RunCommand<NicSoftwareSet>({"-n", "pnet2", "--" + flag, "true"}));
        expected[field] = "on";
        EXPECT_EQ(RunCommand<NicSoftwareList>().Parsed().at(2), expected);
    }
    ExpectUnsetResult(RunCommand<NicSoftwareSet>({"-n", "pnet2", "--sg", "false", "--untagging", "false"}));
    expected["Scatter Gather"] = expected["VLAN Untagging"] = "off";
    EXPECT_EQ(RunCommand<NicSoftwareList>().Parsed().at(2), expected);

    const Json pnet6 = RunCommand<NicSoftwareList>().Parsed().at(6);
    ExpectFields(pnet6, R"({"IPv4 CSO":"on","IPv4 TSO":"on","Scatter Gather":"on","High DMA":"on",
        "Geneve Offload":"off","IPv6 CSO":"off"})");
    EXPECT_EQ(NicsListed(RunCommand<NicSoftwareList>()), kAllNics);
}

TEST(NicSoftware, SetWithoutAFlagCallsNoDeviceAndAnUnknownNicIsReported) {
    TempHost host;
    ArmFault({"Pnic::SetSoftwareParams", "simulation busy", 0, 1});
    ExpectUnsetResult(RunCommand<NicSoftwareSet>({"-n", "pnet0"}));
    EXPECT_EQ(Trellis::Host::ListFaults().size(), 1u);
    ExpectFailure(RunCommand<NicSoftwareSet>({"-n", "pnet0", "--obo", "true"}), "simulation busy");
    ExpectFailure(RunCommand<NicSoftwareSet>({"-n", "nope", "--obo", "true"}), "Pnic with name nope not found");
}

TEST(SriovNic, ListsTheNicsWithVirtualFunctionsAPseudoNicToo) {
    // pnet6, without a PCI device, with SR-IOV but no function.
    TempHost host([](Json& d) { d["nics"][6]["sriov"] = {{"virtualFunctions", Json::array()}}; });
    EXPECT_EQ(RunCommand<SriovNicList>().Json(),
              R"([{"Name":"pnet1","PCI Device":"0000:03:00.1","Driver":"ixgbe","Link":"Up","Speed":10000,)"
              R"("Duplex":"Full","MAC Address":"a0:36:9f:1c:2e:41","MTU":1500,)"
              R"("Description":"Intel Corporation 82599 10 Gigabit Dual Port Network Connection"},)"
              R"({"Name":"pnet6","PCI Device":"Pseudo","Driver":"hvnet","Link":"Up","Speed":10000,)"
              R"("Duplex":"Full","MAC Address":"00:50:56:00:00:06","MTU":1500,"Description":"Unknown Unknown"}])");
    EXPECT_EQ(RunCommand<VfList>({"-n", "pnet6"}).Json(), "[]");
}

TEST(SriovNicVf, ListsTheFunctionsAndCountsOneOfThem) {
    // Counters numbered 1 to 20 in their order, so none can stand for another.
    TempHost host([](Json& d) {
        int n = 0;
        for (auto& [name, value] : d["nics"][1]["sriov"]["virtualFunctions"][2]["counters"].items()) value = ++n;
    });
    EXPECT_EQ(RunCommand<VfList>({"-n", "pnet1"}).Json(),
              R"([{"VF ID":0,"Active":true,"PCI Address":"0000:03:10.1","Owner World ID":"69312"},)"
              R"({"VF ID":1,"Active":true,"PCI Address":"0000:03:10.3","Owner World ID":""},)"
              R"({"VF ID":2,"Active":false,"PCI Address":"0000:03:10.5","Owner World ID":""},)"
              R"({"VF ID":3,"Active":false,"PCI Address":"0000:03:10.7","Owner World ID":""}])");
    EXPECT_EQ(RunCommand<VfStats>({"-n", "pnet1", "-v", "2"}).Json(),
              R"([{"NIC Name":"pnet1","VF ID":2,"Rx Unicast Pkt":1,"Rx Unicast Bytes":2,"Rx Multicast Pkts":3,)"
              R"("Rx Multicast Bytes":4,"Rx Broadcast Pkts":5,"Rx Broadcast Bytes":6,"Rx Out of Buffer drops":7,)"
              R"("Rx Error drops":8,"Rx LRO Pkts":9,"Rx LRO Bytes":10,"Tx Unicast Pkt":11,"Tx Unicast Bytes":12,)"
              R"("Tx Multicast Pkts":13,"Tx Multicast Bytes":14,"Tx Broadcast Pkts":15,"Tx Broadcast Bytes":16,)"
              R"("Tx Errors":17,"Tx Discards":18,"Tx TSO Pkts":19,"Tx TSO Bytes":20}])");
    ExpectFields(RunCommand<VfStats>({"-n", "pnet1", "-v", "0"}).Parsed().at(0),
                 R"({"VF ID":0,"Rx Unicast Pkt":432000,"Tx TSO Bytes":47997000})");
    ExpectFields(RunCommand<VfStats>({"-n", "pnet1", "-v", "3"}).Parsed().at(0),
                 R"({"VF ID":3,"Rx Unicast Pkt":0,"Tx TSO Bytes":0})");

    // The id is read as text, up to its first character that is no digit.
    boost::shared_ptr<Plinth::CallSpec::Input> input = Plinth::CallSpec::Input::New();
    input->SetString("nic-name", "pnet1");
    input->SetString("vf-id", "1st");
    ExpectFields(RunCommandOn<VfStats>(input).Parsed().at(0), R"({"VF ID":1,"Rx Unicast Pkt":1080})");
}

TEST(SriovNicVf, UnknownNicsAndFunctions) {
    TempHost host;
    for (const CommandRun& run : {RunCommand<VfList>({"-n", "pnet0"}), RunCommand<VfStats>({"-n", "pnet0", "-v", "0"})})
        ExpectFailure(run, "There is no SRIOV Nic with name pnet0");
    ExpectFailure(RunCommand<VfStats>({"-n", "pnet1", "-v", "9"}),
                  "Unable to get VF Stats. Error:Physical NIC pnet1 has no virtual function 9");
}

TEST(NicTuning, EachCommandReportsAHostFailureInItsOwnWords) {
    TempHost host;
    struct Case {
        const char* operation;
        std::function<CommandRun()> run;
        std::string text;
    };
    const std::vector<Case> cases = {
        // One NIC that fails ends the listing: no partial list.
        {"Pnic::GetOffloadParams", [] { return RunCommand<NicCsoGet>(); }, "device busy"},
        {"Pnic::SetOffloadParams", [] { return RunCommand<NicTsoSet>({"-n", "pnet0", "-e", "0"}); }, "device busy"},
        {"Pnic::GetOffloadParams", [] { return RunCommand<NicSgSet>({"-n", "pnet0", "-e", "0"}); }, "device busy"},
        {"Pnic::GetCoalesceParams", [] { return RunCommand<NicCoalesceGet>(); }, "device busy"},
        {"Pnic::SetCoalesceParams", [] { return RunCommand<NicCoalesceSet>({"-n", "pnet0"}); }, "device busy"},
        {"Pnic::GetPauseParams", [] { return RunCommand<NicPauseParamsList>({"-n", "pnet0"}); }, "device busy"},
        {"Pnic::SetPauseParams", [] { return RunCommand<NicPauseParamsSet>({"-n", "pnet0"}); }, "device busy"},
        {"Pnic::GetRingParams", [] { return RunCommand<NicRingPresetGet>({"-n", "pnet0"}); }, "device busy"},
        {"Pnic::SetRingParams", [] { return RunCommand<NicRingCurrentSet>({"-n", "pnet0", "-t", "8"}); },
         "device busy"},
        {"Pnic::GetSoftwareParams", [] { return RunCommand<NicSoftwareList>(); }, "device busy"},
        {"NetworkInfoImpl::GetPnicByName", [] { return RunCommand<NicRingCurrentGet>({"-n", "pnet0"}); },
         "device busy"},
        {"NetworkInfoImpl::GetSriovNics", [] { return RunCommand<SriovNicList>(); },
         "Unable to list NICs.  Error was device busy"},
        {"Pnic::GetMacAddress", [] { return RunCommand<SriovNicList>(); },
         "Unable to list NICs.  Error was device busy"},
        {"NetworkInfoImpl::GetSriovNicVFInfo", [] { return RunCommand<VfList>({"-n", "pnet1"}); },
         "Unable to get VF Info. Error:device busy"},
        {"NetworkInfoImpl::GetSriovNicByName", [] { return RunCommand<VfStats>({"-n", "pnet1", "-v", "0"}); },
         "Unable to get VF Stats. Error:device busy"},
    };
    const std::string before = Trellis::Host::ExportHost();
    for (const Case& c : cases) {
        SCOPED_TRACE(c.operation);
        ArmFault({c.operation, "device busy", 0, 1});
        ExpectFailure(c.run(), c.text);
    }
    EXPECT_EQ(Trellis::Host::ExportHost(), before);

    // The first object of each command is made before its failures are
    // handled: its failure leaves the command.
    ArmFault({"NetworkFactory::GetNetworkInfo", "no inventory", 0, 1});
    EXPECT_THROW(RunCommand<NicPauseParamsList>(), Gantry::Lib::GantryException);
    ArmFault({"NetworkInfoImpl::NetworkInfoImpl", "no inventory", 0, 1});
    EXPECT_THROW(RunCommand<NicCsoGet>(), Gantry::Lib::GantryException);
}

// Both lists are joined from the tables their commands share with their
// parameters and fields; the columns must still read so, in this order.
TEST(NicTuning, JoinedFieldListsReadAsTheColumnsUsersSee) {
    EXPECT_EQ(NicCoalesceGet::New()->GetDefaultOutputFormatParameters()["fields:CoalesceParams"],
              "NIC,RX microseconds,RX maximum frames,TX microseconds,TX Maximum frames,Adaptive RX,Adaptive TX,Sample interval seconds");
    EXPECT_EQ(NicSoftwareList::New()->GetDefaultOutputFormatParameters()["fields:Settings"],
              "NIC,IPv4 CSO,IPv4 TSO,Scatter Gather,Offset Based Offload,VXLAN Encap,Geneve Offload,IPv6 TSO,IPv6 TSO Ext,IPv6 CSO,IPv6 CSO Ext,High DMA,Scatter Gather MP,VLAN Tagging,VLAN Untagging");
}

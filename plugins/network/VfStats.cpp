#include "VfStats.h"

#include <cstdint>
#include <cstdlib>
#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/SriovNic.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kNicName = Parameter::String("nic-name", "n",
                                             "The name of the SRIOV NIC. This must be one of the cards listed in "
                                             "the sriovNic list command.")
                               .Required();
// Read as text and converted, though it is declared an int.
const Parameter kVfId = Parameter::Int("vf-id", "v",
                                       "The VF ID of the virtual function whose stats are to be collected. This "
                                       "must be one of the VF IDs listed in the sriovnic vf list command.")
                            .Required();

using Gantry::Network::SriovNicVFStats;

// The counter fields, RX then TX, each with its counter.
struct Counter {
    char const* field;
    std::uint64_t SriovNicVFStats::*value;
};
const Counter kCounters[] = {
    {"Rx Unicast Pkt", &SriovNicVFStats::rxUnicastPkts},
    {"Rx Unicast Bytes", &SriovNicVFStats::rxUnicastBytes},
    {"Rx Multicast Pkts", &SriovNicVFStats::rxMulticastPkts},
    {"Rx Multicast Bytes", &SriovNicVFStats::rxMulticastBytes},
    {"Rx Broadcast Pkts", &SriovNicVFStats::rxBroadcastPkts},
    {"Rx Broadcast Bytes", &SriovNicVFStats::rxBroadcastBytes},
    {"Rx Out of Buffer drops", &SriovNicVFStats::rxOutOfBufferDrops},
    {"Rx Error drops", &SriovNicVFStats::rxErrorDrops},
    {"Rx LRO Pkts", &SriovNicVFStats::rxLroPkts},
    {"Rx LRO Bytes", &SriovNicVFStats::rxLroBytes},
    {"Tx Unicast Pkt", &SriovNicVFStats::txUnicastPkts},
    {"Tx Unicast Bytes", &SriovNicVFStats::txUnicastBytes},
    {"Tx Multicast Pkts", &SriovNicVFStats::txMulticastPkts},
    {"Tx Multicast Bytes", &SriovNicVFStats::txMulticastBytes},
    {"Tx Broadcast Pkts", &SriovNicVFStats::txBroadcastPkts},
    {"Tx Broadcast Bytes", &SriovNicVFStats::txBroadcastBytes},
    {"Tx Errors", &SriovNicVFStats::txErrors},
    {"Tx Discards", &SriovNicVFStats::txDiscards},
    {"Tx TSO Pkts", &SriovNicVFStats::txTsoPkts},
    {"Tx TSO Bytes", &SriovNicVFStats::txTsoBytes},
};

}  // namespace

VfStats::VfStats() {
    SetDescription("Get statistics for given VF of a SRIOV NIC.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    // Neither hint names the structure VfStats, so neither applies.
    SetDefaultOutputParameter("header:VF", "Statistics for %vf% VF of %NIC Name%");
    SetDefaultOutputParameter(
        "fields:VFStats",
        "Rx Unicast Pkt,Rx Unicast Bytes,Rx Multicast Pkts,Rx Multicast Bytes,Rx Broadcast Pkts,Rx Broadcast Bytes,"
        "Rx Out of Buffer drops,Rx Error drops,Rx LRO Pkts,Rx LRO Bytes,Tx Unicast Pkt,Tx Unicast Bytes,"
        "Tx Multicast Pkts,Tx Multicast Bytes,Tx Broadcast Pkts,Tx Broadcast Bytes,Tx Errors,Tx Discards,"
        "Tx TSO Pkts,Tx TSO Bytes");
}

boost::shared_ptr<InputSpec> VfStats::GetInputSpecInternal() { return InputSpecOf(kNicName, kVfId); }

boost::shared_ptr<OutputSpec> VfStats::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> VfStats::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("VfStats");
    result->SetField("NIC Name", MetaString::New());
    result->SetField("VF ID", MetaInt::New());
    for (Counter const& counter : kCounters) result->SetField(counter.field, MetaInt::New());
    return result;
}

void VfStats::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        std::string name = input->GetString(kNicName);
        int vfId = static_cast<int>(std::strtol(input->GetString(kVfId).c_str(), nullptr, 10));
        // Only asked whether the NIC is one.
        if (!std::unique_ptr<Gantry::Network::Pnic>(networkInfo.GetSriovNicByName(name))) {
            output->SetError("There is no SRIOV Nic with name " + name);
            return;
        }
        Gantry::Network::SriovNicVFStats stats;
        networkInfo.GetSriovNicVFStats(&stats, name, vfId);
        boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
        entry->SetField("NIC Name", name);
        entry->SetField("VF ID", vfId);
        for (Counter const& counter : kCounters)
            entry->SetField(counter.field, static_cast<long long>(stats.*counter.value));
        result->AddMetaStruct(entry);
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Unable to get VF Stats. Error:" + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

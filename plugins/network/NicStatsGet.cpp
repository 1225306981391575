#include "NicStatsGet.h"

#include <cstdint>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/PnicStats.h"
#include "trellis/network/PnicImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

using Gantry::Network::PnicStats;

const Parameter kNicName = Parameter::String("nic-name", "n", "Name of the NIC to get statistics from.").Required();

// A counter field of the result with its counter.
struct Counter {
    const char* title;
    std::uint64_t PnicStats::*counter;
};

// In the structure's order.
constexpr Counter kCounters[] = {
    {"Packets received", &PnicStats::rxPackets},
    {"Packets sent", &PnicStats::txPackets},
    {"Bytes received", &PnicStats::rxBytes},
    {"Bytes sent", &PnicStats::txBytes},
    {"Receive packets dropped", &PnicStats::rxDropped},
    {"Transmit packets dropped", &PnicStats::txDropped},
    {"Multicast packets received", &PnicStats::rxMulticast},
    {"Broadcast packets received", &PnicStats::rxBroadcast},
    {"Multicast packets sent", &PnicStats::txMulticast},
    {"Broadcast packets sent", &PnicStats::txBroadcast},
    {"Total receive errors", &PnicStats::rxErrors},
    {"Receive length errors", &PnicStats::rxLengthErrors},
    {"Receive over errors", &PnicStats::rxOverErrors},
    {"Receive CRC errors", &PnicStats::rxCrcErrors},
    {"Receive frame errors", &PnicStats::rxFrameErrors},
    {"Receive FIFO errors", &PnicStats::rxFifoErrors},
    {"Receive missed errors", &PnicStats::rxMissedErrors},
    {"Total transmit errors", &PnicStats::txErrors},
    {"Transmit aborted errors", &PnicStats::txAbortedErrors},
    {"Transmit carrier errors", &PnicStats::txCarrierErrors},
    {"Transmit FIFO errors", &PnicStats::txFifoErrors},
    {"Transmit heartbeat errors", &PnicStats::txHeartbeatErrors},
    {"Transmit window errors", &PnicStats::txWindowErrors},
};

}  // namespace

NicStatsGet::NicStatsGet() {
    SetDescription("Get NIC statistics for a given interface.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:Nic", "NIC statistics for %NIC Name%");
    SetDefaultOutputParameter(
        "fields:Nic",
        "Packets received,Packets sent,Bytes received,Bytes sent,Receive packets dropped,Transmit packets dropped,"
        "Multicast packets received,Broadcast packets received,Multicast packets sent,Broadcast packets sent,"
        "Total receive errors,Receive length errors,Receive over errors,Receive CRC errors,Receive frame errors,"
        "Receive FIFO errors,Receive missed errors,Total transmit errors,Transmit aborted errors,"
        "Transmit carrier errors,Transmit FIFO errors,Transmit heartbeat errors,Transmit window errors");
}

boost::shared_ptr<InputSpec> NicStatsGet::GetInputSpecInternal() { return InputSpecOf(kNicName); }

boost::shared_ptr<OutputSpec> NicStatsGet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> NicStatsGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("Nic");
    result->SetField("NIC Name", MetaString::New());
    for (auto const& [title, counter] : kCounters) result->SetField(title, MetaInt::New());
    return result;
}

void NicStatsGet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        // A handle on the name: an unknown NIC fails at its first operation.
        Trellis::Network::PnicImpl pnic(input->GetString(kNicName));
        PnicStats stats{};
        pnic.GetPnicStats(stats);
        boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
        entry->SetField("NIC Name", pnic.GetName());
        for (auto const& [title, counter] : kCounters) entry->SetField(title, stats.*counter);
        result->AddMetaStruct(entry);
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Unable to get stats for NIC: " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

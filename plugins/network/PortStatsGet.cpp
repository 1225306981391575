#include "PortStatsGet.h"

#include <cstdint>
#include <cstdlib>

#include "CommandSupport.h"
#include "PortWalk.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPortId = Parameter::Int("portid", "p", "Port ID for the port to get statistics.").Required();

// The host's counters are unsigned 64 but stay below 2^63.
long long Counter(std::uint64_t value) { return static_cast<long long>(value); }

}  // namespace

PortStatsGet::PortStatsGet() {
    SetDescription("Packet statistics for a given port.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:Port", "Packet statistics for port %Port ID%");
    SetDefaultOutputParameter("fields:Port",
                              "Packets received,Packets sent,Bytes received,Bytes sent,Broadcast packets received,"
                              "Broadcast packets sent,Multicast packets received,Multicast packets sent,"
                              "Unicast packets received,Unicast packets sent,Receive packets dropped,"
                              "Transmit packets dropped");
}

boost::shared_ptr<InputSpec> PortStatsGet::GetInputSpecInternal() { return InputSpecOf(kPortId); }

boost::shared_ptr<OutputSpec> PortStatsGet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> PortStatsGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("Port");
    result->SetField("Port ID", MetaInt::New());
    result->SetField("Packets received", MetaInt::New());
    result->SetField("Packets sent", MetaInt::New());
    result->SetField("Bytes received", MetaInt::New());
    result->SetField("Bytes sent", MetaInt::New());
    result->SetField("Broadcast packets received", MetaInt::New());
    result->SetField("Broadcast packets sent", MetaInt::New());
    result->SetField("Multicast packets received", MetaInt::New());
    result->SetField("Multicast packets sent", MetaInt::New());
    result->SetField("Unicast packets received", MetaInt::New());
    result->SetField("Unicast packets sent", MetaInt::New());
    result->SetField("Receive packets dropped", MetaInt::New());
    result->SetField("Transmit packets dropped", MetaInt::New());
    return result;
}

void PortStatsGet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        long portId = std::strtol(input->GetString(kPortId).c_str(), nullptr, 10);
        bool found = WithPort(vswitchInfo, portId, [&](Trellis::Network::PortImpl& port) {
            Trellis::Network::PortByteStats bytes;
            Trellis::Network::PortPacketStats packets{};
            port.GetByteStats(bytes);
            port.GetPacketStats(packets);
            // What is neither broadcast nor multicast, in unsigned arithmetic.
            std::uint64_t unicastReceived = packets.packetsReceived - (packets.broadcastReceived + packets.multicastReceived);
            std::uint64_t unicastSent = packets.packetsSent - (packets.broadcastSent + packets.multicastSent);
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("Port ID", port.GetPortId());
            entry->SetField("Packets received", Counter(packets.packetsReceived));
            entry->SetField("Packets sent", Counter(packets.packetsSent));
            entry->SetField("Bytes received", Counter(bytes.bytesReceived));
            entry->SetField("Bytes sent", Counter(bytes.bytesSent));
            entry->SetField("Broadcast packets received", Counter(packets.broadcastReceived));
            entry->SetField("Broadcast packets sent", Counter(packets.broadcastSent));
            entry->SetField("Multicast packets received", Counter(packets.multicastReceived));
            entry->SetField("Multicast packets sent", Counter(packets.multicastSent));
            entry->SetField("Unicast packets received", Counter(unicastReceived));
            entry->SetField("Unicast packets sent", Counter(unicastSent));
            entry->SetField("Receive packets dropped", Counter(packets.receiveDropped));
            entry->SetField("Transmit packets dropped", Counter(packets.transmitDropped));
            result->AddMetaStruct(entry);
        });
        if (!found) {
            output->SetError("Couldn't find requested port");
            return;
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Unable to get stats for port: " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

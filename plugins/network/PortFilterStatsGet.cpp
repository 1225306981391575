#include "PortFilterStatsGet.h"

#include <algorithm>
#include <cstdint>
#include <cstdlib>

#include "CommandSupport.h"
#include "PortWalk.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

using Gantry::Network::FilterStats;

const Parameter kPortId = Parameter::Int("portid", "p", "Port ID for the port to get filter statistics.").Required();

// The host's counters are unsigned 64 but stay below 2^63.
long long Counter(std::uint64_t value) { return static_cast<long long>(value); }

// What a VM receives an uplink sends: the direction turns round at an uplink.
const char* Direction(FilterStats const& filter, Trellis::Network::PortImpl& port) {
    bool uplink = port.GetClientType() == Trellis::Network::PortImpl::CLIENT_TYPE_UPLINK;
    if (filter.reversePath) return uplink ? "Receive" : "Transmit";
    return uplink ? "Transmit" : "Receive";
}

}  // namespace

bool sortFilterStats(FilterStats* a, FilterStats* b) {
    if (a->reversePath != b->reversePath) return !a->reversePath;
    return a->reversePath ? b->groupName < a->groupName : a->groupName < b->groupName;
}

PortFilterStatsGet::PortFilterStatsGet() {
    SetDescription("Filter statistics for a given port.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:Filter", "Filter statistics for %Filter name%");
    SetDefaultOutputParameter("fields:Filter",
                              "Filter direction,Packets in,Packets out,Packets dropped,Packets filtered,"
                              "Packets faulted,Packets queued,Packets injected,Packet errors");
}

boost::shared_ptr<InputSpec> PortFilterStatsGet::GetInputSpecInternal() { return InputSpecOf(kPortId); }

boost::shared_ptr<OutputSpec> PortFilterStatsGet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> PortFilterStatsGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("Filter");
    result->SetField("Filter name", MetaString::New());
    result->SetField("Filter direction", MetaString::New());
    result->SetField("Packets in", MetaInt::New());
    result->SetField("Packets out", MetaInt::New());
    result->SetField("Packets dropped", MetaInt::New());
    result->SetField("Packets filtered", MetaInt::New());
    result->SetField("Packets faulted", MetaInt::New());
    result->SetField("Packets queued", MetaInt::New());
    result->SetField("Packets injected", MetaInt::New());
    result->SetField("Packet errors", MetaInt::New());
    return result;
}

void PortFilterStatsGet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        long portId = std::strtol(input->GetString(kPortId).c_str(), nullptr, 10);
        bool found = WithPort(vswitchInfo, portId, [&](Trellis::Network::PortImpl& port) {
            OwnedVector<FilterStats> filters(port.GetFilterStats());
            std::stable_sort(filters.Items().begin(), filters.Items().end(), sortFilterStats);
            for (FilterStats* filter : filters) {
                if (!filter->active) continue;
                boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
                entry->SetField("Filter name", filter->name);
                entry->SetField("Filter direction", Direction(*filter, port));
                entry->SetField("Packets in", Counter(filter->packetsIn));
                entry->SetField("Packets out", Counter(filter->packetsOut));
                entry->SetField("Packets dropped", Counter(filter->packetsDropped));
                if (filter->hasExtendedCounters) {
                    entry->SetField("Packets filtered", Counter(filter->packetsFiltered));
                    entry->SetField("Packets faulted", Counter(filter->packetsFaulted));
                    entry->SetField("Packets queued", Counter(filter->packetsQueued));
                    entry->SetField("Packets injected", Counter(filter->packetsInjected));
                    entry->SetField("Packet errors", Counter(filter->packetErrors));
                }
                result->AddMetaStruct(entry);
            }
        });
        if (!found) {
            output->SetError("Couldn't find requested port");
            return;
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Unable to get filter stats for port: " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

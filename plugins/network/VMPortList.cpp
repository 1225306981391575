#include "VMPortList.h"

#include <algorithm>
#include <cstdlib>
#include <memory>
#include <string>
#include <vector>

#include "CommandSupport.h"
#include "PortWalk.h"
#include "gantry/network/FilterStats.h"
#include "trellis/network/PnicImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kWorldId = Parameter::Int("world-id", "w", "World ID of the VM for listing ports.").Required();

// The port of the NIC, or 0 when the NIC has none.
long long UplinkPortId(Trellis::Network::PnicImpl& pnic) {
    try {
        std::unique_ptr<Trellis::Network::PortImpl> uplinkPort(pnic.GetUplinkPort());
        return uplinkPort->GetPortId();
    } catch (GantryException&) {
        return 0;
    }
}

// The filters that are active on either path, each once, in the order of
// their first record.
std::vector<std::string> ActiveFilters(Trellis::Network::PortImpl& port) {
    OwnedVector<Gantry::Network::FilterStats> stats(port.GetFilterStats());
    std::vector<std::string> names;
    for (Gantry::Network::FilterStats* filter : stats)
        if (filter->active && std::find(names.begin(), names.end(), filter->name) == names.end())
            names.push_back(filter->name);
    return names;
}

}  // namespace

VMPortList::VMPortList() {
    SetDescription("List of active ports for a given VM.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter(
        "fields:Port",
        "Port ID,vSwitch,Portgroup,DVPort ID,MAC Address,IP Address,Team Uplink,Uplink Port ID,Active Filters");
}

boost::shared_ptr<InputSpec> VMPortList::GetInputSpecInternal() { return InputSpecOf(kWorldId); }

boost::shared_ptr<OutputSpec> VMPortList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> VMPortList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("Port");
    result->SetField("Port ID", MetaInt::New());
    result->SetField("vSwitch", MetaString::New());
    result->SetField("Portgroup", MetaString::New());
    result->SetField("DVPort ID", MetaString::New());
    result->SetField("MAC Address", MetaString::New());
    result->SetField("IP Address", MetaString::New());
    result->SetField("Team Uplink", MetaString::New());
    result->SetField("Uplink Port ID", MetaInt::New());
    result->SetField("Active Filters", MetaList::New(Plinth::MetaObj::META_STRING));
    return result;
}

void VMPortList::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        // World 0 owns no port: it matches the uplinks and kernel interfaces.
        long worldId = std::strtol(input->GetString(kWorldId).c_str(), nullptr, 10);
        bool found = false;
        WalkSwitchPorts(vswitchInfo, [&](WalkedSwitch& walked, Trellis::Network::PortImpl& port) {
            if (port.GetWorldId() != worldId) return true;
            found = true;
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("Port ID", port.GetPortId());
            entry->SetField("vSwitch", walked.name);
            entry->SetField("Portgroup", NetworkOfPort(walked, port));
            entry->SetField("DVPort ID", walked.distributed ? port.GetDVPortId() : std::string());
            entry->SetField("MAC Address", port.GetMacAddresses().at(0).GetStringAddress());
            entry->SetField("IP Address", port.GetIpv4Address().GetStringAddress());
            Trellis::Network::PnicImpl teamUplink(port.GetTeamUplink());
            entry->SetField("Team Uplink", teamUplink.GetName());
            entry->SetField("Uplink Port ID", UplinkPortId(teamUplink));
            entry->SetField("Active Filters", ActiveFilters(port));
            result->AddMetaStruct(entry);
            return true;
        });
        if (!found) {
            output->SetError("Couldn't find VM with given world ID");
            return;
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Unable to list ports for VM: " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

#include "VMList.h"

#include <cstdint>
#include <map>
#include <string>
#include <vector>

#include "CommandSupport.h"
#include "PortWalk.h"
#include "trellis/resource/WorldImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

VMList::VMList() {
    SetDescription("List networking information for the VM's that have active ports.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:VM", "World ID,Name,Num Ports,Networks");
}

boost::shared_ptr<InputSpec> VMList::GetInputSpecInternal() { return InputSpec::New(); }

boost::shared_ptr<OutputSpec> VMList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> VMList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("VM");
    result->SetField("World ID", MetaInt::New());
    result->SetField("Name", MetaString::New());
    result->SetField("Num Ports", MetaInt::New());
    result->SetField("Networks", MetaList::New(Plinth::MetaObj::META_STRING));
    return result;
}

void VMList::ExecuteInternal(boost::shared_ptr<Input> /*input*/, boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        // Each VM's networks, one for each of its ports.
        std::map<std::int32_t, std::vector<std::string>> networksOfWorld;
        WalkSwitchPorts(vswitchInfo, [&](WalkedSwitch& walked, Trellis::Network::PortImpl& port) {
            int worldId = port.GetWorldId();
            if (worldId != 0) networksOfWorld[worldId].push_back(NetworkOfPort(walked, port));
            return true;
        });
        for (auto const& [worldId, networks] : networksOfWorld) {
            Trellis::Resource::WorldImpl world(static_cast<std::uint64_t>(worldId));
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("World ID", worldId);
            // Without the marker ahead of the VM's name (std::out_of_range on
            // a shorter text).
            entry->SetField("Name", world.GetWorldName().substr(5));
            entry->SetField("Num Ports", static_cast<long long>(networks.size()));
            entry->SetField("Networks", networks);
            result->AddMetaStruct(entry);
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Unable to list VM's: " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

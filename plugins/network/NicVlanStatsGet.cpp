#include "NicVlanStatsGet.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "NicUplinkSwitch.h"
#include "gantry/network/PnicStats.h"

namespace KorvexCli {
namespace NetworkNamespace {

NicVlanStatsGet::NicVlanStatsGet() {
    SetDescription("List VLAN statistics for active VLAN's on the NIC.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:NIC", "VLAN %VLAN ID%");
    SetDefaultOutputParameter("fields:NIC", "Packets received,Packets sent");
}

boost::shared_ptr<InputSpec> NicVlanStatsGet::GetInputSpecInternal() { return InputSpecOf(kVlanStatsNicName); }

boost::shared_ptr<OutputSpec> NicVlanStatsGet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> NicVlanStatsGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("NIC");
    result->SetField("VLAN ID", MetaInt::New());
    result->SetField("Packets received", MetaInt::New());
    result->SetField("Packets sent", MetaInt::New());
    return result;
}

void NicVlanStatsGet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        std::string name = input->GetString(kVlanStatsNicName);
        std::unique_ptr<Trellis::Network::PortsetImpl> uplinkSwitch;
        switch (FindUplinkSwitch(vswitchInfo, name, uplinkSwitch)) {
        case UplinkSearch::OutOfMemory:
            output->SetError("Unable to get VLAN stats: Out of memory");
            return;
        case UplinkSearch::NotFound:
            output->SetError(NotAnUplinkText(name));
            return;
        case UplinkSearch::Found:
            break;
        }
        // Empty while the switch collects no VLAN counters.
        OwnedVector<Gantry::Network::VlanStats> vlans(uplinkSwitch->GetUplinkVlanStats(name));
        for (Gantry::Network::VlanStats* vlan : vlans) {
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("VLAN ID", vlan->vlanId);
            entry->SetField("Packets received", vlan->rxPackets);
            entry->SetField("Packets sent", vlan->txPackets);
            result->AddMetaStruct(entry);
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Unable to get VLAN stats: " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

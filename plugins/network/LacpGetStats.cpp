#include "LacpGetStats.h"

#include <cstddef>
#include <cstring>
#include <string>

#include "CommandSupport.h"
#include "LacpSwitches.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

using Gantry::Network::LacpGroup;
using Gantry::Network::LacpNic;

const char* const kSource = "plugins/network/LacpGetStats";

}  // namespace

LacpGetStats::LacpGetStats() {
    SetDescription("Get LACP stats on DVS uplinks");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:LACP", "Uplink, Tx LACPDUs, Tx Errors, Rx LACPDUs, Rx Errors");
}

boost::shared_ptr<InputSpec> LacpGetStats::GetInputSpecInternal() { return InputSpecOf(kLacpSwitchName); }

boost::shared_ptr<OutputSpec> LacpGetStats::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> LacpGetStats::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("LACPStats");
    result->SetField("DVSwitch", MetaString::New());
    result->SetField("NIC", MetaString::New());
    result->SetField("LAG ID", MetaInt::New());
    result->SetField("Tx LACPDUs", MetaInt::New());
    result->SetField("Tx Errors", MetaInt::New());
    result->SetField("Rx LACPDUs", MetaInt::New());
    result->SetField("Rx Errors", MetaInt::New());
    return result;
}

void LacpGetStats::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        OwnedVector<Gantry::Network::DVSwitch> switches;
        if (!FindLacpSwitches(*input, *output, switches)) return;
        std::size_t groups = 0;
        std::size_t nics = 0;
        for (Gantry::Network::DVSwitch* dvSwitch : switches) {
            if (dvSwitch == nullptr) continue;
            groups += ForEachLacpGroup(*dvSwitch, kSource, __LINE__, [&](LacpGroup& group) {
                for (LacpNic* nic : group.nics) {
                    boost::shared_ptr<MetaStruct> row = GetOutputStructure();
                    row->SetField("DVSwitch", dvSwitch->GetName());
                    row->SetField("NIC", std::string(nic->name, strnlen(nic->name, sizeof nic->name)));
                    row->SetField("LAG ID", static_cast<long long>(group.lagId));
                    row->SetField("Tx LACPDUs", static_cast<long long>(nic->txLacpdus));
                    row->SetField("Tx Errors", static_cast<long long>(nic->txErrors));
                    row->SetField("Rx LACPDUs", static_cast<long long>(nic->rxLacpdus));
                    row->SetField("Rx Errors", static_cast<long long>(nic->rxErrors));
                    result->AddMetaStruct(row);
                }
                nics += group.nics.size();
            });
        }
        if (groups == 0) {
            output->SetError("No running LACP group on the host.");
            return;
        }
        if (nics == 0) {
            output->SetError("No pnic is connected to DVSwitch.");
            return;
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

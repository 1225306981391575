#include "NicRegisterDump.h"

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "CommandSupport.h"
#include "NicDumpRows.h"
#include "gantry/network/Pnic.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPnet = Parameter::String("pnet", "n", "The name of pnic to dump registers").Required();

const std::size_t kValuesPerRow = 16;

}  // namespace

NicRegisterDump::NicRegisterDump() {
    SetDescription("Dump device registers");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:RegisterDump", "Offset,Value");
}

boost::shared_ptr<InputSpec> NicRegisterDump::GetInputSpecInternal() { return InputSpecOf(kPnet); }

boost::shared_ptr<OutputSpec> NicRegisterDump::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> NicRegisterDump::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("RegisterDump");
    result->SetField("Offset", MetaString::New());
    result->SetField("Value", MetaString::New());
    return result;
}

void NicRegisterDump::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        std::string name = input->GetString(kPnet);
        std::unique_ptr<Gantry::Network::Pnic> pnic(networkInfo.GetPnicByName(name));
        if (!pnic) {
            output->SetError("Pnic with name " + name + " not found");
            return;
        }
        std::vector<std::uint32_t> registers;
        pnic->GetRegisterDump(registers);
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        // Rows of 16 whole registers; the offset counts registers, not bytes.
        for (std::size_t first = 0; first < registers.size(); first += kValuesPerRow) {
            std::string values;
            for (std::size_t i = first; i < registers.size() && i < first + kValuesPerRow; ++i)
                values += DumpValueText(registers[i]);
            AddDumpRow(*result, GetOutputStructure(), values, static_cast<unsigned int>(first));
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

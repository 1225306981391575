#include "NicEepromDump.h"

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

const Parameter kPnet = Parameter::String("pnet", "n", "The name of pnic to dump EEPROM").Required();
// Handed to the host as unsigned int.
const Parameter kOffset = Parameter::Int64("offset", "o", "Offset of EEPROM starting to dump");
const Parameter kLength = Parameter::Int64("length", "l", "Bytes of EEPROM to dump");

const unsigned int kBytesPerRow = 16;

unsigned int GivenOrZero(Input& input, Parameter const& parameter) {
    return input.HasParameter(parameter) ? static_cast<unsigned int>(input.GetLongLong(parameter)) : 0;
}

}  // namespace

NicEepromDump::NicEepromDump() {
    SetDescription("Dump device EEPROM");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:EepromDump", "Offset,Value");
}

boost::shared_ptr<InputSpec> NicEepromDump::GetInputSpecInternal() { return InputSpecOf(kPnet, kOffset, kLength); }

boost::shared_ptr<OutputSpec> NicEepromDump::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> NicEepromDump::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("EepromDump");
    result->SetField("Offset", MetaString::New());
    result->SetField("Value", MetaString::New());
    return result;
}

void NicEepromDump::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        std::string name = input->GetString(kPnet);
        std::unique_ptr<Gantry::Network::Pnic> pnic(networkInfo.GetPnicByName(name));
        if (!pnic) {
            output->SetError("Pnic with name " + name + " not found");
            return;
        }
        unsigned int offset = GivenOrZero(*input, kOffset);
        unsigned int length = GivenOrZero(*input, kLength);
        std::vector<unsigned char> bytes;
        pnic->GetEepromDump(bytes, length, offset);

        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        // The first row is aligned to 16 bytes: a filler for each position
        // before the offset. It is made even when no byte came back.
        unsigned int rowOffset = offset & ~0xFu;
        unsigned int position = offset & 0xFu;
        std::string values(3 * position, ' ');
        std::size_t next = 0;
        do {
            for (; position < kBytesPerRow && next < bytes.size(); ++position) values += DumpValueText(bytes[next++]);
            AddDumpRow(*result, GetOutputStructure(), values, rowOffset);
            values.clear();
            position = 0;
            rowOffset += kBytesPerRow;
        } while (next < bytes.size());
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

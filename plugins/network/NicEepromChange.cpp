#include "NicEepromChange.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/Pnic.h"
#include "trellis/lib/TrellisException.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPnet = Parameter::String("pnet", "n", "Name of pnet to change EEPROM.").Required();
const Parameter kOffset = Parameter::Int("offset", "o", "Offset of EEPROM to change");
const Parameter kValue = Parameter::Int("value", "v", "New EEPROM value in double word");
const Parameter kFile = Parameter::String("file", "f", "File name of new EEPROM content");
const Parameter kMagic = Parameter::Int("magic", "m", "Magic key of EEPROM").Required();

const char* const kSource = "plugins/network/NicEepromChange";
const unsigned int kFileWithValueLine = 142;
const unsigned int kValueMissingLine = 162;
const unsigned int kValueWithFileLine = 153;

}  // namespace

NicEepromChange::NicEepromChange() { SetDescription("Change EEPROM on a nic"); }

boost::shared_ptr<InputSpec> NicEepromChange::GetInputSpecInternal() {
    return InputSpecOf(kPnet, kOffset, kValue, kFile, kMagic);
}

boost::shared_ptr<OutputSpec> NicEepromChange::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void NicEepromChange::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        // Delivered as made: its default state, not true.
        boost::shared_ptr<MetaBool> result = MetaBool::New();
        std::string name = input->GetString(kPnet);
        std::unique_ptr<Gantry::Network::Pnic> pnic(networkInfo.GetPnicByName(name));
        if (!pnic) {
            output->SetError("Pnic with name " + name + " not found");
            return;
        }
        unsigned int magic = static_cast<unsigned int>(input->GetInt(kMagic));
        if (input->HasParameter(kFile)) {
            if (input->HasParameter(kOffset) || input->HasParameter(kValue)) {
                throw Trellis::Lib::TrellisException(
                    "Parameter --file can't be specified together with --offset and --value", kSource,
                    kFileWithValueLine);
            }
            // The host reads the file; the command only names it.
            pnic->SetEepromFromFile(magic, input->GetString(kFile));
        } else {
            // Both are needed, whatever the sentence says.
            if (!input->HasParameter(kOffset) || !input->HasParameter(kValue)) {
                throw Trellis::Lib::TrellisException("Need to specify atleast one of --offset, --value or --file",
                                                     kSource, kValueMissingLine);
            }
            // The last guard: --file is known to be absent here.
            if (input->HasParameter(kFile)) {
                throw Trellis::Lib::TrellisException(
                    "Parameter --offset and --value can't be specified together with --file", kSource,
                    kValueWithFileLine);
            }
            unsigned int value = static_cast<unsigned int>(input->GetInt(kValue));
            unsigned int offset = static_cast<unsigned int>(input->GetInt(kOffset));
            pnic->SetEepromValue(magic, offset, value);
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

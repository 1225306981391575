#include "NicSelfTestRun.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/Pnic.h"
#include "plinth/metaobj/MetaListRef.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPnet = Parameter::String("pnet", "n", "The name of pnic to dump EEPROM").Required();
const Parameter kOnline = Parameter::Int(
    "online", "o",
    "Performing limited set of tests do not inetrrupt normal adapter operation, default is offline");

}  // namespace

NicSelfTestRun::NicSelfTestRun() {
    SetDescription("Run self test");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    // The self test's rows share the dump's structure name.
    SetDefaultOutputParameter("fields:EepromDump", "Item,Value");
}

boost::shared_ptr<InputSpec> NicSelfTestRun::GetInputSpecInternal() { return InputSpecOf(kPnet, kOnline); }

boost::shared_ptr<OutputSpec> NicSelfTestRun::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> NicSelfTestRun::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("EepromDump");
    result->SetField("Item", MetaString::New());
    result->SetField("Value", MetaString::New());
    return result;
}

void NicSelfTestRun::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        std::string name = input->GetString(kPnet);
        std::unique_ptr<Gantry::Network::Pnic> pnic(networkInfo.GetPnicByName(name));
        if (!pnic) {
            output->SetError("Pnic with name " + name + " not found");
            return;
        }
        bool online = input->HasParameter(kOnline) ? input->GetInt(kOnline) != 0 : false;
        Gantry::Network::PnicSelfTestResult testResult;
        pnic->RunSelfTest(testResult, online);

        // The verdict is appended before the list is made: the reference is
        // still empty and throws ListNotMadeError, which passes this
        // handler, so a self test that ran ends as a framework error.
        Plinth::MetaObj::MetaListRef result;
        boost::shared_ptr<MetaStruct> verdict = GetOutputStructure();
        verdict->SetField("Item", "Result");
        verdict->SetField("Value", testResult.passed ? "Passed" : "Failed");
        result.AddMetaStruct(verdict);
        result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        for (std::string const& detail : testResult.details) {
            boost::shared_ptr<MetaStruct> row = GetOutputStructure();
            row->SetField("Item", "Info");
            row->SetField("Value", detail);
            result.AddMetaStruct(row);
        }
        output->SetResult(result.Get());
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

#include "DemoCommands.h"

using namespace Plinth::CallSpec;
using namespace Plinth::MetaObj;

namespace Demo {

namespace {

boost::shared_ptr<MetaStruct> EchoStructure() {
    boost::shared_ptr<MetaStruct> echo = MetaStruct::New("Echo");
    for (char const* title : {"Name", "Port", "Level", "Mode", "Kind", "Label", "Enabled", "Verbose", "Given"}) {
        echo->SetField(title, MetaString::New());
    }
    return echo;
}

boost::shared_ptr<ParameterSpec> Parameter(char const* name, ParameterType type, char const* shortName,
                                           char const* help) {
    boost::shared_ptr<ParameterSpec> parameter = ParameterSpec::New(name, type);
    parameter->SetShortName(shortName);
    parameter->SetDescription(help);
    return parameter;
}

}  // namespace

Echo::Echo() {
    SetDescription("Show the parameters as the command receives them.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("json");
}

boost::shared_ptr<InputSpec> Echo::GetInputSpecInternal() {
    boost::shared_ptr<InputSpec> inputSpec = InputSpec::New();

    boost::shared_ptr<ParameterSpec> name = Parameter("name", PARAMETER_STRING, "n", "The name to echo.");
    name->SetRequired(true);
    inputSpec->AddParameter(name);

    boost::shared_ptr<ParameterSpec> port = Parameter("port", PARAMETER_INT, "p", "A port number.");
    boost::shared_ptr<ParameterConstraint> range = ParameterConstraint::New(CONSTRAINT_INT_RANGE);
    range->SetIntRange(1, 4096);
    port->SetConstraint(range);
    inputSpec->AddParameter(port);

    boost::shared_ptr<ParameterSpec> level = Parameter("level", PARAMETER_INT, "l", "A level: %ENUM%");
    boost::shared_ptr<ParameterConstraint> levels = ParameterConstraint::New(CONSTRAINT_INT_ENUM);
    for (long long value : {1, 2, 4}) levels->AddIntEnum(value);
    level->SetConstraint(levels);
    inputSpec->AddParameter(level);

    boost::shared_ptr<ParameterSpec> mode = Parameter("mode", PARAMETER_STRING, "m", "The mode. Should be one in set %ENUM%.");
    boost::shared_ptr<ParameterConstraint> modes = ParameterConstraint::New(CONSTRAINT_STRING_ENUM);
    modes->AddStringEnum("transport", "");
    modes->AddStringEnum("tunnel", "");
    mode->SetConstraint(modes);
    inputSpec->AddParameter(mode);

    boost::shared_ptr<ParameterSpec> kind = Parameter("kind", PARAMETER_STRING, "k", "Address type : %FULLENUM%");
    boost::shared_ptr<ParameterConstraint> kinds = ParameterConstraint::New(3);
    kinds->AddStringEnum("static", "Set static IPv4 information.");
    kinds->AddStringEnum("dhcp", "Use DHCP.");
    kind->SetConstraint(kinds);
    inputSpec->AddParameter(kind);

    boost::shared_ptr<ParameterSpec> label = ParameterSpec::New("label", 0);
    label->SetDescription("A lower-case label that starts with a letter.");
    boost::shared_ptr<ParameterConstraint> pattern = ParameterConstraint::New(CONSTRAINT_STRING_REGEX);
    pattern->SetStringRegex("[a-z][a-z0-9]*");
    label->SetConstraint(pattern);
    inputSpec->AddParameter(label);

    inputSpec->AddParameter(Parameter("enabled", PARAMETER_BOOL, "e", "Whether it is enabled."));
    inputSpec->AddParameter(Parameter("verbose", PARAMETER_FLAG, "v", "Say more."));
    return inputSpec;
}

boost::shared_ptr<OutputSpec> Echo::GetOutputSpecInternal() {
    boost::shared_ptr<OutputSpec> outputSpec = OutputSpec::New();
    outputSpec->SetResultType(EchoStructure());
    return outputSpec;
}

void Echo::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    boost::shared_ptr<MetaStruct> echo = EchoStructure();
    std::vector<std::string> given;
    for (char const* name : {"name", "port", "level", "mode", "kind", "label", "enabled", "verbose"}) {
        if (input->HasParameter(name)) given.push_back(name);
    }
    echo->SetField("Name", input->GetString("name"));
    if (input->HasParameter("port")) echo->SetField("Port", input->GetInt("port"));
    if (input->HasParameter("level")) echo->SetField("Level", input->GetInt("level"));
    if (input->HasParameter("mode")) echo->SetField("Mode", input->GetString("mode"));
    if (input->HasParameter("kind")) echo->SetField("Kind", input->GetString("kind"));
    if (input->HasParameter("label")) echo->SetField("Label", input->GetString("label"));
    if (input->HasParameter("enabled")) echo->SetField("Enabled", input->GetBool("enabled"));
    echo->SetField("Verbose", input->GetFlag("verbose"));
    echo->SetField("Given", given);
    output->SetResult(echo);
    output->Finish();
}

}  // namespace Demo

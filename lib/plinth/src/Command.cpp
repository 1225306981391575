#include "plinth/autocli/Command.h"

#include "plinth/metaobj/MetaList.h"
#include "plinth/metaobj/MetaStruct.h"

namespace Plinth {
namespace AutoCli {

using CallSpec::Input;
using CallSpec::InputSpec;
using CallSpec::Output;
using CallSpec::OutputSpec;

Command::~Command() = default;

boost::shared_ptr<InputSpec> Command::GetInputSpec() {
    boost::shared_ptr<InputSpec> inputSpec = GetInputSpecInternal();
    return inputSpec ? inputSpec : InputSpec::New();
}

boost::shared_ptr<OutputSpec> Command::GetOutputSpec() {
    boost::shared_ptr<OutputSpec> outputSpec = GetOutputSpecInternal();
    return outputSpec ? outputSpec : OutputSpec::New();
}

void Command::Execute(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    ExecuteInternal(input ? input : Input::New(), output);
}

boost::shared_ptr<NamespaceNode> Command::GetThis() { return NamespaceNode::GetThis(); }

bool Command::HasNamespaceNode(std::string const&) const { return false; }
boost::shared_ptr<NamespaceNode> Command::GetNamespaceNode(std::string const&) const {
    return boost::shared_ptr<NamespaceNode>();
}
void Command::RegisterNamespaceNode(boost::shared_ptr<NamespaceNode>, std::string const&) {}
boost::shared_ptr<NamespaceNode> Command::ResolveNode(std::list<std::string>&) { return GetThis(); }

boost::shared_ptr<CallSpec::CallTarget> Command::GetDispatcher() {
    return boost::dynamic_pointer_cast<CallSpec::CallTarget>(GetThis());
}

void Command::SetParent(boost::shared_ptr<NamespaceNode> parent) { NamespaceNode::SetParent(parent); }
boost::shared_ptr<NamespaceNode> Command::GetParent() const { return NamespaceNode::GetParent(); }
std::string Command::GetType() const { return "command"; }

std::vector<Command::Example> Command::GetExamples() const { return examples_; }

std::map<std::string, std::string> Command::GetDefaultOutputFormatParameters() const {
    return formatParameters_;
}
void Command::SetDefaultOutputFormatter(std::string const& formatter) { defaultFormatter_ = formatter; }
void Command::SetDefaultOutputParameter(std::string const& key, std::string const& value) {
    formatParameters_[key] = value;
}
std::string Command::GetDefaultOutputFormatter() const { return defaultFormatter_; }

void Command::SetMetaDataField(std::string const& key, std::string const& value) { metaData_[key] = value; }
std::string Command::GetMetaDataField(std::string const& key) const {
    auto found = metaData_.find(key);
    return found == metaData_.end() ? std::string() : found->second;
}
std::map<std::string, std::string> Command::GetMetaData() const { return metaData_; }

void Command::ExecuteInternal(boost::shared_ptr<Input>, boost::shared_ptr<Output> output) {
    output->SetError("The command " + GetPathString(' ') + " is not implemented.");
}

void Command::AddExample(std::string const& description, std::string const& example) {
    examples_.emplace_back(description, example);
}

void Command::GenerateHelpOutput(boost::shared_ptr<Input>, boost::shared_ptr<Output> output) {
    using namespace MetaObj;
    boost::shared_ptr<MetaList> options = MetaList::New(META_STRUCT, MetaStruct::New("CommandOption"));
    boost::shared_ptr<InputSpec> const inputSpec = GetInputSpec();
    for (auto const& parameter : inputSpec->GetParameters()) {
        boost::shared_ptr<MetaStruct> option = MetaStruct::New("CommandOption");
        option->SetField("Name", parameter->GetName());
        option->SetField("Short Name", parameter->GetShortName());
        option->SetField("Type", static_cast<int>(parameter->GetType()));
        option->SetField("Required", parameter->IsRequired());
        option->SetField("Description", parameter->GetDescription());
        options->AddMetaStruct(option);
    }
    boost::shared_ptr<MetaList> examples = MetaList::New(META_STRUCT, MetaStruct::New("CommandExample"));
    for (Example const& example : examples_) {
        boost::shared_ptr<MetaStruct> entry = MetaStruct::New("CommandExample");
        entry->SetField("Description", example.first);
        entry->SetField("Example", example.second);
        examples->AddMetaStruct(entry);
    }
    boost::shared_ptr<MetaStruct> help = MetaStruct::New("CommandHelp");
    help->SetField("Command", GetPathString(' '));
    help->SetField("Description", GetDescription());
    help->SetField("Options", options);
    help->SetField("Examples", examples);
    output->SetResult(help);
    output->Finish();
}

}  // namespace AutoCli
}  // namespace Plinth

// The framework's own types: result values, Input/Output, the tree and the
// command base.
#include <gtest/gtest.h>

#include "PlinthScriptedCommand.h"

using namespace Plinth::AutoCli;
using namespace Plinth::CallSpec;
using namespace Plinth::MetaObj;
using PlinthTest::ScriptedCommand;

TEST(PlinthMetaStruct, FieldsKeepFirstOrderAndLaterValuesReplaceInPlace) {
    boost::shared_ptr<MetaStruct> nic = MetaStruct::New("Nic");
    nic->SetField("Name", MetaString::New());
    nic->SetField("Speed", MetaInt::New());
    nic->SetField("Up", MetaBool::New());
    nic->SetField("Speed", 1000);
    nic->SetField("Name", "pnet0");

    ASSERT_EQ(3u, nic->GetFields().size());
    EXPECT_EQ("Name", nic->GetFields()[0].first);
    EXPECT_EQ("Speed", nic->GetFields()[1].first);
    EXPECT_EQ("Up", nic->GetFields()[2].first);
    EXPECT_EQ("pnet0", boost::dynamic_pointer_cast<MetaString>(nic->GetField("Name"))->GetValue());
    EXPECT_EQ(1000, boost::dynamic_pointer_cast<MetaInt>(nic->GetField("Speed"))->GetValue());
    EXPECT_FALSE(nic->GetField("Up")->IsSet());
    EXPECT_FALSE(nic->GetField("Missing"));
}

TEST(PlinthMetaStruct, EveryOverloadStoresTheMatchingValueKind) {
    boost::shared_ptr<MetaStruct> all = MetaStruct::New("All");
    std::string const text = "text";
    all->SetField("string", text);
    all->SetField("cstring", "literal");
    all->SetField("bool", true);
    all->SetField("int", -7);
    all->SetField("longlong", 1LL << 40);
    all->SetField("unsigned", 4000000000u);
    all->SetField("size", static_cast<size_t>(12));
    all->SetField("vector", std::vector<std::string>{"a", "b"});
    all->SetField("struct", MetaStruct::New("Inner"));
    all->SetField("list", MetaList::New(2));

    EXPECT_EQ(META_STRING, all->GetField("string")->GetMetaType());
    EXPECT_EQ("literal", boost::dynamic_pointer_cast<MetaString>(all->GetField("cstring"))->GetValue());
    EXPECT_EQ(META_BOOL, all->GetField("bool")->GetMetaType());
    EXPECT_EQ(-7, boost::dynamic_pointer_cast<MetaInt>(all->GetField("int"))->GetValue());
    EXPECT_EQ(1LL << 40, boost::dynamic_pointer_cast<MetaInt>(all->GetField("longlong"))->GetValue());
    EXPECT_EQ(4000000000LL, boost::dynamic_pointer_cast<MetaInt>(all->GetField("unsigned"))->GetValue());
    EXPECT_EQ(12, boost::dynamic_pointer_cast<MetaInt>(all->GetField("size"))->GetValue());
    boost::shared_ptr<MetaList> vector = boost::dynamic_pointer_cast<MetaList>(all->GetField("vector"));
    ASSERT_TRUE(vector);
    EXPECT_EQ(META_STRING, vector->GetElementType());
    EXPECT_EQ(2u, vector->Size());
    EXPECT_EQ(META_STRUCT, all->GetField("struct")->GetMetaType());
}

TEST(PlinthMetaValues, UnsetValuesAreDistinctFromDefaults) {
    EXPECT_FALSE(MetaBool::New()->IsSet());
    EXPECT_TRUE(MetaBool::New(false)->IsSet());
    EXPECT_FALSE(MetaInt::New()->IsSet());
    EXPECT_TRUE(MetaInt::New(0)->IsSet());
    EXPECT_FALSE(MetaString::New()->IsSet());
    EXPECT_TRUE(MetaString::New("")->IsSet());
    EXPECT_EQ(-(1LL << 62), MetaInt::New(-(1LL << 62))->GetValue());
}

TEST(PlinthMetaList, BothFormsAndAllAddOperations) {
    boost::shared_ptr<MetaStruct> shape = MetaStruct::New("Row");
    boost::shared_ptr<MetaList> rows = MetaList::New(3, shape);
    EXPECT_EQ(META_STRUCT, rows->GetElementType());
    EXPECT_EQ(shape, rows->GetShape());
    rows->AddMetaStruct(MetaStruct::New("Row"));
    EXPECT_EQ(1u, rows->Size());

    boost::shared_ptr<MetaList> strings = MetaList::New(META_STRING);
    EXPECT_FALSE(strings->GetShape());
    strings->AddMetaString(MetaString::New("a"));
    strings->AddCString("b");
    strings->AddString("c");
    ASSERT_EQ(3u, strings->Size());
    EXPECT_EQ("c", boost::dynamic_pointer_cast<MetaString>(strings->GetElements()[2])->GetValue());
}

TEST(PlinthInput, AbsentParametersReadAsEmptyAndGivenOnesKeepTheirValues) {
    boost::shared_ptr<Input> input = Input::New();
    EXPECT_EQ("", input->GetString("name"));
    EXPECT_EQ(0, input->GetInt("count"));
    EXPECT_FALSE(input->GetBool("enabled"));
    EXPECT_FALSE(input->GetFlag("verbose"));
    EXPECT_FALSE(input->HasParameter("name"));

    input->SetString("name", "");
    input->SetInt("count", -12);
    input->SetBool("enabled", false);
    input->SetFlag("verbose");
    EXPECT_TRUE(input->HasParameter("name"));
    EXPECT_EQ("", input->GetString("name"));
    EXPECT_EQ(-12, input->GetInt("count"));
    EXPECT_TRUE(input->HasParameter("enabled"));
    EXPECT_FALSE(input->GetBool("enabled"));
    EXPECT_TRUE(input->GetFlag("verbose"));
}

TEST(PlinthOutput, KeepsEveryErrorInOrderAndAResultSetAfterThem) {
    boost::shared_ptr<Output> output = Output::New();
    EXPECT_FALSE(output->HasError());
    output->SetError("first");
    output->SetError("second");
    output->SetResult(MetaBool::New(true));
    output->Finish();
    EXPECT_TRUE(output->HasError());
    EXPECT_EQ((std::vector<std::string>{"first", "second"}), output->GetErrors());
    ASSERT_TRUE(output->GetResult());
    EXPECT_TRUE(output->IsFinished());
}

TEST(PlinthTree, RegistrationNamesPathsAndResolution) {
    boost::shared_ptr<Namespace> root = Namespace::New();
    boost::shared_ptr<Namespace> network = Namespace::New();
    boost::shared_ptr<ScriptedCommand> get = ScriptedCommand::New();
    // Built bottom up, as a plug-in does, and hung in last.
    boost::shared_ptr<NamespaceNode> firewall = network->SubNamespace("firewall");
    firewall->RegisterNamespaceNode(get, "get");
    network->RegisterNamespaceNode(Namespace::New(), "ip");
    root->RegisterNamespaceNode(network, "network");

    EXPECT_EQ((std::vector<std::string>{"firewall", "ip"}), network->GetNamespaceNodeNames());
    EXPECT_EQ("network firewall get", get->GetPathString(' '));
    EXPECT_EQ(firewall, get->GetParent());
    EXPECT_EQ("command", get->GetType());
    EXPECT_EQ("namespace", network->GetType());
    EXPECT_FALSE(network->GetDispatcher());
    EXPECT_EQ(get.get(), dynamic_cast<ScriptedCommand*>(get->GetDispatcher().get()));

    std::list<std::string> path{"network", "firewall", "get", "--help"};
    EXPECT_EQ(get, root->ResolveNode(path));
    EXPECT_EQ((std::list<std::string>{"--help"}), path);

    std::list<std::string> unknown{"network", "nic", "list"};
    EXPECT_EQ(network, root->ResolveNode(unknown));
    EXPECT_EQ((std::list<std::string>{"nic", "list"}), unknown);

    // A leaf takes no children.
    get->RegisterNamespaceNode(Namespace::New(), "child");
    EXPECT_FALSE(get->HasNamespaceNode("child"));
}

TEST(PlinthCommand, MetadataHintsAndTheLastFormatterStand) {
    boost::shared_ptr<ScriptedCommand> command = ScriptedCommand::New();
    command->SetMetaDataField("type", "fetcher");
    command->SetDefaultOutputFormatter("simple");
    command->SetDefaultOutputFormatter("table");
    command->SetDefaultOutputParameter("fields:Ruleset", "Name");
    command->SetDefaultOutputParameter("fields:Ruleset", "Name,Enabled");

    EXPECT_EQ("fetcher", command->GetMetaDataField("type"));
    EXPECT_EQ("", command->GetMetaDataField("other"));
    EXPECT_EQ("table", command->GetDefaultOutputFormatter());
    EXPECT_EQ("Name,Enabled", command->GetDefaultOutputFormatParameters().at("fields:Ruleset"));
}

TEST(PlinthCommand, ExecuteRunsTheCommandsOwnBodyAndSpecsAreFreshEachTime) {
    boost::shared_ptr<ScriptedCommand> command = ScriptedCommand::New();
    command->inputSpec = [] {
        boost::shared_ptr<InputSpec> inputSpec = InputSpec::New();
        inputSpec->AddParameter(ParameterSpec::New("name", PARAMETER_STRING));
        return inputSpec;
    };
    command->body = [](Input& input, Output& output) {
        output.SetResult(MetaString::New(input.GetString("name")));
    };
    EXPECT_NE(command->GetInputSpec(), command->GetInputSpec());
    EXPECT_EQ(2, command->inputSpecRequests);

    boost::shared_ptr<Input> input = Input::New();
    input->SetString("name", "pnet0");
    boost::shared_ptr<Output> output = Output::New();
    command->Execute(input, output);
    EXPECT_EQ("pnet0", boost::dynamic_pointer_cast<MetaString>(output->GetResult())->GetValue());
}

TEST(PlinthCommand, GenerateHelpOutputDescribesTheOptions) {
    boost::shared_ptr<ScriptedCommand> command = ScriptedCommand::New("Show it.");
    command->inputSpec = [] {
        boost::shared_ptr<InputSpec> inputSpec = InputSpec::New();
        inputSpec->AddParameter(PlinthTest::MakeParameter("name", PARAMETER_STRING, "n", "The name.", true));
        return inputSpec;
    };
    boost::shared_ptr<Output> output = Output::New();
    command->GenerateHelpOutput(Input::New(), output);
    boost::shared_ptr<MetaStruct> help = boost::dynamic_pointer_cast<MetaStruct>(output->GetResult());
    ASSERT_TRUE(help);
    EXPECT_EQ("Show it.", boost::dynamic_pointer_cast<MetaString>(help->GetField("Description"))->GetValue());
    boost::shared_ptr<MetaList> options = boost::dynamic_pointer_cast<MetaList>(help->GetField("Options"));
    ASSERT_EQ(1u, options->Size());
    boost::shared_ptr<MetaStruct> option = boost::dynamic_pointer_cast<MetaStruct>(options->GetElements()[0]);
    EXPECT_TRUE(boost::dynamic_pointer_cast<MetaBool>(option->GetField("Required"))->GetValue());
}

// The framework's result structures and the help result of the command base;
// Input, Output and the tree are proven through the tool and the plug-ins.
#include <gtest/gtest.h>

#include "PlinthScriptedCommand.h"

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
    all->SetField("string", std::string("text"));
    all->SetField("cstring", "literal");  // not taken for a bool
    all->SetField("bool", true);
    all->SetField("longlong", 1LL << 40);
    all->SetField("unsigned", 4000000000u);
    all->SetField("size", static_cast<size_t>(12));
    all->SetField("vector", std::vector<std::string>{"a", "b"});

    EXPECT_EQ(META_STRING, all->GetField("string")->GetMetaType());
    EXPECT_EQ("literal", boost::dynamic_pointer_cast<MetaString>(all->GetField("cstring"))->GetValue());
    EXPECT_EQ(META_BOOL, all->GetField("bool")->GetMetaType());
    EXPECT_EQ(1LL << 40, boost::dynamic_pointer_cast<MetaInt>(all->GetField("longlong"))->GetValue());
    EXPECT_EQ(4000000000LL, boost::dynamic_pointer_cast<MetaInt>(all->GetField("unsigned"))->GetValue());
    EXPECT_EQ(12, boost::dynamic_pointer_cast<MetaInt>(all->GetField("size"))->GetValue());
    boost::shared_ptr<MetaList> vector = boost::dynamic_pointer_cast<MetaList>(all->GetField("vector"));
    ASSERT_TRUE(vector);
    EXPECT_EQ(META_STRING, vector->GetElementType());
    EXPECT_EQ(2u, vector->Size());
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

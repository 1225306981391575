// The tool end to end over an in-memory tree: exit statuses, what goes to
// which stream, when the host is opened, and the choice of formatter.
#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <sstream>

#include "PlinthScriptedCommand.h"
#include "plinth/cli/PluginLoader.h"
#include "plinth/cli/Tool.h"

using namespace Plinth::AutoCli;
using namespace Plinth::CallSpec;
using namespace Plinth::MetaObj;
using Plinth::Cli::Tool;
using PlinthTest::MakeParameter;
using PlinthTest::ScriptedCommand;

namespace {

class PlinthTool : public ::testing::Test {
protected:
    PlinthTool() : root_(Namespace::New()), command_(ScriptedCommand::New("Get the ruleset.")) {
        boost::shared_ptr<NamespaceNode> ruleset = root_->SubNamespace("network")->SubNamespace("ruleset");
        ruleset->SetDescription("Ruleset commands");
        ruleset->RegisterNamespaceNode(command_, "get");
        command_->inputSpec = [] {
            boost::shared_ptr<InputSpec> inputSpec = InputSpec::New();
            inputSpec->AddParameter(MakeParameter("ruleset-id", PARAMETER_STRING, "r", "The label.", true));
            return inputSpec;
        };
        command_->body = [](Input& input, Output& output) {
            boost::shared_ptr<MetaStruct> ruleset = MetaStruct::New("Ruleset");
            ruleset->SetField("Name", input.GetString("ruleset-id"));
            output.SetResult(ruleset);
            output.Finish();
        };
    }

    int Run(std::vector<std::string> const& words) {
        out_.str("");
        err_.str("");
        Tool tool(root_, "haldencli", [this](std::string const& host) {
            hostsOpened_.push_back(host);
            if (host == "broken") throw std::runtime_error("Cannot open the host broken: not a host store");
        });
        return tool.Run(words, out_, err_);
    }

    boost::shared_ptr<Namespace> root_;
    boost::shared_ptr<ScriptedCommand> command_;
    std::ostringstream out_;
    std::ostringstream err_;
    std::vector<std::string> hostsOpened_;
};

}  // namespace

TEST_F(PlinthTool, RunsTheCommandOnTheOpenedHost) {
    EXPECT_EQ(0, Run({"--host", "/tmp/h.db", "network", "ruleset", "get", "-r", "dns"}));
    EXPECT_EQ("Ruleset\n   Name: dns\n", out_.str());
    EXPECT_EQ("", err_.str());
    EXPECT_EQ((std::vector<std::string>{"/tmp/h.db"}), hostsOpened_);
    EXPECT_EQ("dns", command_->lastInput->GetString("ruleset-id"));
}

TEST_F(PlinthTool, FormatterOptionOverridesTheCommandsDefault) {
    command_->SetDefaultOutputFormatter("table");
    EXPECT_EQ(0, Run({"network", "ruleset", "get", "-r", "dns"}));
    EXPECT_EQ("Name\n----\ndns\n", out_.str());
    EXPECT_EQ(0, Run({"--formatter=json", "network", "ruleset", "get", "-r", "dns"}));
    EXPECT_EQ("{\"Name\":\"dns\"}\n", out_.str());
    EXPECT_EQ(2, Run({"--formatter", "yaml", "network", "ruleset", "get", "-r", "dns"}));
    EXPECT_EQ("", out_.str());
    EXPECT_NE(std::string::npos, err_.str().find("Unknown formatter 'yaml'"));
}

TEST_F(PlinthTool, ErrorTextsGoToStderrInOrderAndAResultStillPrints) {
    command_->body = [](Input&, Output& output) {
        output.SetError("Unable to access all portsets");
        output.SetError("Second text");
        output.SetResult(MetaBool::New(false));
        output.Finish();
    };
    EXPECT_EQ(1, Run({"network", "ruleset", "get", "-r", "x"}));
    EXPECT_EQ("Unable to access all portsets\nSecond text\n", err_.str());
    EXPECT_EQ("false\n", out_.str());

    command_->body = [](Input&, Output& output) { output.SetError("Ruleset Not Found: x"); };
    EXPECT_EQ(1, Run({"network", "ruleset", "get", "-r", "x"}));
    EXPECT_EQ("Ruleset Not Found: x\n", err_.str());
    EXPECT_EQ("", out_.str());
}

TEST_F(PlinthTool, AnExceptionOutOfTheCommandIsAFailureWithItsText) {
    command_->body = [](Input&, Output& output) {
        output.SetError("Before the throw");
        throw std::runtime_error("Cannot reach the host");
    };
    EXPECT_EQ(1, Run({"network", "ruleset", "get", "-r", "x"}));
    EXPECT_EQ("Before the throw\nCannot reach the host\n", err_.str());
    EXPECT_EQ("", out_.str());
}

TEST_F(PlinthTool, RefusalsExitTwoWithOneLineAndUsageAndNeverOpenTheHost) {
    bool executed = false;
    command_->body = [&executed](Input&, Output&) { executed = true; };
    EXPECT_EQ(2, Run({"network", "ruleset", "get"}));
    EXPECT_EQ(0u, err_.str().find("Error: Missing required option --ruleset-id.\n\n"
                                  "Usage: haldencli network ruleset get [cmd options]\n"));
    EXPECT_EQ(2, Run({"network", "ruleset", "get", "-r", "a", "--bogus"}));
    EXPECT_EQ(0u, err_.str().find("Error: Unknown option --bogus.\n"));

    EXPECT_EQ(2, Run({"network", "rulset", "get"}));
    EXPECT_EQ(0u, err_.str().find("Error: Unknown command or namespace network rulset.\n\n"
                                  "Usage: haldencli [options] {namespace}+ {cmd} [cmd options]\n"));
    EXPECT_NE(std::string::npos, err_.str().find("Available Namespaces:\n  ruleset"));

    EXPECT_EQ(2, Run({"--host"}));
    EXPECT_EQ(0u, err_.str().find("Error: Option --host requires a value.\n"));
    EXPECT_EQ(2, Run({"--host=a", "--host=b", "network"}));
    EXPECT_EQ(2, Run({"--verbose", "network"}));
    EXPECT_EQ("", out_.str());
    EXPECT_FALSE(executed);
    EXPECT_TRUE(hostsOpened_.empty());
}

TEST_F(PlinthTool, HelpGoesToStdoutWithoutOpeningTheHost) {
    EXPECT_EQ(0, Run({"network", "ruleset"}));
    EXPECT_EQ(0u, out_.str().find("Usage: haldencli [options] {namespace}+ {cmd} [cmd options]\n\nRuleset commands\n"));
    EXPECT_EQ(0, Run({"--help"}));
    EXPECT_NE(std::string::npos, out_.str().find("Available Namespaces:\n  network"));
    EXPECT_EQ(0, Run({"network", "ruleset", "get", "--help"}));
    EXPECT_EQ(0u, out_.str().find("Usage: haldencli network ruleset get [cmd options]\n"));
    EXPECT_EQ(0, Run({"--help", "network", "ruleset", "get", "--bogus"}));
    EXPECT_EQ(0u, out_.str().find("Usage: haldencli network ruleset get"));
    EXPECT_EQ("", err_.str());
    EXPECT_TRUE(hostsOpened_.empty());
}

TEST_F(PlinthTool, AHostThatCannotBeOpenedIsARefusal) {
    bool executed = false;
    command_->body = [&executed](Input&, Output&) { executed = true; };
    EXPECT_EQ(2, Run({"--host", "broken", "network", "ruleset", "get", "-r", "x"}));
    EXPECT_EQ("Error: Cannot open the host broken: not a host store\n", err_.str());
    EXPECT_FALSE(executed);
}

TEST_F(PlinthTool, AnInputSpecThatNeedsTheHostGetsItForRunsAndForHelp) {
    bool hostOpen = false;
    command_->inputSpec = [&hostOpen] {
        if (!hostOpen) throw std::runtime_error("No host is open");
        boost::shared_ptr<InputSpec> inputSpec = InputSpec::New();
        inputSpec->AddParameter(MakeParameter("ccalgo", PARAMETER_STRING, "c", "From the host."));
        return inputSpec;
    };
    auto openHost = [&hostOpen](std::string const&) { hostOpen = true; };
    std::ostringstream out, err;
    EXPECT_EQ(0, Tool(root_, "haldencli", openHost).Run({"network", "ruleset", "get", "--help"}, out, err));
    EXPECT_NE(std::string::npos, out.str().find("-c|--ccalgo=<str>"));

    hostOpen = false;
    EXPECT_EQ(0, Tool(root_, "haldencli", openHost).Run({"network", "ruleset", "get", "-c", "cubic"}, out, err));
    EXPECT_EQ("cubic", command_->lastInput->GetString("ccalgo"));
    EXPECT_EQ("", err.str());
}

TEST(PlinthPluginLoader, TheEnvironmentListReplacesTheDirectory) {
    setenv("HALDENCLI_PLUGINS", "/a/one.so::/b/two.so", 1);
    EXPECT_EQ((std::vector<std::string>{"/a/one.so", "/b/two.so"}), Plinth::Cli::PluginFiles("/nowhere"));
    unsetenv("HALDENCLI_PLUGINS");

    std::string const dir = ::testing::TempDir() + "/plinth-plugins";
    std::system(("rm -rf " + dir + " && mkdir -p " + dir).c_str());
    for (char const* name : {"libz.so", "liba.so", "notes.txt"}) std::ofstream(dir + "/" + name) << "";
    EXPECT_EQ((std::vector<std::string>{dir + "/liba.so", dir + "/libz.so"}), Plinth::Cli::PluginFiles(dir));
    EXPECT_TRUE(Plinth::Cli::PluginFiles(dir + "/missing").empty());

    // A file that is no shared library is refused with the loader's reason.
    try {
        Plinth::Cli::LoadPlugins({dir + "/liba.so"}, Namespace::New());
        FAIL() << "an empty file loaded";
    } catch (Plinth::Cli::PluginLoadError const& failure) {
        EXPECT_NE(std::string::npos, std::string(failure.what()).find(dir + "/liba.so"));
    }
}

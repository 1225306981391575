// The tool over an in-memory tree: when the host is opened and when not,
// which plug-in files it loads, and how a batch runs. Formatters, error
// texts and exit statuses are proven through the binary in
// tests/cli/frame.test.sh, a batch's output in tests/cli/batch.test.sh.
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdlib>
#include <fstream>
#include <sstream>

#include "PlinthScriptedCommand.h"
#include "plinth/cli/BatchReader.h"
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
        Tool tool(root_, "haldencli", [this](std::string const& host) { hostsOpened_.push_back(host); });
        return tool.Run(words, out_, err_);
    }

    boost::shared_ptr<Namespace> root_;
    boost::shared_ptr<ScriptedCommand> command_;
    std::ostringstream out_;
    std::ostringstream err_;
    std::vector<std::string> hostsOpened_;
};

// A body for batches: prints the ruleset's name; "fail" reports an error,
// "throw" throws.
void NameOrFailure(Input& input, Output& output) {
    std::string const name = input.GetString("ruleset-id");
    if (name == "throw") throw std::runtime_error("Thrown");
    if (name == "fail") return output.SetError("Failed");
    output.SetResult(MetaString::New(name));
    output.Finish();
}

std::string BatchFile(std::string const& text) {
    // Of this process alone: CTest runs the tests of this file side by side.
    std::string const path = ::testing::TempDir() + "/plinth-batch." + std::to_string(::getpid()) + ".txt";
    std::ofstream(path, std::ios::binary) << text;
    return path;
}

}  // namespace

TEST_F(PlinthTool, RunsTheCommandOnTheOpenedHost) {
    EXPECT_EQ(0, Run({"--host", "/tmp/h.db", "network", "ruleset", "get", "-r", "dns"}));
    EXPECT_EQ("Ruleset\n   Name: dns\n", out_.str());
    EXPECT_EQ("", err_.str());
    EXPECT_EQ((std::vector<std::string>{"/tmp/h.db"}), hostsOpened_);
    EXPECT_EQ("dns", command_->lastInput->GetString("ruleset-id"));
}

TEST_F(PlinthTool, RefusalsExitTwoWithOneLineAndUsageAndNeverOpenTheHost) {
    bool executed = false;
    command_->body = [&executed](Input&, Output&) { executed = true; };
    EXPECT_EQ(2, Run({"network", "ruleset", "get"}));
    EXPECT_EQ(0u, err_.str().find("Error: Missing required option --ruleset-id.\n\n"
                                  "Usage: haldencli network ruleset get [cmd options]\n"));
    EXPECT_EQ(2, Run({"network", "rulset", "get"}));
    EXPECT_EQ(0u, err_.str().find("Error: Unknown command or namespace network rulset.\n\n"
                                  "Usage: haldencli [options] {namespace}+ {cmd} [cmd options]\n"));
    EXPECT_EQ(2, Run({"--host"}));
    EXPECT_EQ(0u, err_.str().find("Error: Option --host requires a value.\n"));
    EXPECT_EQ(2, Run({"--host=a", "--host=b", "network"}));
    EXPECT_EQ("", out_.str());
    EXPECT_FALSE(executed);
    EXPECT_TRUE(hostsOpened_.empty());
}

TEST_F(PlinthTool, HelpGoesToStdoutWithoutOpeningTheHost) {
    EXPECT_EQ(0, Run({"network", "ruleset"}));
    EXPECT_EQ(0, Run({"network", "ruleset", "get", "--help"}));
    EXPECT_EQ(0, Run({"--help", "network", "ruleset", "get", "--bogus"}));
    EXPECT_EQ(0u, out_.str().find("Usage: haldencli network ruleset get"));
    EXPECT_EQ("", err_.str());
    EXPECT_TRUE(hostsOpened_.empty());
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
}

TEST_F(PlinthTool, AnExceptionThatEscapesACommandIsOneLineAndStatusOne) {
    // Texts the command reported before it threw still go out, first.
    command_->body = [](Input&, Output& output) {
        output.SetError("Partly done");
        throw std::out_of_range("vector::at: bad index\nsecond line");
    };
    EXPECT_EQ(1, Run({"network", "ruleset", "get", "-r", "dns"}));
    EXPECT_EQ("Partly done\nvector::at: bad index\\x0Asecond line\n", err_.str());
    EXPECT_EQ("", out_.str());

    command_->body = [](Input&, Output&) { throw 42; };
    EXPECT_EQ(1, Run({"network", "ruleset", "get", "-r", "dns"}));
    EXPECT_EQ("The command failed with an unknown exception.\n", err_.str());

    // The tool's own failures outside a command end the same way.
    command_->inputSpec = []() -> boost::shared_ptr<InputSpec> { throw std::bad_alloc(); };
    EXPECT_EQ(1, Run({"--help", "network", "ruleset", "get"}));
    EXPECT_EQ("std::bad_alloc\n", err_.str());
}

TEST_F(PlinthTool, ABatchStopsAtTheFirstFailingLineUnlessForced) {
    command_->body = NameOrFailure;
    std::string const file = BatchFile(
        "# rulesets\n"
        "\n"
        "network ruleset get -r dns\n"
        "network ruleset get -r fail\n"
        "network ruleset get -r throw\n"
        "network ruleset get -r 'a\n"
        "network ruleset get -r \"dns server\"\n");
    EXPECT_EQ(1, Run({"--batch", file}));
    EXPECT_EQ("dns\n", out_.str());
    EXPECT_EQ("Failed\nhaldencli: batch stopped at line 4 (status 1).\n", err_.str());

    EXPECT_EQ(2, Run({"--force", "--batch", file}));  // the worst status
    EXPECT_EQ("dns\ndns server\n", out_.str());
    EXPECT_EQ("Failed\nThrown\nError: Batch line 6: the single quote is not closed.\n", err_.str());
}

TEST_F(PlinthTool, EveryLineOfABatchWorksOnItsHostOpenedOnce) {
    command_->body = NameOrFailure;
    std::string const file = BatchFile(
        "network ruleset get -r a\n"
        "--host /other.db network ruleset get -r b\n"
        "--batch other.txt\n"
        "network ruleset get -r c\n");
    EXPECT_EQ(2, Run({"--host=/tmp/h.db", "--batch", file, "--force"}));
    EXPECT_EQ("a\nc\n", out_.str());
    EXPECT_EQ(
        "Error: Batch line 2: --host cannot be given on a line of a batch; give it before --batch.\n"
        "Error: Batch line 3: --batch cannot be given on a line of a batch.\n",
        err_.str());
    EXPECT_EQ(std::vector<std::string>{"/tmp/h.db"}, hostsOpened_);
}

TEST_F(PlinthTool, BatchLinesAreCheckedAsTheyAreRead) {
    command_->body = NameOrFailure;
    EXPECT_EQ(0, Run({"--batch", BatchFile("\n  # nothing to run\n")}));
    EXPECT_EQ("", out_.str() + err_.str());
    EXPECT_TRUE(hostsOpened_.empty());

    std::string const longLine = "network ruleset get -r " + std::string(Plinth::Cli::kMaxBatchLineBytes, 'x');
    EXPECT_EQ(2, Run({"--force", "--batch",
                      BatchFile("network ruleset get -r caf\xE9\r\n" + longLine +
                                "\n\r\nnetwork ruleset get -r dos\r\nnetwork ruleset get -r last")}));
    EXPECT_EQ("dos\nlast\n", out_.str());
    EXPECT_EQ("Error: Batch line 1: it is not valid UTF-8.\nError: Batch line 2: it is longer than 1 MiB.\n",
              err_.str());
}

TEST_F(PlinthTool, ABatchThatCannotBeReadRunsNothing) {
    std::string const dir = ::testing::TempDir() + "/plinth-batch-input";
    std::system(("rm -rf " + dir + " && mkdir -p " + dir).c_str());
    ASSERT_EQ(0, ::mkfifo((dir + "/fifo").c_str(), 0600));
    std::ofstream(dir + "/big").close();
    ASSERT_EQ(0, ::truncate((dir + "/big").c_str(), static_cast<off_t>(Plinth::Cli::kMaxBatchBytes + 1)));

    EXPECT_EQ(2, Run({"--batch", dir}));
    EXPECT_EQ("Error: Cannot read the batch file " + dir + ": it is a directory, not a regular file.\n", err_.str());
    EXPECT_EQ(2, Run({"--batch", dir + "/fifo"}));  // without waiting for a writer
    EXPECT_EQ("Error: Cannot read the batch file " + dir + "/fifo: it is a FIFO, not a regular file.\n", err_.str());
    EXPECT_EQ(2, Run({"--batch", dir + "/big"}));
    EXPECT_EQ("Error: Cannot read the batch file " + dir + "/big: it is larger than 64 MiB.\n", err_.str());
    EXPECT_EQ(2, Run({"--batch", dir + "/big", "network", "ruleset"}));
    EXPECT_EQ(0u, err_.str().find("Error: Unexpected argument 'network': --batch takes its command lines from "
                                  "the file.\n"));
    EXPECT_EQ(2, Run({"--force", "network", "ruleset", "get", "-r", "dns"}));
    EXPECT_EQ(0u, err_.str().find("Error: Option --force is only valid with --batch.\n"));
    EXPECT_EQ("", out_.str());
    EXPECT_TRUE(hostsOpened_.empty());
    std::system(("rm -rf " + dir).c_str());
}

TEST(PlinthToolHostHold, EachCommandRunsBetweenHoldAndReleaseAndAFailedHoldRunsNothing) {
    boost::shared_ptr<Namespace> root = Namespace::New();
    boost::shared_ptr<ScriptedCommand> command = ScriptedCommand::New();
    root->SubNamespace("demo")->RegisterNamespaceNode(command, "run");
    std::vector<std::string> events;
    command->body = [&events](Input&, Output&) {
        events.push_back("run");
        throw std::runtime_error("broken");
    };
    Tool tool(root, "haldencli", [](std::string const&) {});
    tool.SetHostHold([&events] { events.push_back("hold"); }, [&events] { events.push_back("release"); });
    std::ostringstream out, err;
    EXPECT_EQ(1, tool.Run({"demo", "run"}, out, err));
    EXPECT_EQ((std::vector<std::string>{"hold", "run", "release"}), events);

    events.clear();
    tool.SetHostHold([] { throw std::runtime_error("The host is busy"); }, [&events] { events.push_back("release"); });
    err.str("");
    EXPECT_EQ(1, tool.Run({"demo", "run"}, out, err));
    EXPECT_EQ("The host is busy\n", err.str());
    EXPECT_TRUE(events.empty());
}

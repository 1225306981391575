// Completion: the model the scripts are written from (paths, options, enum
// values, host names), the scripts' registration, the tool's completion
// entries, and the host names read for them.
#include <gtest/gtest.h>

#include <sstream>
#include <stdexcept>

#include "PlinthScriptedCommand.h"
#include "TempHost.h"
#include "plinth/cli/Completion.h"
#include "plinth/cli/CompletionModel.h"
#include "plinth/cli/Tool.h"
#include "plinth/cli/UsageError.h"
#include "trellis/host/ObjectNames.h"

using namespace Plinth::AutoCli;
using namespace Plinth::CallSpec;
using namespace Plinth::Cli;
using PlinthTest::MakeParameter;
using PlinthTest::ScriptedCommand;

namespace {

// network vswitch standard {list, portgroup add}, network nic set, and a
// command whose options cannot be had.
boost::shared_ptr<Namespace> SmallTree() {
    boost::shared_ptr<Namespace> root = Namespace::New();
    boost::shared_ptr<NamespaceNode> standard = root->SubNamespace("network")->SubNamespace("vswitch")->SubNamespace("standard");
    standard->SetDescription("Standard switches.\nA second line.");
    standard->RegisterNamespaceNode(ScriptedCommand::New("List the switches."), "list");

    boost::shared_ptr<ScriptedCommand> add = ScriptedCommand::New("Add a port group.");
    add->inputSpec = [] {
        boost::shared_ptr<InputSpec> spec = InputSpec::New();
        spec->AddParameter(MakeParameter("portgroup-name", PARAMETER_STRING, "p", "The port group.", true));
        spec->AddParameter(MakeParameter("vswitch-name", PARAMETER_STRING, "v", "The switch.", true));
        return spec;
    };
    standard->SubNamespace("portgroup")->RegisterNamespaceNode(add, "add");

    boost::shared_ptr<ScriptedCommand> set = ScriptedCommand::New("Set a NIC.");
    set->inputSpec = [] {
        boost::shared_ptr<InputSpec> spec = InputSpec::New();
        boost::shared_ptr<ParameterSpec> duplex = MakeParameter("duplex", PARAMETER_STRING, "d", "Duplex: %FULLENUM%");
        boost::shared_ptr<ParameterConstraint> duplexes = ParameterConstraint::New(CONSTRAINT_STRING_ENUM);
        duplexes->AddStringEnum("full", "Full duplex.");
        duplexes->AddStringEnum("half", "Half duplex.");
        duplex->SetConstraint(duplexes);
        spec->AddParameter(duplex);
        boost::shared_ptr<ParameterSpec> speed = MakeParameter("speed", PARAMETER_INT, "S", "Speed.");
        boost::shared_ptr<ParameterConstraint> speeds = ParameterConstraint::New(CONSTRAINT_INT_ENUM);
        speeds->AddIntEnum(10);
        speeds->AddIntEnum(1000);
        speed->SetConstraint(speeds);
        spec->AddParameter(speed);
        spec->AddParameter(MakeParameter("auto", PARAMETER_BOOL, "a", "Negotiate."));
        spec->AddParameter(MakeParameter("reset", PARAMETER_FLAG, "", "Reset."));
        // An enumerated value wins over the host's names.
        boost::shared_ptr<ParameterSpec> nic = MakeParameter("nic-name", PARAMETER_STRING, "n", "The NIC.");
        boost::shared_ptr<ParameterConstraint> nics = ParameterConstraint::New(CONSTRAINT_STRING_ENUM);
        nics->AddStringEnum("pnet0", "");
        nic->SetConstraint(nics);
        spec->AddParameter(nic);
        return spec;
    };
    root->SubNamespace("network")->SubNamespace("nic")->RegisterNamespaceNode(set, "set");

    boost::shared_ptr<ScriptedCommand> hosted = ScriptedCommand::New("Needs the host for its options.");
    hosted->inputSpec = []() -> boost::shared_ptr<InputSpec> { throw std::runtime_error("No host is open"); };
    root->SubNamespace("network")->RegisterNamespaceNode(hosted, "hosted");
    return root;
}

CompletionSource Source() {
    CompletionSource source;
    source.programName = "haldencli";
    source.formatters = {"simple", "json"};
    source.hostNameParameters = {"vswitch-name", "portgroup-name", "nic-name"};
    return source;
}

CompletionNode const& NodeAt(std::vector<CompletionNode> const& nodes, std::string const& path) {
    for (CompletionNode const& node : nodes) {
        if (node.path == path) return node;
    }
    throw std::out_of_range("no node " + path);
}

}  // namespace

TEST(PlinthCompletion, EveryPathListsWhatIsBelowIt) {
    boost::shared_ptr<Namespace> root = SmallTree();
    std::vector<CompletionNode> const nodes = CompletionNodes(*root, Source());
    std::vector<std::string> paths;
    for (CompletionNode const& node : nodes) paths.push_back(node.path);
    EXPECT_EQ((std::vector<std::string>{"", "network", "network vswitch", "network vswitch standard",
                                        "network vswitch standard list", "network vswitch standard portgroup",
                                        "network vswitch standard portgroup add", "network nic", "network nic set",
                                        "network hosted"}),
              paths);
    EXPECT_EQ((std::vector<std::string>{"network"}), NodeAt(nodes, "").children);
    EXPECT_EQ((std::vector<std::string>{"vswitch", "nic", "hosted"}), NodeAt(nodes, "network").children);
    EXPECT_EQ((std::vector<std::string>{"list", "portgroup"}), NodeAt(nodes, "network vswitch standard").children);
    EXPECT_EQ("Standard switches.", NodeAt(nodes, "network vswitch standard").help);
    EXPECT_FALSE(NodeAt(nodes, "network nic").command);
    EXPECT_TRUE(NodeAt(nodes, "network nic set").command);
    EXPECT_TRUE(NodeAt(nodes, "network nic set").children.empty());
    // A command whose options cannot be had now is still offered, without them.
    EXPECT_TRUE(NodeAt(nodes, "network hosted").command);
    EXPECT_TRUE(NodeAt(nodes, "network hosted").options.empty());
}

TEST(PlinthCompletion, OptionsCarryTheirShortNamesValuesAndHostNames) {
    boost::shared_ptr<Namespace> root = SmallTree();
    std::vector<CompletionNode> const nodes = CompletionNodes(*root, Source());
    std::vector<CompletionOption> const& set = NodeAt(nodes, "network nic set").options;
    ASSERT_EQ(5u, set.size());
    EXPECT_EQ("duplex", set[0].name);
    EXPECT_EQ("d", set[0].shortName);
    EXPECT_EQ("Duplex:", set[0].help);  // the first line of the expanded help
    EXPECT_EQ((std::vector<std::string>{"full", "half"}), set[0].values);
    EXPECT_EQ((std::vector<std::string>{"10", "1000"}), set[1].values);
    EXPECT_EQ((std::vector<std::string>{"true", "false"}), set[2].values);
    EXPECT_FALSE(set[3].takesValue);
    EXPECT_TRUE(set[3].shortName.empty());
    EXPECT_TRUE(set[3].values.empty());
    EXPECT_FALSE(set[4].hostNames);  // enumerated values are offered instead
    EXPECT_EQ((std::vector<std::string>{"pnet0"}), set[4].values);
    for (CompletionOption const& option : set) EXPECT_FALSE(option.hostNames) << option.name;

    std::vector<CompletionOption> const& add = NodeAt(nodes, "network vswitch standard portgroup add").options;
    ASSERT_EQ(2u, add.size());
    EXPECT_TRUE(add[0].hostNames);
    EXPECT_TRUE(add[1].hostNames);
    EXPECT_TRUE(add[1].values.empty());

    // Without the host-name hook no option asks the host.
    CompletionSource plain = Source();
    plain.hostNameParameters.clear();
    EXPECT_FALSE(NodeAt(CompletionNodes(*root, plain), "network vswitch standard portgroup add").options[1].hostNames);
}

TEST(PlinthCompletion, ScriptsRegisterForTheirShell) {
    boost::shared_ptr<Namespace> root = SmallTree();
    std::string const bash = CompletionScript("bash", *root, Source());
    EXPECT_NE(std::string::npos, bash.find("\ncomplete -F _haldencli 'haldencli'\n"));
    EXPECT_NE(std::string::npos, bash.find("'network nic set --duplex'|'network nic set -d') _haldencli_param='duplex'; "
                                           "_haldencli_list=('full' 'half') ;;"));
    EXPECT_NE(std::string::npos, bash.find("_haldencli_param='vswitch-name'; _haldencli_list=(); _haldencli_hosted=1"));
    EXPECT_EQ(std::string::npos, bash.find("--reset'|"));  // a flag takes no value

    std::string const zsh = CompletionScript("zsh", *root, Source());
    EXPECT_EQ(0u, zsh.find("# zsh completion"));
    EXPECT_NE(std::string::npos, zsh.find("bashcompinit && bashcompinit\n"));
    EXPECT_NE(std::string::npos, zsh.find(bash));

    std::string const fish = CompletionScript("fish", *root, Source());
    EXPECT_NE(std::string::npos, fish.find("complete -c 'haldencli' -n '__haldencli_at \\'network nic\\'' -a 'set' "
                                           "-d 'Set a NIC.'\n"));
    EXPECT_NE(std::string::npos, fish.find("-l 'duplex' -s 'd' -x -a '\\'full\\' \\'half\\'' -d 'Duplex:'\n"));
    EXPECT_NE(std::string::npos, fish.find("-l 'vswitch-name' -s 'v' -x -a '(__haldencli_names \\'vswitch-name\\')'"));
    EXPECT_NE(std::string::npos, fish.find("-l formatter -x -a '\\'simple\\' \\'json\\''"));

    EXPECT_THROW(CompletionScript("tcsh", *root, Source()), UsageError);
}

namespace {

class PlinthCompletionEntry : public ::testing::Test {
protected:
    PlinthCompletionEntry() : root_(SmallTree()), tool_(root_, "haldencli", nullptr) {
        tool_.SetHostNames({"vswitch-name", "portgroup-name"},
                           [this](std::string const& parameter, std::string const& host) {
                               asked_.push_back(parameter + "@" + host);
                               if (host == "broken") throw std::runtime_error("no such host");
                               return std::vector<std::string>{"switch0", "Guest Network"};
                           });
    }

    int Run(std::vector<std::string> const& words) {
        out_.str("");
        err_.str("");
        return tool_.Run(words, out_, err_);
    }

    boost::shared_ptr<Namespace> root_;
    Tool tool_;
    std::vector<std::string> asked_;
    std::ostringstream out_;
    std::ostringstream err_;
};

}  // namespace

TEST_F(PlinthCompletionEntry, CompletionPrintsTheScriptOrRefusesTheShell) {
    EXPECT_EQ(0, Run({"--completion", "bash"}));
    EXPECT_NE(std::string::npos, out_.str().find("complete -F _haldencli 'haldencli'"));
    EXPECT_EQ("", err_.str());
    EXPECT_EQ(0, Run({"--completion=fish"}));
    EXPECT_NE(std::string::npos, out_.str().find("complete -c 'haldencli' -f\n"));

    EXPECT_EQ(2, Run({"--completion", "tcsh"}));
    EXPECT_EQ("", out_.str());
    EXPECT_EQ(0u, err_.str().find("Error: Unknown shell 'tcsh' for --completion; choose bash, zsh or fish.\n\nUsage:"));
    EXPECT_EQ(2, Run({"--completion", "bash", "network"}));
    EXPECT_EQ(0u, err_.str().find("Error: Unexpected argument 'network': --completion takes no command path.\n"));
    EXPECT_EQ(2, Run({"--completion", "bash", "--batch", "-"}));
    EXPECT_EQ(2, Run({"--completion"}));
}

TEST_F(PlinthCompletionEntry, CompleteNamesAsksTheHookAndNeverFails) {
    EXPECT_EQ(0, Run({"--host", "/tmp/h.db", "--complete-names", "portgroup-name"}));
    EXPECT_EQ("switch0\nGuest Network\n", out_.str());
    EXPECT_EQ((std::vector<std::string>{"portgroup-name@/tmp/h.db"}), asked_);

    EXPECT_EQ(0, Run({"--complete-names=vswitch-name"}));
    EXPECT_EQ("switch0\nGuest Network\n", out_.str());
    EXPECT_EQ("vswitch-name@", asked_.back());

    // A parameter that names no host objects is not asked for.
    EXPECT_EQ(0, Run({"--complete-names", "duplex"}));
    EXPECT_EQ("", out_.str());
    EXPECT_EQ(2u, asked_.size());

    EXPECT_EQ(0, Run({"--host", "broken", "--complete-names", "vswitch-name"}));
    EXPECT_EQ("", out_.str());
    EXPECT_EQ("", err_.str());

    // The entry is hidden from the help.
    EXPECT_EQ(0, Run({"--help"}));
    EXPECT_EQ(std::string::npos, out_.str().find("complete-names"));
    EXPECT_NE(std::string::npos, out_.str().find("--completion=<str>"));
}

TEST(HostObjectNames, NamesEachKindOfTheOpenHost) {
    using Trellis::Host::ObjectKind;
    using Trellis::Host::ObjectNames;
    TempHost host;
    EXPECT_EQ((std::vector<std::string>{"switch0"}), ObjectNames(ObjectKind::StandardSwitch));
    std::vector<std::string> const portGroups = ObjectNames(ObjectKind::PortGroup);
    EXPECT_NE(portGroups.end(), std::find(portGroups.begin(), portGroups.end(), "Guest Network"));
    EXPECT_NE(portGroups.end(), std::find(portGroups.begin(), portGroups.end(), "Host Management"));
    std::vector<std::string> const nics = ObjectNames(ObjectKind::PhysicalNic);
    EXPECT_NE(nics.end(), std::find(nics.begin(), nics.end(), "pnet0"));
    EXPECT_NE(nics.end(), std::find(nics.begin(), nics.end(), "pnet1"));
    EXPECT_EQ("tsl0", ObjectNames(ObjectKind::KernelInterface).at(0));
    std::vector<std::string> const rulesets = ObjectNames(ObjectKind::FirewallRuleset);
    EXPECT_NE(rulesets.end(), std::find(rulesets.begin(), rulesets.end(), "sshServer"));
    EXPECT_NE(rulesets.end(), std::find(rulesets.begin(), rulesets.end(), "dns"));
    EXPECT_EQ((std::vector<std::string>{"defaultTcpipStack"}), ObjectNames(ObjectKind::Netstack));
    EXPECT_FALSE(ObjectNames(ObjectKind::DistributedSwitch).empty());
}

TEST(HostObjectNames, WithoutAnOpenHostItThrows) {
    Trellis::Host::CloseHost();
    EXPECT_THROW(Trellis::Host::ObjectNames(Trellis::Host::ObjectKind::Netstack), std::exception);
}

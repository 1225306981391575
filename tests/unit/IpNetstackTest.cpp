// network ip netstack: values configured and in force, the order of set's
// changes, the algorithm choices that come from the host, and each
// command's report of a host failure. Refusals as the user sees them are in
// tests/cli/netstack.test.sh.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "FailureOf.h"
#include "IpNetstackInstanceAdd.h"
#include "IpNetstackInstanceGet.h"
#include "IpNetstackInstanceList.h"
#include "IpNetstackInstanceRemove.h"
#include "IpNetstackInstanceSet.h"
#include "RoutingTestSupport.h"
#include "TempHost.h"
#include "plinth/callspec/ParameterSpec.h"
#include "plinth/cli/UsageError.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using namespace RoutingTest;
using Trellis::Host::ArmFault;

namespace {

CommandRun Set(std::vector<std::string> words) {
    words.insert(words.begin(), {"-N", "backupStack"});
    return RunCommand<IpNetstackInstanceSet>(words);
}

CommandRun Get() { return RunCommand<IpNetstackInstanceGet>({"-N", "backupStack"}); }
Json Got() { return Get().Parsed().at(0); }

}  // namespace

TEST(IpNetstackInstance, ADisabledInstanceIsCreatedBeforeSetStoresItsNewLimit) {
    TempHost host;
    CommandRun run = RunCommand<IpNetstackInstanceAdd>({"-N", "backupStack", "--disabled"});
    ExpectDone(run);
    EXPECT_EQ(RunCommand<IpNetstackInstanceGet>({"--netstack", "backupStack"}).Json(),
              R"([{"Key":"backupStack","Name":"backupStack","Enabled":false,"Max Connections":11000,)"
              R"("Current Max Connections":11000,"Congestion Control Algorithm":"newreno","IPv6 Enabled":true,)"
              R"("Current IPv6 Enabled":true,"State":0}])");

    EXPECT_EQ(Set({"-m", "20000", "-i", "false", "-n", "Backup", "-c", "cubic"}).errors, Errors{});
    EXPECT_EQ(Got()["Current Max Connections"], 11000);  // not created yet
    // Created first, taking 20000 and IPv6 off into force; 30000 is stored after.
    EXPECT_EQ(Set({"-m", "30000", "-e", "true", "-n", ""}).errors, Errors{});
    EXPECT_EQ(Got(), Json::parse(R"({"Key":"backupStack","Name":"Backup","Enabled":true,"Max Connections":30000,
        "Current Max Connections":20000,"Congestion Control Algorithm":"cubic","IPv6 Enabled":false,
        "Current IPv6 Enabled":false,"State":4660})"));

    std::string before = Trellis::Host::ExportHost();
    EXPECT_EQ(Set({}).Json(), "true");
    EXPECT_EQ(Trellis::Host::ExportHost(), before);
}

TEST(IpNetstackInstance, ListsInTheOrderAddedAndRemoves) {
    TempHost host;
    EXPECT_EQ(RunCommand<IpNetstackInstanceAdd>({"-N", "backupStack"}).errors, Errors{});
    EXPECT_EQ(RunCommand<IpNetstackInstanceList>().Json(),
              R"([{"Key":"defaultTcpipStack","Name":"defaultTcpipStack","State":4660},)"
              R"({"Key":"backupStack","Name":"backupStack","State":4660}])");
    EXPECT_EQ(RunCommand<IpNetstackInstanceRemove>({"-N", "backupStack"}).Json(), "true");
    EXPECT_EQ(Netstack("backupStack"), nullptr);
    for (const CommandRun& run : {RunCommand<IpNetstackInstanceGet>({"-N", "nope"}),
                                  RunCommand<IpNetstackInstanceSet>({"-N", "nope", "-n", "Nope"})}) {
        ExpectFailure(run, "Unable to find a Netstack instance nope");
    }
}

TEST(IpNetstackInstanceSet, OffersTheHostsAlgorithmsAndRefusesOthers) {
    TempHost host;
    boost::shared_ptr<IpNetstackInstanceSet> command = IpNetstackInstanceSet::New();
    using Choices = std::vector<Plinth::CallSpec::ParameterConstraint::StringEnumValue>;
    Choices choices;
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = command->GetInputSpec();
    for (const auto& parameter : inputSpec->GetParameters())
        if (parameter->GetName() == "ccalgo") choices = parameter->GetConstraint()->GetStringEnum();
    EXPECT_EQ(choices, (Choices{{"newreno", "Set newreno as the algorithm"}, {"cubic", "Set cubic as the algorithm"}}));
    EXPECT_THROW(RunCommand<IpNetstackInstanceSet>({"-N", "defaultTcpipStack", "-c", "bbr"}), Plinth::Cli::UsageError);

    ArmFault({"NetstackInstanceImpl::GetCongestionControlAlgorithmList", "algorithms unavailable", 0, 1});
    EXPECT_EQ(FailureOf([&] { command->GetInputSpec(); }), "algorithms unavailable");
}

TEST(IpNetstackInstance, EachCommandReportsAHostFailureInItsOwnWords) {
    TempHost host([](Json& d) { AddBackupStack(d); });
    struct Case {
        const char* operation;
        std::function<CommandRun()> run;
        std::string text;
    };
    const std::vector<Case> cases = {
        {"NetworkInfoImpl::AddNetstackInstance", [] { return RunCommand<IpNetstackInstanceAdd>({"-N", "x"}); },
         "Unable to add Netstack Instance. Error was : stack busy"},
        {"NetstackInstance::GetCurrentIpv6Enabled", [] { return Get(); },
         "Error getting Netstack instance configuration. . Error was : stack busy"},
        {"NetstackInstance::GetState", [] { return RunCommand<IpNetstackInstanceList>(); }, "stack busy"},
        {"NetworkInfoImpl::RemoveNetstackInstance", [] { return RunCommand<IpNetstackInstanceRemove>({"-N", "x"}); },
         "Unable to Remove Netstack Instance. Error was : stack busy"},
        // Disable is called for an instance out of the kernel too.
        {"NetstackInstance::Disable", [] { return Set({"-n", "Backup", "-e", "false", "-m", "500"}); },
         "Error setting configuration for the netstack instance . Error was : stack busy"},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.operation);
        ArmFault({c.operation, "stack busy", 0, 1});
        CommandRun run = c.run();
        ExpectFailure(run, c.text);
    }
    // What set changed before its failure stays; what comes after is not done.
    EXPECT_EQ(Got()["Name"], "Backup");
    EXPECT_EQ(Got()["Max Connections"], 11000);

    ArmFault({"NetworkInfoImpl::NetworkInfoImpl", "no inventory", 0, 1});
    EXPECT_THROW(RunCommand<IpNetstackInstanceList>(), Gantry::Lib::GantryException);
}

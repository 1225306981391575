// network ip ipsec: security associations added (addresses, "any", the
// SPI's hexadecimal forms, keys), listed (SPI and lifetime texts) and removed
// in each of the three forms; policies added and listed, with the star and
// the note for a deleted association; sp remove's fixed text with true; the
// key exchange configuration checked, installed and the daemons restarted;
// and each host failure once. The round trips through the tool are in
// tests/cli/ipservices.test.sh.

#include <sys/stat.h>

#include <fstream>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "IpIpsecSAAdd.h"
#include "IpIpsecSAList.h"
#include "IpIpsecSARemove.h"
#include "IpIpsecSPAdd.h"
#include "IpIpsecSPList.h"
#include "IpIpsecSPRemove.h"
#include "IpIpsecSet.h"
#include "IpsecValues.h"
#include "TempHost.h"
#include "gantry/lib/GantryException.h"
#include "plinth/callspec/Input.h"
#include "trellis/host/Description.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using Json = TempHost::Json;
using Plinth::CallSpec::Input;
using Trellis::Host::ArmFault;
using Errors = std::vector<std::string>;
using Words = std::vector<std::string>;

namespace {

const char* const kWhichRemoval =
    "Can not figure out which operation you want to perform.\n"
    "Remove a unique SA: Only specify the '--sa-name' option to remove a normal SA.\n"
    "Remove an auto SA: Set the '--sa-name' to 'auto'. You should also specify '--sa-source', '--sa-destination' "
    "and '--sa-spi' and omit '--remove-all' when removing an auto SA.\n"
    "Remove all SAs: You should only set the flag '--remove-all' to remove all SAs.";
const char* const kDeletedSaNote =
    "*Some SPs with unique but deleted SAs were found. Please remove these SPs as they cannot be used anymore.";

// An association between two addresses with keys that fit its algorithms.
Words SaAdd(const std::string& name, const std::string& spi, const std::string& source = "2001:db8::10",
            const std::string& destination = "2001:db8::30") {
    return {"-n", name, "-s", source, "-d", destination, "-p", spi, "-e", "aes128-cbc", "-k", "0123456789abcdef",
            "-i", "hmac-sha1", "-K", "0123456789abcdef0123"};
}

Words SpAdd(const std::string& name, Words more) {
    Words words = {"-n", name, "-s", "2001:db8::10/128", "-d", "any", "-p", "0", "-P", "500"};
    words.insert(words.end(), more.begin(), more.end());
    return words;
}

Json Column(const Json& rows, const std::string& title) {
    Json values = Json::array();
    for (const Json& row : rows) values.push_back(row[title]);
    return values;
}

Json SaNames() { return Column(RunCommand<IpIpsecSAList>().Parsed(), "Name"); }
Json SpNames() { return Column(RunCommand<IpIpsecSPList>().Parsed(), "Name"); }

void ExpectDone(const CommandRun& run) {
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Json(), "true");
}

void ExpectFailure(const CommandRun& run, const std::string& text) {
    EXPECT_EQ(run.errors, Errors{text});
    EXPECT_FALSE(run.HasResult());
}

std::string WriteFile(const std::string& path, const std::string& text) {
    std::ofstream(path) << text;
    return path;
}

}  // namespace

TEST(IpIpsecSAList, ShowsEachAssociationWithItsSpiInHexAndItsLifetime) {
    TempHost host;
    CommandRun run = RunCommand<IpIpsecSAList>();
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Parsed(), Json::parse(R"([
        {"Name":"sa-web","Source Address":"2001:db8::10","Destination Address":"2001:db8::21","State":"mature",
         "SPI":"0x1000","Mode":"transport","Encryption Algorithm":"aes128-cbc","Integrity Algorithm":"hmac-sha1",
         "Lifetime":"1h "},
        {"Name":"sa-db","Source Address":"2001:db8::10","Destination Address":"2001:db8::22","State":"mature",
         "SPI":"0x1001","Mode":"tunnel","Encryption Algorithm":"3des-cbc","Integrity Algorithm":"hmac-sha2-256",
         "Lifetime":"infinite"},
        {"Name":"","Source Address":"2001:db8::21","Destination Address":"2001:db8::10","State":"mature",
         "SPI":"0xc0de","Mode":"transport","Encryption Algorithm":"aes128-cbc","Integrity Algorithm":"hmac-sha1",
         "Lifetime":"1h 30m "}])"));
    EXPECT_EQ(run.hints.at("fields:SecurityAssociation"),
              "Name,Source Address,Destination Address,State,SPI,Mode,Encryption Algorithm,Integrity Algorithm,"
              "Lifetime");
}

TEST(IpIpsecSAList, ALifetimeNamesItsNonZeroPartsEachWithATrailingBlank) {
    EXPECT_EQ(ConvertToHrsMinsAndSecs(0), "infinite");
    EXPECT_EQ(ConvertToHrsMinsAndSecs(3661), "1h 1m 1s ");
    EXPECT_EQ(ConvertToHrsMinsAndSecs(3600), "1h ");
    EXPECT_EQ(ConvertToHrsMinsAndSecs(90), "1m 30s ");
    EXPECT_EQ(ConvertToHrsMinsAndSecs(7201), "2h 1s ");
    EXPECT_EQ(ConvertToHrsMinsAndSecs(18446744073709551615ull), "5124095576030431h 15s ");
}

TEST(IpIpsecSAAdd, TheSpiIsHexWithOrWithoutItsPrefixAndMustBeReadWhole) {
    TempHost host;
    ExpectDone(RunCommand<IpIpsecSAAdd>(SaAdd("sa-a", "0x1f")));
    Json added = RunCommand<IpIpsecSAList>().Parsed()[2];
    EXPECT_EQ(added["SPI"], "0x1f");
    EXPECT_EQ(added["Mode"], "any");
    EXPECT_EQ(added["Lifetime"], "infinite");
    // 1f is the same SPI: the host refuses a second association of it.
    ExpectFailure(RunCommand<IpIpsecSAAdd>(SaAdd("sa-b", "1F")),
                  "Unable to add security association sa-b: association sa-a has the same source, destination and "
                  "SPI");
    ExpectDone(RunCommand<IpIpsecSAAdd>(SaAdd("sa-c", "ffffffff")));
    for (const char* spi : {"1g", "0x", "", "1f ", "100000000", "12 34"}) {
        SCOPED_TRACE(spi);
        ExpectFailure(RunCommand<IpIpsecSAAdd>(SaAdd("sa-bad", spi)),
                      std::string("Check the input value for '--sa-spi'. Should be hex integer. Got ") + spi);
    }
    EXPECT_EQ(SaNames(), Json({"sa-web", "sa-db", "sa-a", "sa-c", ""}));
}

TEST(IpIpsecSAAdd, AnyIsTheUnspecifiedAddressAndOnlyNullEncryptionGoesWithoutAKey) {
    TempHost host;
    ExpectDone(RunCommand<IpIpsecSAAdd>({"--sa-name", "sa-any", "--sa-source", "any", "--sa-destination",
                                         "2001:DB8::0:40", "--sa-mode", "tunnel", "--sa-spi", "7",
                                         "--encryption-algorithm", "null", "--integrity-algorithm", "hmac-sha2-256",
                                         "--integrity-key", "0123456789abcdef0123456789abcdef"}));
    Json added = RunCommand<IpIpsecSAList>().Parsed()[2];
    EXPECT_EQ(added["Source Address"], "::");
    EXPECT_EQ(added["Destination Address"], "2001:db8::40");
    EXPECT_EQ(added["Mode"], "tunnel");
    EXPECT_EQ(added["Encryption Algorithm"], "null");

    Words withoutKey = {"-n", "sa-nokey", "-s", "any", "-d", "any", "-p", "8", "-e", "3des-cbc",
                        "-i", "hmac-sha1", "-K", "0123456789abcdef0123"};
    ExpectFailure(RunCommand<IpIpsecSAAdd>(withoutKey), "Missing encryption key");
    // The SPI is checked before the key is missed.
    withoutKey[7] = "zz";
    ExpectFailure(RunCommand<IpIpsecSAAdd>(withoutKey),
                  "Check the input value for '--sa-spi'. Should be hex integer. Got zz");
    // "any" is compared exactly; other text is the address's affair.
    ExpectFailure(RunCommand<IpIpsecSAAdd>(SaAdd("sa-x", "9", "ANY")), "Invalid IPv6 address: ANY");
    ExpectFailure(RunCommand<IpIpsecSAAdd>(SaAdd("sa-x", "9", "2001:db8::10", "192.0.2.1")),
                  "Invalid IPv6 address: 192.0.2.1");
    EXPECT_EQ(SaNames(), Json({"sa-web", "sa-db", "sa-any", ""}));
}

TEST(IpIpsecSARemove, RemovesByNameTheAutomaticOneOrAll) {
    TempHost host;
    ExpectDone(RunCommand<IpIpsecSARemove>({"--sa-name", "sa-db"}));
    EXPECT_EQ(SaNames(), Json({"sa-web", ""}));
    // The automatic form takes the addresses as they stand and reads the SPI
    // as far as the stream gets: "c0deZ" is 0xc0de.
    ExpectFailure(RunCommand<IpIpsecSARemove>({"-n", "auto", "-s", "any", "-d", "2001:db8::10", "-p", "c0de"}),
                  "Invalid IPv6 address: any");
    ExpectDone(RunCommand<IpIpsecSARemove>({"-n", "auto", "-s", "2001:db8::21", "-d", "2001:db8::10", "-p", "c0deZ"}));
    EXPECT_EQ(SaNames(), Json({"sa-web"}));
    ExpectDone(RunCommand<IpIpsecSARemove>({"--remove-all"}));
    EXPECT_EQ(RunCommand<IpIpsecSAList>().Json(), "[]");
}

TEST(IpIpsecSARemove, AnyOtherCombinationGetsTheLongTextAndRemovesNothing) {
    TempHost host;
    const std::vector<Words> combinations = {
        {},
        {"-a", "-n", "sa-web"},
        {"-n", "sa-web", "-p", "1000"},
        {"-n", "auto", "-s", "2001:db8::21", "-d", "2001:db8::10"},
        {"-n", "auto", "-s", "2001:db8::21", "-d", "2001:db8::10", "-p", "c0de", "-a"},
        {"-s", "2001:db8::21", "-d", "2001:db8::10", "-p", "c0de"},
        {"-a", "-p", "c0de"},
    };
    for (const Words& words : combinations) {
        SCOPED_TRACE(::testing::PrintToString(words));
        ExpectFailure(RunCommand<IpIpsecSARemove>(words), kWhichRemoval);
    }
    EXPECT_EQ(SaNames(), Json({"sa-web", "sa-db", ""}));
    ExpectFailure(RunCommand<IpIpsecSARemove>({"-n", "nope"}),
                  "Unable to remove security association nope: there is none of that name");
}

TEST(IpIpsecSPList, ShowsEachPolicyAndStarsAndNotesTheOnesWhoseAssociationWasRemoved) {
    TempHost host;
    CommandRun run = RunCommand<IpIpsecSPList>();
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Parsed(), Json::parse(R"([
        {"Name":"sp-web-out","Source Address":"2001:db8::10/128","Source Port":0,
         "Destination Address":"2001:db8::21/128","Destination Port":443,"Protocol":"tcp","Flow":"out",
         "Action":"ipsec","Mode":"transport","SA Name":"sa-web"},
        {"Name":"sp-web-in","Source Address":"2001:db8::21/128","Source Port":443,
         "Destination Address":"2001:db8::10/128","Destination Port":0,"Protocol":"tcp","Flow":"in",
         "Action":"ipsec","Mode":"transport","SA Name":"sa-web"},
        {"Name":"sp-drop","Source Address":"::/0","Source Port":0,"Destination Address":"2001:db8::10/128",
         "Destination Port":161,"Protocol":"udp","Flow":"in","Action":"discard","Mode":"any","SA Name":""}])"));
    EXPECT_EQ(run.hints.at("fields:SecurityPolicy"),
              "Name,Source Address,Source Port,Destination Address,Destination Port,Protocol,Flow,Action,Mode,SA Name");

    ExpectDone(RunCommand<IpIpsecSARemove>({"-n", "sa-web"}));
    run = RunCommand<IpIpsecSPList>();
    EXPECT_EQ(run.errors, Errors{kDeletedSaNote});
    EXPECT_TRUE(run.finished);
    EXPECT_EQ(Column(run.Parsed(), "SA Name"), Json({"UNKNOWN*", "UNKNOWN*", ""}));
}

TEST(IpIpsecSPAdd, OnlyAnIpsecPolicyKeepsItsModeAndAssociation) {
    TempHost host;
    ExpectDone(RunCommand<IpIpsecSPAdd>(
        SpAdd("sp-ike", {"-A", "ipsec", "-a", "sa-db", "-m", "tunnel", "-u", "udp", "-w", "out"})));
    ExpectDone(RunCommand<IpIpsecSPAdd>(SpAdd("sp-none", {"-A", "none", "-a", "sa-db", "-m", "tunnel"})));
    ExpectDone(RunCommand<IpIpsecSPAdd>({"--sp-name", "sp-any", "--sp-source", "any", "--sp-destination",
                                         "2001:DB8::5:0/112", "--source-port", "0", "--destination-port", "0"}));
    Json rows = RunCommand<IpIpsecSPList>().Parsed();
    ASSERT_EQ(rows.size(), 6u);
    EXPECT_EQ(rows[3], Json::parse(R"({"Name":"sp-ike","Source Address":"2001:db8::10/128","Source Port":0,
        "Destination Address":"::/0","Destination Port":500,"Protocol":"udp","Flow":"out","Action":"ipsec",
        "Mode":"tunnel","SA Name":"sa-db"})"));
    EXPECT_EQ(rows[4]["Action"], "none");
    EXPECT_EQ(rows[4]["Mode"], "any");
    EXPECT_EQ(rows[4]["SA Name"], "");
    EXPECT_EQ(rows[5], Json::parse(R"({"Name":"sp-any","Source Address":"::/0","Source Port":0,
        "Destination Address":"2001:db8::5:0/112","Destination Port":0,"Protocol":"any","Flow":"none",
        "Action":"none","Mode":"any","SA Name":""})"));

    // A discard policy drops an association the host does not know.
    ExpectDone(RunCommand<IpIpsecSPAdd>(SpAdd("sp-discard", {"-A", "discard", "-a", "nope"})));
    ExpectFailure(RunCommand<IpIpsecSPAdd>(SpAdd("sp-bad", {"-A", "ipsec", "-a", "nope"})),
                  "Unable to add security policy sp-bad: there is no security association nope");
    ExpectFailure(RunCommand<IpIpsecSPAdd>({"-n", "sp-bad", "-s", "2001:db8::10", "-d", "any", "-p", "0", "-P", "0"}),
                  "Invalid IPv6 network: 2001:db8::10");
    ExpectFailure(RunCommand<IpIpsecSPAdd>({"-n", "sp-bad", "-s", "any", "-d", "any", "-p", "70000", "-P", "0"}),
                  "Unable to add security policy sp-bad: the port 70000 is outside 0 to 65535");
    EXPECT_EQ(SpNames(), Json({"sp-web-out", "sp-web-in", "sp-drop", "sp-ike", "sp-none", "sp-any", "sp-discard"}));
}

TEST(IpIpsecSPRemove, RemovesOneOrAllAndOtherwiseReportsWithTrue) {
    TempHost host;
    const std::string text = "You should specify exactly one of : --remove-all, --sa-name";
    for (const Words& words : {Words{}, Words{"-a", "-n", "sp-drop"}}) {
        CommandRun run = RunCommand<IpIpsecSPRemove>(words);
        EXPECT_EQ(run.errors, Errors{text});
        EXPECT_EQ(run.Json(), "true");
    }
    EXPECT_EQ(SpNames(), Json({"sp-web-out", "sp-web-in", "sp-drop"}));
    ExpectDone(RunCommand<IpIpsecSPRemove>({"--sp-name", "sp-drop"}));
    EXPECT_EQ(SpNames(), Json({"sp-web-out", "sp-web-in"}));
    ExpectFailure(RunCommand<IpIpsecSPRemove>({"-n", "sp-drop"}),
                  "Unable to remove security policy sp-drop: there is none of that name");
    ExpectDone(RunCommand<IpIpsecSPRemove>({"--remove-all"}));
    EXPECT_EQ(RunCommand<IpIpsecSPList>().Json(), "[]");
}

TEST(IpIpsecSet, AFileTheHostCannotUseIsRefusedWithItsPathAndChangesNothing) {
    TempHost host;
    const std::string before = Trellis::Host::ExportHost();
    const std::string fifo = host.Dir() + "/ike.fifo";
    ASSERT_EQ(::mkfifo(fifo.c_str(), 0600), 0);
    const std::string large = WriteFile(host.Dir() + "/large.conf", "[a]\n" + std::string(64 * 1024, '#'));
    const std::string malformed = WriteFile(host.Dir() + "/bad.conf", "[global]\nlog info\n");
    const std::vector<std::pair<std::string, std::string>> refusals = {
        {host.Dir() + "/none.conf", "it does not exist"},
        {host.Dir(), "it is a directory"},
        {fifo, "it is a FIFO, not a regular file"},
        {large, "it is larger than 65536 bytes"},
        {malformed, "line 2 is neither a [section] nor a name = value setting"},
    };
    for (const auto& [path, reason] : refusals) {
        SCOPED_TRACE(path);
        ExpectFailure(RunCommand<IpIpsecSet>({"--ike-conf", path}),
                      "Unable to use the IKE configuration " + path + ": " + reason);
    }
    EXPECT_EQ(Trellis::Host::ExportHost(), before);
}

TEST(IpIpsecSet, AGoodFileIsInstalledWithItsPath) {
    TempHost host;
    const std::string text = "[global]\nlog = info\n\n[peer]\naddress = 2001:db8::21\n";
    const std::string good = WriteFile(host.Dir() + "/ike.conf", text);
    ExpectDone(RunCommand<IpIpsecSet>({"-f", good}));
    Json ike = Json::parse(Trellis::Host::ExportHost())["ipsec"]["ikeConfig"];
    EXPECT_EQ(ike["sourcePath"], good);
    EXPECT_EQ(ike["lines"], Json({"[global]", "log = info", "", "[peer]", "address = 2001:db8::21"}));
}

TEST(IpIpsecSet, EachStepsFailureStopsTheStepsBehindIt) {
    TempHost host;
    const std::string good = WriteFile(host.Dir() + "/ike.conf", "[global]\nlog = info\n");
    const std::string before = Trellis::Host::ExportHost();
    ArmFault({"IpSecConfigImpl::CheckIKEConfig", "busy", 0, 1});
    ExpectFailure(RunCommand<IpIpsecSet>({"-f", good}), "busy");
    ArmFault({"IpSecConfigImpl::CopyIKEConfig", "busy", 0, 1});
    ExpectFailure(RunCommand<IpIpsecSet>({"-f", good}), "busy");
    EXPECT_EQ(Trellis::Host::ExportHost(), before);
    // The file is installed before the restart fails.
    ArmFault({"Trellis_Exec", "", 3, 1});
    ExpectFailure(RunCommand<IpIpsecSet>({"-f", good}),
                  "Unable to restart the IKE daemons: /etc/init.d/iked restart returned 3");
    ArmFault({"IpSecConfigImpl::RestartIKEDaemons", "busy", 0, 1});
    ExpectFailure(RunCommand<IpIpsecSet>({"-f", good}), "busy");
}

TEST(IpIpsec, AHostFailureIsReportedWithoutAResult) {
    TempHost host;
    struct Case {
        const char* operation;
        std::function<CommandRun()> run;
    };
    const Words goodSa = SaAdd("sa-new", "99");
    const Words goodSp = SpAdd("sp-new", {"-A", "ipsec", "-a", "sa-web", "-m", "transport", "-u", "tcp", "-w", "in"});
    const std::vector<Case> cases = {
        {"IpSecConfigImpl::StringToIpSecMode", [&] { return RunCommand<IpIpsecSAAdd>(goodSa); }},
        {"IpSecConfigImpl::StringToIpSecEncyptAlgo", [&] { return RunCommand<IpIpsecSAAdd>(goodSa); }},
        {"IpSecConfigImpl::StringToIpSecAuthAlgo", [&] { return RunCommand<IpIpsecSAAdd>(goodSa); }},
        {"IpSecConfigImpl::AddSADConfig", [&] { return RunCommand<IpIpsecSAAdd>(goodSa); }},
        {"IpSecConfigImpl::GetSADConfigList", [] { return RunCommand<IpIpsecSAList>(); }},
        {"IpSecConfigImpl::RemoveSADConfig", [] { return RunCommand<IpIpsecSARemove>({"-n", "sa-web"}); }},
        {"IpSecConfigImpl::RemoveAutoSADConfig",
         [] { return RunCommand<IpIpsecSARemove>({"-n", "auto", "-s", "2001:db8::21", "-d", "2001:db8::10", "-p", "c0de"}); }},
        {"IpSecConfigImpl::FlushSADConfig", [] { return RunCommand<IpIpsecSARemove>({"-a"}); }},
        {"IpSecConfigImpl::StringToIpSecULProtoType", [&] { return RunCommand<IpIpsecSPAdd>(goodSp); }},
        {"IpSecConfigImpl::StringToIpSecDirection", [&] { return RunCommand<IpIpsecSPAdd>(goodSp); }},
        {"IpSecConfigImpl::StringToIpSecAction", [&] { return RunCommand<IpIpsecSPAdd>(goodSp); }},
        {"IpSecConfigImpl::AddSPDConfig", [&] { return RunCommand<IpIpsecSPAdd>(goodSp); }},
        {"IpSecConfigImpl::GetSPDConfigList", [] { return RunCommand<IpIpsecSPList>(); }},
        {"IpSecConfigImpl::RemoveSPDConfig", [] { return RunCommand<IpIpsecSPRemove>({"-n", "sp-drop"}); }},
        {"IpSecConfigImpl::FlushSPDConfig", [] { return RunCommand<IpIpsecSPRemove>({"-a"}); }},
    };
    const std::string before = Trellis::Host::ExportHost();
    for (const Case& c : cases) {
        SCOPED_TRACE(c.operation);
        ArmFault({c.operation, "busy", 0, 1});
        ExpectFailure(c.run(), "busy");
    }
    EXPECT_EQ(Trellis::Host::ExportHost(), before);
    // Only an ipsec policy maps its mode.
    ArmFault({"IpSecConfigImpl::StringToIpSecMode", "busy", 0, 1});
    ExpectDone(RunCommand<IpIpsecSPAdd>(SpAdd("sp-drop2", {"-A", "discard", "-m", "tunnel"})));
    // The facade is made before the guarded block: its failure is not reported.
    ArmFault({"IpSecConfigImpl::IpSecConfigImpl", "busy", 0, 1});
    EXPECT_THROW(RunCommand<IpIpsecSAList>(), Gantry::Lib::GantryException);
}

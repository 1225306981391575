// network nic register dump, eeprom dump, eeprom change and selftest run:
// the rows of the dumps, the checks of eeprom change and the files it
// hands to the host, the framework error that every self test ends in, and
// each command's report of a host failure. What a user sees of them is in
// tests/cli/nicdiag.test.sh.

#include <sys/stat.h>

#include <fstream>
#include <functional>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "CommandRunner.h"
#include "NicEepromChange.h"
#include "NicEepromDump.h"
#include "NicRegisterDump.h"
#include "NicSelfTestRun.h"
#include "TempHost.h"
#include "gantry/lib/GantryException.h"
#include "plinth/cli/UsageError.h"
#include "plinth/metaobj/MetaBool.h"
#include "plinth/metaobj/MetaListRef.h"
#include "trellis/host/Faults.h"

using namespace KorvexCli::NetworkNamespace;
using Json = TempHost::Json;
using Errors = std::vector<std::string>;
using Trellis::Host::ArmFault;

namespace {

const std::string kMagic0 = "284917894";  // 0x10fb8086, pnet0's
const std::string kRow0 = "c6 7e 81 6b 4b fb e2 fb 54 f6 bd df 7c 1c e1 87 ";
const std::string kRow1 = "01 bf 31 de 56 72 0f 47 67 66 87 59 aa 88 3c 59 ";

Json Row(const std::string& offset, const std::string& value) { return {{"Offset", offset}, {"Value", value}}; }

Json Dump(const std::vector<std::string>& words) {
    CommandRun run = RunCommand<NicEepromDump>(words);
    EXPECT_EQ(run.errors, Errors{});
    return run.Parsed();
}

void ExpectFailure(const CommandRun& run, const std::string& text) {
    EXPECT_EQ(run.errors, Errors{text});
    EXPECT_FALSE(run.HasResult());
}

// eeprom change delivers MetaBool::New() as made: unset, reading false.
void ExpectUnsetBool(const CommandRun& run) {
    auto result = boost::dynamic_pointer_cast<Plinth::MetaObj::MetaBool>(run.result);
    ASSERT_TRUE(result);
    EXPECT_FALSE(result->IsSet());
    EXPECT_FALSE(result->GetValue());
    EXPECT_EQ(run.Json(), "null");
}

CommandRun Change(std::vector<std::string> words) {
    words.insert(words.begin(), {"-n", "pnet0", "-m", kMagic0});
    return RunCommand<NicEepromChange>(words);
}

std::string WriteFile(const TempHost& host, const std::string& name, const std::string& content) {
    std::string path = host.Dir() + "/" + name;
    std::ofstream(path, std::ios::binary) << content;
    return path;
}

}  // namespace

TEST(NicRegisterDump, RowsOfSixteenWholeRegistersWithOffsetsThatCountRegisters) {
    TempHost host;
    CommandRun run = RunCommand<NicRegisterDump>({"-n", "pnet0"});
    EXPECT_EQ(run.errors, Errors{});
    EXPECT_EQ(run.Parsed(),
              Json::array({Row("0000", "80004 00 00 10000 4000000d 00 10d88086 30 400 12345678 ffff 9abcdef0 01 80 "
                                       "deadbeef 02 "),
                           Row("0010", "2a ")}));
    EXPECT_EQ(RunCommand<NicRegisterDump>({"-n", "pnet6"}).Json(), "[]");
}

TEST(NicEepromDump, TheFirstRowIsAlignedToSixteenBytesAndAlwaysMade) {
    TempHost host;
    EXPECT_EQ(Dump({"-n", "pnet0", "-o", "19", "-l", "20"}),
              Json::array({Row("0010", std::string(9, ' ') + "de 56 72 0f 47 67 66 87 59 aa 88 3c 59 "),
                           Row("0020", "ea 56 13 7b d2 85 a1 ")}));
    Json whole = Dump({"-n", "pnet0"});
    ASSERT_EQ(whole.size(), 4u);
    EXPECT_EQ(whole[0], Row("0000", kRow0));
    EXPECT_EQ(whole[3], Row("0030", "da 02 79 98 cc e3 1a 76 8e 5f d9 99 8f 1f 3f 36 "));
    // A row boundary reached exactly: no empty row after it.
    EXPECT_EQ(Dump({"-n", "pnet0", "-o", "16", "-l", "16"}), Json::array({Row("0010", kRow1)}));

    // No bytes at all: the first row alone, of fillers.
    EXPECT_EQ(Dump({"-n", "pnet6", "-o", "5"}), Json::array({Row("0000", std::string(15, ' '))}));
    EXPECT_EQ(Dump({"-n", "pnet6"}), Json::array({Row("0000", "")}));
}

TEST(NicEepromDump, HugeAndNegativeNumbersReachTheHostAsUnsignedAndBuildNothingOfTheirSize) {
    TempHost host;
    const Json pastTheEnd = Json::array({Row("fffffff0", std::string(45, ' '))});
    EXPECT_EQ(Dump({"-n", "pnet0", "-o", "-1"}), pastTheEnd);
    EXPECT_EQ(Dump({"-n", "pnet0", "-o", "-1", "-l", "-1"}), pastTheEnd);
    EXPECT_EQ(Dump({"-n", "pnet0", "-o", "9223372036854775807", "-l", "9223372036854775807"}), pastTheEnd);
    EXPECT_EQ(Dump({"-n", "pnet0", "-o", "48", "-l", "-1"}).size(), 1u);
}

TEST(NicEepromChange, RefusesOptionsThatDoNotGoTogetherAndWritesNothing) {
    TempHost host;
    const std::string before = Trellis::Host::ExportHost();
    const std::string need = "Need to specify atleast one of --offset, --value or --file";
    ExpectFailure(Change({"-o", "4"}), need);
    ExpectFailure(Change({"-v", "1"}), need);
    ExpectFailure(Change({}), need);
    const std::string both = "Parameter --file can't be specified together with --offset and --value";
    ExpectFailure(Change({"-f", "/nonexistent", "-v", "1"}), both);
    ExpectFailure(Change({"-f", "/nonexistent", "-o", "4"}), both);
    EXPECT_THROW(RunCommand<NicEepromChange>({"-n", "pnet0", "-o", "0", "-v", "0"}), Plinth::Cli::UsageError);
    // A negative offset reaches the host as unsigned, which refuses it.
    ExpectFailure(Change({"-o", "-1", "-v", "1"}),
                  "EEPROM offset 0xffffffff of physical NIC pnet0 leaves no room for a double word: the EEPROM has "
                  "64 bytes");
    EXPECT_EQ(Trellis::Host::ExportHost(), before);
}

TEST(NicEepromChange, AValueIsWrittenAsALittleEndianDoubleWordAndTheResultLeftUnset) {
    TempHost host;
    CommandRun run = Change({"-o", "4", "-v", "305419896"});  // 0x12345678
    EXPECT_EQ(run.errors, Errors{});
    ExpectUnsetBool(run);
    EXPECT_EQ(Dump({"-n", "pnet0", "-l", "16"}),
              Json::array({Row("0000", "c6 7e 81 6b 78 56 34 12 54 f6 bd df 7c 1c e1 87 ")}));
    EXPECT_EQ(Change({"-o", "60", "-v", "-1"}).errors, Errors{});
    EXPECT_EQ(Dump({"-n", "pnet0", "-o", "60"}), Json::array({Row("0030", std::string(36, ' ') + "ff ff ff ff ")}));
}

TEST(NicEepromChange, AFileIsRefusedUnlessItIsARegularFileThatFitsAndIsWrittenFromTheStart) {
    TempHost host;
    const std::string before = Trellis::Host::ExportHost();
    const std::string fifo = host.Dir() + "/fifo";
    ASSERT_EQ(::mkfifo(fifo.c_str(), 0600), 0);
    const std::string tooLarge = WriteFile(host, "large", std::string(65, 'x'));
    const std::string empty = WriteFile(host, "empty", "");
    const std::string missing = host.Dir() + "/missing";
    for (const auto& [path, reason] :
         std::vector<std::pair<std::string, std::string>>{{missing, "it does not exist"},
                                                          {host.Dir(), "it is a directory"},
                                                          {fifo, "it is a FIFO, not a regular file"},
                                                          {tooLarge, "it is larger than 64 bytes"},
                                                          {empty, "it is empty"}}) {
        ExpectFailure(Change({"-f", path}), "Unable to write the EEPROM of pnet0 from \"" + path + "\": " + reason);
    }
    EXPECT_EQ(Trellis::Host::ExportHost(), before);

    std::string content;
    for (int i = 0; i < 16; ++i) content += static_cast<char>(i * 0x11);
    CommandRun run = Change({"-f", WriteFile(host, "good", content)});
    EXPECT_EQ(run.errors, Errors{});
    ExpectUnsetBool(run);
    EXPECT_EQ(Dump({"-n", "pnet0", "-l", "32"}),
              Json::array({Row("0000", "00 11 22 33 44 55 66 77 88 99 aa bb cc dd ee ff "), Row("0010", kRow1)}));
}

TEST(NicSelfTestRun, ATestThatRanEndsInTheFrameworkErrorOfAListNeverMade) {
    TempHost host;
    for (const std::vector<std::string>& words :
         {std::vector<std::string>{"-n", "pnet0"}, {"-n", "pnet2", "-o", "1"}, {"-n", "pnet6", "-o", "0"}}) {
        try {
            RunCommand<NicSelfTestRun>(words);
            ADD_FAILURE() << words[1] << ": no framework error";
        } catch (const Plinth::MetaObj::ListNotMadeError& e) {
            EXPECT_STREQ(e.what(), "The command appended a row to a result list that was never made.");
        }
    }
    ExpectFailure(RunCommand<NicSelfTestRun>({"-n", "nope"}), "Pnic with name nope not found");
}

TEST(NicDiagnostics, AHostFailureIsReportedAsItsTextWithoutAResult) {
    TempHost host;
    const std::string file = WriteFile(host, "good", "x");
    const std::vector<std::pair<std::string, std::function<CommandRun()>>> paths = {
        {"NetworkInfoImpl::GetPnicByName", [] { return RunCommand<NicRegisterDump>({"-n", "pnet0"}); }},
        {"Pnic::GetRegisterDump", [] { return RunCommand<NicRegisterDump>({"-n", "pnet0"}); }},
        {"Pnic::GetEepromDump", [] { return RunCommand<NicEepromDump>({"-n", "pnet0"}); }},
        {"Pnic::SetEepromValue", [] { return Change({"-o", "0", "-v", "0"}); }},
        {"Pnic::SetEepromFromFile", [&file] { return Change({"-f", file}); }},
        {"Pnic::RunSelfTest", [] { return RunCommand<NicSelfTestRun>({"-n", "pnet0"}); }},
    };
    for (const auto& [operation, run] : paths) {
        SCOPED_TRACE(operation);
        ArmFault({operation, "device busy", 0, 1});
        ExpectFailure(run(), "device busy");
    }
    // Built before the guarded block: its failure leaves the command.
    ArmFault({"NetworkInfoImpl::NetworkInfoImpl", "no inventory", 0, 1});
    EXPECT_THROW(RunCommand<NicEepromDump>({"-n", "pnet0"}), Gantry::Lib::GantryException);
}

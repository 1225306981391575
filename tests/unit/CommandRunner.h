#pragma once

// Runs one command as the tool would: its options parsed and validated
// against its own InputSpec, then Execute, and gives back what the Output
// received.
//
//   TempHost host;
//   CommandRun run = RunCommand<FirewallRulesetSet>({"--ruleset-id", "dns", "--enabled", "false"});
//   EXPECT_EQ(run.errors, std::vector<std::string>{});
//   EXPECT_EQ(run.Json(), "true");
//
// A command line the tool would refuse throws Plinth::Cli::UsageError.

#include <map>
#include <sstream>
#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>
#include <nlohmann/json.hpp>

#include "plinth/callspec/Input.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/cli/FormatHints.h"
#include "plinth/cli/Formatters.h"
#include "plinth/cli/OptionParser.h"
#include "plinth/metaobj/MetaObject.h"
#include "trellis/host/JsonReader.h"

struct CommandRun {
    std::vector<std::string> errors;
    boost::shared_ptr<Plinth::MetaObj::MetaObject> result;  // null when none was set
    bool finished = false;
    boost::shared_ptr<Plinth::MetaObj::MetaObject> shape;
    std::map<std::string, std::string> hints;

    bool HasResult() const { return result != nullptr; }

    // The result as the json formatter prints it, without the line break;
    // "" when there is no result.
    std::string Json() const {
        if (!result) return "";
        std::ostringstream out;
        Plinth::Cli::JsonFormatter().Write(out, result, shape, Plinth::Cli::FormatHints(hints));
        std::string text = out.str();
        while (!text.empty() && text.back() == '\n') text.pop_back();
        return text;
    }

    // The result parsed back, for assertions on single fields.
    Trellis::Host::Json Parsed() const { return Trellis::Host::Json::parse(Json()); }
};

// Runs the command on an Input built by hand, past the tool's checks: for
// the paths of a command that its own InputSpec keeps the tool from reaching.
template <class CommandClass>
CommandRun RunCommandOn(boost::shared_ptr<Plinth::CallSpec::Input> input) {
    boost::shared_ptr<CommandClass> command = CommandClass::New();
    boost::shared_ptr<Plinth::CallSpec::Output> output = Plinth::CallSpec::Output::New();
    command->Execute(input, output);

    CommandRun run;
    run.errors = output->GetErrors();
    run.result = output->GetResult();
    run.finished = output->IsFinished();
    run.shape = command->GetOutputSpec()->GetResultType();
    run.hints = command->GetDefaultOutputFormatParameters();
    return run;
}

template <class CommandClass>
CommandRun RunCommand(const std::vector<std::string>& words = {}) {
    return RunCommandOn<CommandClass>(
        Plinth::Cli::ParseCommandOptions(*CommandClass::New()->GetInputSpec(), words));
}

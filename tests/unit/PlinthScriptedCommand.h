#pragma once

// A command whose specification and behaviour a test sets with lambdas, for
// driving the framework and the tool without a plug-in.
#include <functional>

#include "plinth/Plinth.h"

namespace PlinthTest {

class ScriptedCommand : public virtual Plinth::AutoCli::Command {
public:
    typedef std::function<void(Plinth::CallSpec::Input&, Plinth::CallSpec::Output&)> Body;

    static boost::shared_ptr<ScriptedCommand> New(std::string const& description = "A scripted command.") {
        boost::shared_ptr<ScriptedCommand> command(new ScriptedCommand());
        command->SetDescription(description);
        return command;
    }

    boost::shared_ptr<Plinth::CallSpec::InputSpec> GetInputSpecInternal() override {
        return inputSpec ? inputSpec() : Plinth::CallSpec::InputSpec::New();
    }
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> GetOutputSpecInternal() override {
        boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
        if (shape) outputSpec->SetResultType(shape());
        return outputSpec;
    }
    void ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                         boost::shared_ptr<Plinth::CallSpec::Output> output) override {
        lastInput = input;
        if (body) body(*input, *output);
    }

    std::function<boost::shared_ptr<Plinth::CallSpec::InputSpec>()> inputSpec;
    std::function<boost::shared_ptr<Plinth::MetaObj::MetaObject>()> shape;
    Body body;
    boost::shared_ptr<Plinth::CallSpec::Input> lastInput;

private:
    ScriptedCommand() = default;
};

// A parameter in one call: name, type, short name, help, required.
inline boost::shared_ptr<Plinth::CallSpec::ParameterSpec> MakeParameter(
    std::string const& name, Plinth::CallSpec::ParameterType type, std::string const& shortName = "",
    std::string const& help = "", bool required = false) {
    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> parameter = Plinth::CallSpec::ParameterSpec::New(name, type);
    parameter->SetShortName(shortName);
    parameter->SetDescription(help);
    parameter->SetRequired(required);
    return parameter;
}

}  // namespace PlinthTest

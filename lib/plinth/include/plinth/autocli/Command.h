#pragma once

#include <list>
#include <map>
#include <string>
#include <utility>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "plinth/autocli/NamespaceNode.h"
#include "plinth/callspec/CallTarget.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"

namespace Plinth {
namespace AutoCli {

// A leaf of the tree that can be called. A command class derives from it
// (virtually), describes itself in its constructor (SetDescription,
// SetMetaDataField, SetDefaultOutputFormatter, SetDefaultOutputParameter) and
// implements GetInputSpecInternal, GetOutputSpecInternal and ExecuteInternal.
// The tool calls GetInputSpec, GetOutputSpec and Execute, which call those.
class Command : public virtual CallSpec::CallTarget, public virtual NamespaceNode {
public:
    typedef std::pair<std::string, std::string> Example;  // description, command line

    ~Command() override;

    boost::shared_ptr<CallSpec::InputSpec> GetInputSpec() override;
    boost::shared_ptr<CallSpec::OutputSpec> GetOutputSpec() override;
    void Execute(boost::shared_ptr<CallSpec::Input> input,
                 boost::shared_ptr<CallSpec::Output> output) override;
    boost::shared_ptr<NamespaceNode> GetThis() override;
    // A command has no children: false, null, ignored, and itself.
    bool HasNamespaceNode(std::string const& name) const override;
    boost::shared_ptr<NamespaceNode> GetNamespaceNode(std::string const& name) const override;
    void RegisterNamespaceNode(boost::shared_ptr<NamespaceNode> node, std::string const& name) override;
    boost::shared_ptr<NamespaceNode> ResolveNode(std::list<std::string>& path) override;
    boost::shared_ptr<CallSpec::CallTarget> GetDispatcher() override;
    void SetParent(boost::shared_ptr<NamespaceNode> parent) override;
    boost::shared_ptr<NamespaceNode> GetParent() const override;
    // "command".
    std::string GetType() const override;
    virtual std::vector<Example> GetExamples() const;
    // The formatter hints, by key ("fields:Ruleset" -> "Name,Enabled").
    virtual std::map<std::string, std::string> GetDefaultOutputFormatParameters() const;
    // The last call stands.
    virtual void SetDefaultOutputFormatter(std::string const& formatter);
    // A later call for the same key replaces the value.
    virtual void SetDefaultOutputParameter(std::string const& key, std::string const& value);
    virtual void SetMetaDataField(std::string const& key, std::string const& value);
    // "" when the key was never set.
    virtual std::string GetMetaDataField(std::string const& key) const;
    virtual std::map<std::string, std::string> GetMetaData() const;
    virtual boost::shared_ptr<CallSpec::InputSpec> GetInputSpecInternal() = 0;
    virtual boost::shared_ptr<CallSpec::OutputSpec> GetOutputSpecInternal() = 0;
    // The framework's body reports that the command has no implementation.
    virtual void ExecuteInternal(boost::shared_ptr<CallSpec::Input> input,
                                 boost::shared_ptr<CallSpec::Output> output);
    virtual void AddExample(std::string const& description, std::string const& example);
    // Sets as result a "CommandHelp" structure: the command's path,
    // description, examples and one "CommandOption" per parameter.
    virtual void GenerateHelpOutput(boost::shared_ptr<CallSpec::Input> input,
                                    boost::shared_ptr<CallSpec::Output> output);

    // Beyond the tree's operations: the formatter set by
    // SetDefaultOutputFormatter, "" when none was set.
    std::string GetDefaultOutputFormatter() const;

protected:
    Command() = default;

private:
    std::string defaultFormatter_;
    std::map<std::string, std::string> formatParameters_;
    std::map<std::string, std::string> metaData_;
    std::vector<Example> examples_;
};

}  // namespace AutoCli
}  // namespace Plinth

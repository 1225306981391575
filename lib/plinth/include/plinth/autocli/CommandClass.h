#pragma once

// The members that every command class declares in the same way: New(), the
// private constructor that describes the command, the destructor and the
// three operations that the framework calls. A command's header is then
//
//   class FirewallRulesetSet : public virtual Plinth::AutoCli::Command {
//       PLINTH_COMMAND_CLASS(FirewallRulesetSet)
//   };
//
// with GetOutputStructure() and any helper of its own added after the macro.
// The source defines the constructor, GetInputSpecInternal,
// GetOutputSpecInternal and ExecuteInternal.

#include <boost/shared_ptr.hpp>

#include "plinth/autocli/Command.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/metaobj/MetaStruct.h"

#define PLINTH_COMMAND_CLASS(Class)                                                                        \
public:                                                                                                    \
    static boost::shared_ptr<Class> New() { return boost::shared_ptr<Class>(new Class()); }               \
    ~Class() override {}                                                                                   \
    boost::shared_ptr<Plinth::CallSpec::InputSpec> GetInputSpecInternal() override;                       \
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> GetOutputSpecInternal() override;                     \
    void ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,                                 \
                         boost::shared_ptr<Plinth::CallSpec::Output> output) override;                     \
                                                                                                           \
private:                                                                                                   \
    Class();                                                                                               \
                                                                                                           \
public:

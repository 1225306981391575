#pragma once

// The commands of the test plug-in: one per parameter kind or result shape
// that the tool has to handle, under the "demo" namespace.
#include "plinth/Plinth.h"

namespace Demo {

using Plinth::AutoCli::Command;
using Plinth::CallSpec::Input;
using Plinth::CallSpec::InputSpec;
using Plinth::CallSpec::Output;
using Plinth::CallSpec::OutputSpec;

#define DEMO_COMMAND(Class)                                                                      \
    class Class : public virtual Command {                                                      \
    public:                                                                                     \
        Class();                                                                                \
        static boost::shared_ptr<Class> New() { return boost::shared_ptr<Class>(new Class()); } \
        boost::shared_ptr<InputSpec> GetInputSpecInternal() override;                           \
        boost::shared_ptr<OutputSpec> GetOutputSpecInternal() override;                         \
        void ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) override; \
    }

// demo echo: every parameter kind and constraint; returns what it was given.
DEMO_COMMAND(Echo);
// demo fail: error texts, with or without a result.
DEMO_COMMAND(Fail);
// demo throw: an exception out of ExecuteInternal, after an error text.
DEMO_COMMAND(Throw);
// demo bool: a boolean result.
DEMO_COMMAND(Bool);
// demo nic list: a table of structures with fields, header and unit hints.
DEMO_COMMAND(NicTable);
// demo switch get: nested structures and lists in a simple layout.
DEMO_COMMAND(SwitchGet);

#undef DEMO_COMMAND

}  // namespace Demo

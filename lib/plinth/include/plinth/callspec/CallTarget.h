#pragma once

#include <boost/shared_ptr.hpp>

namespace Plinth {
namespace CallSpec {

class Input;
class InputSpec;
class Output;
class OutputSpec;

// Something that can be called: it tells what it takes and returns, and runs.
class CallTarget {
public:
    virtual ~CallTarget();

    virtual boost::shared_ptr<InputSpec> GetInputSpec() = 0;
    virtual boost::shared_ptr<OutputSpec> GetOutputSpec() = 0;
    virtual void Execute(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) = 0;
};

}  // namespace CallSpec
}  // namespace Plinth

#pragma once

#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "plinth/callspec/ParameterSpec.h"

namespace Plinth {
namespace CallSpec {

// The parameters a command takes, in the order of declaration (which is the
// order of the help). A command without parameters returns an empty one.
class InputSpec {
public:
    static boost::shared_ptr<InputSpec> New();

    virtual ~InputSpec();

    virtual void AddParameter(boost::shared_ptr<ParameterSpec> parameter);

    // Read access for the tool.
    std::vector<boost::shared_ptr<ParameterSpec> > const& GetParameters() const;
    // Null when no parameter has this long (or short) name.
    boost::shared_ptr<ParameterSpec> FindByName(std::string const& name) const;
    boost::shared_ptr<ParameterSpec> FindByShortName(std::string const& shortName) const;

private:
    InputSpec() = default;

    std::vector<boost::shared_ptr<ParameterSpec> > parameters_;
};

}  // namespace CallSpec
}  // namespace Plinth

#pragma once

// The Input of a policy set command as the tool builds it: the words parsed
// and checked against an InputSpec that holds the parameters one of the shared
// Add...Parameters functions declares.

#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/cli/OptionParser.h"

using AddPolicyParameters = void (*)(boost::shared_ptr<Plinth::CallSpec::InputSpec>);

// Throws Plinth::Cli::UsageError for words the tool would refuse.
inline boost::shared_ptr<Plinth::CallSpec::Input> ParsePolicyWords(AddPolicyParameters add,
                                                                   std::vector<std::string> const& words) {
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = Plinth::CallSpec::InputSpec::New();
    add(inputSpec);
    return Plinth::Cli::ParseCommandOptions(*inputSpec, words);
}

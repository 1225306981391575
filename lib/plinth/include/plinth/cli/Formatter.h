#pragma once

#include <memory>
#include <ostream>
#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "plinth/cli/FormatHints.h"
#include "plinth/metaobj/MetaObject.h"

namespace Plinth {
namespace Cli {

// Renders a command's result on the standard output.
class Formatter {
public:
    virtual ~Formatter() = default;

    // result is never null; shape is the result type of the command's
    // OutputSpec (it gives the columns of an empty table), or null.
    virtual void Write(std::ostream& out, boost::shared_ptr<MetaObj::MetaObject> const& result,
                       boost::shared_ptr<MetaObj::MetaObject> const& shape, FormatHints const& hints) const = 0;
};

// simple, table, json, xml, csv, keyvalue.
std::vector<std::string> FormatterNames();
// Null for an unknown name.
std::unique_ptr<Formatter> MakeFormatter(std::string const& name);

}  // namespace Cli
}  // namespace Plinth

#pragma once

#include <string>

#include <boost/shared_ptr.hpp>

#include "plinth/cli/FormatHints.h"
#include "plinth/metaobj/MetaObject.h"

namespace Plinth {
namespace Cli {

// The text of a value on one line, as the text formatters show it: a string
// as it is, an int in decimal, a bool as true/false, an unset value or a null
// pointer as "". A list joins its elements with ", "; a structure shows
// "{Title: value, ...}" with the fields the hints choose for a table.
std::string InlineText(boost::shared_ptr<MetaObj::MetaObject> const& value, FormatHints const& hints);

// text made safe to print on one line of a text formatter: a backslash is
// doubled, tab, line feed and carriage return become \t, \n and \r, every
// other control character and the Unicode line and paragraph separators
// become \u and four hex digits ("\u001b"). Bytes that are not UTF-8 become
// U+FFFD. Apart from them the escaping can be undone.
std::string OneLineText(std::string const& text);

// True for a list whose elements include a structure (shown as blocks).
bool IsStructList(boost::shared_ptr<MetaObj::MetaObject> const& value);

}  // namespace Cli
}  // namespace Plinth

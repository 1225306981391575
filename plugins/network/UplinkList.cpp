#include "UplinkList.h"

#include <boost/regex.hpp>

namespace KorvexCli {
namespace NetworkNamespace {

std::vector<std::string> SplitUplinks(std::string const& text) {
    // Compiled on first use and kept for the life of the process: the one
    // piece of state the plug-in holds after load.
    static const boost::regex comma(",");

    // Submatch -1 yields the text between the commas. The token iterator
    // yields an empty leading part but no empty trailing one, and nothing at
    // all for an empty text.
    boost::sregex_token_iterator part(text.begin(), text.end(), comma, -1);
    boost::sregex_token_iterator end;
    return std::vector<std::string>(part, end);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

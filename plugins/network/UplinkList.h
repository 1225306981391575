#pragma once

#include <string>
#include <vector>

namespace KorvexCli {
namespace NetworkNamespace {

// Cuts a comma-separated list of uplink names into its names, as typed: no
// blank is trimmed and duplicates are kept. A leading comma or two commas in
// a row give an empty name, a trailing comma gives nothing, and an empty text
// gives no names at all.
std::vector<std::string> SplitUplinks(std::string const& text);

}  // namespace NetworkNamespace
}  // namespace KorvexCli

#pragma once

#include <string>

#include "CommandSupport.h"
#include "gantry/network/TslNicTagType.h"

namespace KorvexCli {
namespace NetworkNamespace {

// text followed by the names of the tags in the order of their ids,
// separated by ", ".
std::string WithTagNames(std::string text);
// "Supported tags are: " and the names.
std::string SupportedTagsText();

// The tag of that name, as the host matches names. An unknown name is
// reported twice, "Invalid tag name <name>" and then the supported tags text,
// and gives TSLNIC_TAG_INVALID.
Gantry::Network::TslNicTagType TagNamed(Output& output, std::string const& name);

}  // namespace NetworkNamespace
}  // namespace KorvexCli

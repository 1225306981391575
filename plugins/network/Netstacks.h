#pragma once

#include <string>

#include "gantry/network/TslNicTagType.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The key of the default netstack instance.
extern const char* const kDefaultNetstack;

// The dedicated stacks and their tags: "glide" with the live migration tag,
// "faultTolerance" with the fault tolerance tag, "MeridonProvisioning" with
// the provisioning tag. Keys compare exactly, case included.

// The tag tied to a dedicated stack; TSLNIC_TAG_INVALID for any other key.
Gantry::Network::TslNicTagType TagOfDedicatedStack(std::string const& netstackKey);
// The dedicated stack a tag is tied to; "" for the other tags.
std::string DedicatedStackOfTag(Gantry::Network::TslNicTagType tag);

}  // namespace NetworkNamespace
}  // namespace KorvexCli

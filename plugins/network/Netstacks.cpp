#include "Netstacks.h"

namespace KorvexCli {
namespace NetworkNamespace {

const char* const kDefaultNetstack = "defaultTcpipStack";

namespace {

struct DedicatedStack {
    const char* key;
    Gantry::Network::TslNicTagType tag;
};

const DedicatedStack kDedicatedStacks[] = {
    {"glide", Gantry::Network::TSLNIC_TAG_GLIDE},
    {"faultTolerance", Gantry::Network::TSLNIC_TAG_FAULT_TOLERANCE},
    {"MeridonProvisioning", Gantry::Network::TSLNIC_TAG_PROVISIONING},
};

}  // namespace

Gantry::Network::TslNicTagType TagOfDedicatedStack(std::string const& netstackKey) {
    for (DedicatedStack const& stack : kDedicatedStacks)
        if (netstackKey == stack.key) return stack.tag;
    return Gantry::Network::TSLNIC_TAG_INVALID;
}

std::string DedicatedStackOfTag(Gantry::Network::TslNicTagType tag) {
    for (DedicatedStack const& stack : kDedicatedStacks)
        if (tag == stack.tag) return stack.key;
    return "";
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

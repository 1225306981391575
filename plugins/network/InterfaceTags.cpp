#include "InterfaceTags.h"

#include "trellis/network/TslNicTags.h"

namespace KorvexCli {
namespace NetworkNamespace {

std::string WithTagNames(std::string text) {
    for (int id = Gantry::Network::TSLNIC_TAG_MANAGEMENT; id < Gantry::Network::TSLNIC_TAG_INVALID; ++id)
        text += Trellis::Network::TslNicTagIdToName(static_cast<Gantry::Network::TslNicTagType>(id)) + ", ";
    text.resize(text.size() - 2);
    return text;
}

std::string SupportedTagsText() { return WithTagNames("Supported tags are: "); }

Gantry::Network::TslNicTagType TagNamed(Output& output, std::string const& name) {
    Gantry::Network::TslNicTagType tag = Trellis::Network::TslNicTagNameToId(name);
    if (tag == Gantry::Network::TSLNIC_TAG_INVALID) {
        output.SetError("Invalid tag name " + name);
        output.SetError(SupportedTagsText());
    }
    return tag;
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

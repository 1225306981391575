#include "SoftwareFeatures.h"

namespace KorvexCli {
namespace NetworkNamespace {

std::vector<SoftwareFeature> const& SoftwareFeatures() {
    using P = Gantry::Network::PnicSoftwareParams;
    static const std::vector<SoftwareFeature> features = {
        {"IPv4 CSO", Parameter::Bool("ipv4cso", "", "Configure IPv4 checksum offload software simulation."),
         P::IPV4_CSO, &P::ipv4Cso},
        {"IPv4 TSO",
         Parameter::Bool("ipv4tso", "", "Configure IPv4 TCP segmentation offload software simulation."),
         P::IPV4_TSO, &P::ipv4Tso},
        {"Scatter Gather", Parameter::Bool("sg", "", "Configure scatter gather software simulation."), P::SG,
         &P::sg},
        {"Offset Based Offload",
         Parameter::Bool("obo", "", "Configure offset based encapsulation offload software simulation."), P::OBO,
         &P::obo},
        {"VXLAN Encap",
         Parameter::Bool("vxlanencap", "", "Configure VXLAN encapsulation offload software simulation."),
         P::VXLAN_ENCAP, &P::vxlanEncap},
        {"Geneve Offload",
         Parameter::Bool("geneveoffload", "", "Configure Geneve encapsulation offload software simulation."),
         P::GENEVE_OFFLOAD, &P::geneveOffload},
        {"IPv6 TSO",
         Parameter::Bool("ipv6tso", "", "Configure IPv6 TCP segmentation offload software simulation."),
         P::IPV6_TSO, &P::ipv6Tso},
        {"IPv6 TSO Ext",
         Parameter::Bool("ipv6tsoext", "",
                         "Configure IPv6 extend header TCP segmentation offload software simulation."),
         P::IPV6_TSO_EXT, &P::ipv6TsoExt},
        {"IPv6 CSO", Parameter::Bool("ipv6cso", "", "Configure IPv6 checksum offload software simulation."),
         P::IPV6_CSO, &P::ipv6Cso},
        {"IPv6 CSO Ext",
         Parameter::Bool("ipv6csoext", "", "Configure IPv6 extend header checksum offload software simulation."),
         P::IPV6_CSO_EXT, &P::ipv6CsoExt},
        {"High DMA", Parameter::Bool("highdma", "", "Configure high DMA software simulation."), P::HIGH_DMA,
         &P::highDma},
        {"Scatter Gather MP",
         Parameter::Bool("sgsp", "", "Configure scatter gather span multiple pages software simulation."),
         P::SG_SPAN_PAGES, &P::sgSpanPages},
        {"VLAN Tagging", Parameter::Bool("tagging", "", "Configure TX VLAN tagging software simulation."),
         P::TAGGING, &P::tagging},
        {"VLAN Untagging", Parameter::Bool("untagging", "", "Configure RX VLAN untagging software simulation."),
         P::UNTAGGING, &P::untagging},
    };
    return features;
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "CommandSupport.h"
#include "gantry/network/PnicParams.h"

namespace KorvexCli {
namespace NetworkNamespace {

// One offload feature that the host can simulate in software for a NIC: its
// field in software list, its flag in software set (no short name), its bit
// in the mask and its bool in PnicSoftwareParams.
struct SoftwareFeature {
    std::string field;
    Parameter parameter;
    std::uint32_t bit;
    bool Gantry::Network::PnicSoftwareParams::*value;
};

// The fourteen features, in the order of the list's fields and of set's
// parameters. Geneve came late: sixth here, though its bool stands last in
// the value and its bit is the highest.
std::vector<SoftwareFeature> const& SoftwareFeatures();

}  // namespace NetworkNamespace
}  // namespace KorvexCli

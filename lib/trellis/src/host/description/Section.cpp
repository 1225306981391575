#include "host/description/Section.h"

#include <algorithm>

namespace Trellis {
namespace Host {

namespace {

std::vector<SectionType>& Registry() {
    static std::vector<SectionType> registry;
    return registry;
}

}  // namespace

SectionRegistration::SectionRegistration(std::string key, int order, std::function<std::unique_ptr<Section>()> make) {
    Registry().push_back({std::move(key), order, std::move(make)});
}

std::vector<SectionType> SectionTypes() {
    std::vector<SectionType> types = Registry();
    std::stable_sort(types.begin(), types.end(),
                     [](const SectionType& a, const SectionType& b) { return a.order < b.order; });
    return types;
}

}  // namespace Host
}  // namespace Trellis

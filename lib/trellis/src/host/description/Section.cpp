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

// Sorted once, at the first call, when every section has registered. Kept
// for the program's life: readers hold on to the keys' texts.
const std::vector<SectionType>& SectionTypes() {
    static const std::vector<SectionType> types = [] {
        std::vector<SectionType> sorted = Registry();
        std::stable_sort(sorted.begin(), sorted.end(),
                         [](const SectionType& a, const SectionType& b) { return a.order < b.order; });
        return sorted;
    }();
    return types;
}

}  // namespace Host
}  // namespace Trellis

// Host descriptions: any text is refused with a DescriptionError, or imported
// whole; an imported host exports a description that imports to the same
// export.

#include <cstddef>
#include <cstdint>
#include <string>

#include "FuzzHost.h"
#include "trellis/host/JsonReader.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    OpenFuzzHost();
    const std::string text(reinterpret_cast<const char*>(data), size);
    try {
        Trellis::Host::ImportHost(text);
    } catch (Trellis::Host::DescriptionError const&) {
        return 0;
    }
    const std::string exported = Trellis::Host::ExportHost();
    Trellis::Host::ImportHost(exported);
    if (Trellis::Host::ExportHost() != exported) __builtin_trap();
    return 0;
}

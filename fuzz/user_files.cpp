// The files a user names: an EEPROM's new content and a key exchange
// configuration. Any content is written or refused with a GantryException;
// an EEPROM never grows.

#include <unistd.h>

#include <cstddef>
#include <cstdint>
#include <fstream>
#include <string>
#include <vector>

#include "FuzzHost.h"
#include "network/IkeConfigFile.h"
#include "gantry/lib/GantryException.h"
#include "trellis/network/PnicImpl.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    OpenFuzzHost();
    static const std::string path = "/tmp/halden-fuzz-file." + std::to_string(::getpid());
    std::ofstream(path, std::ios::binary | std::ios::trunc).write(reinterpret_cast<const char*>(data),
                                                                 static_cast<std::streamsize>(size));
    Trellis::Network::PnicImpl pnet0("pnet0");
    std::vector<unsigned char> before, after;
    pnet0.GetEepromDump(before, 0, 0);
    try {
        pnet0.SetEepromFromFile(0x10fb8086, path);
    } catch (Gantry::Lib::GantryException const&) {
    }
    pnet0.GetEepromDump(after, 0, 0);
    if (after.size() != before.size()) __builtin_trap();
    try {
        Trellis::Network::ReadIkeConfig(path, 64 * 1024);
    } catch (Gantry::Lib::GantryException const&) {
    }
    return 0;
}

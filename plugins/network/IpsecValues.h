#pragma once

// How the IPsec commands turn what the user types into the host's values,
// and the host's values into what the lists show.

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace KorvexCli {
namespace NetworkNamespace {

// The word that stands for any address.
extern const char* const kAnyAddress;

// "::" for the word "any" (compared exactly), the text itself otherwise.
std::string AnyAsUnspecified(std::string const& text);

// Reads a hexadecimal SPI, "0x" allowed, into spi, which keeps what the
// stream made of the text even when it fails. True when the whole text was
// a number that fits 32 bits.
bool ReadSpi(std::string const& text, std::uint32_t& spi);

// "0x" and the SPI in lower-case hexadecimal, unpadded.
std::string SpiText(std::uint32_t spi);

// The text of an enumeration's value in one of the host's tables
// (IpSecConfigImpl::SA_MODE and the like).
template <class Enumeration>
std::string const& TextOf(std::vector<std::string> const& table, Enumeration value) {
    return table.at(static_cast<std::size_t>(value));
}

// A lifetime in seconds as "1h 1m 1s ": each non-zero part followed by its
// unit and a blank, the trailing blank kept; 0 is "infinite".
std::string ConvertToHrsMinsAndSecs(unsigned long long seconds);

}  // namespace NetworkNamespace
}  // namespace KorvexCli

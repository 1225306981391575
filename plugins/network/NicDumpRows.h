#pragma once

#include <cstdint>
#include <string>

#include "CommandSupport.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The row layout of the register and EEPROM dumps. Numbers are lower-case
// hexadecimal without a prefix.

// One value of a row: at least two digits, then one blank (the last value
// of a row keeps its blank too).
std::string DumpValueText(std::uint32_t value);

// Fills row with the values and the offset (at least four digits), Value
// first, and appends it to rows.
void AddDumpRow(MetaList& rows, boost::shared_ptr<MetaStruct> row, std::string const& values, unsigned int offset);

}  // namespace NetworkNamespace
}  // namespace KorvexCli

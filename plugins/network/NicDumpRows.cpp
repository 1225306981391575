#include "NicDumpRows.h"

#include <cstdio>

namespace KorvexCli {
namespace NetworkNamespace {

std::string DumpValueText(std::uint32_t value) {
    char text[16];
    std::snprintf(text, sizeof text, "%02x ", static_cast<unsigned int>(value));
    return text;
}

void AddDumpRow(MetaList& rows, boost::shared_ptr<MetaStruct> row, std::string const& values, unsigned int offset) {
    char text[16];
    std::snprintf(text, sizeof text, "%04x", offset);
    row->SetField("Value", values);
    row->SetField("Offset", std::string(text));
    rows.AddMetaStruct(row);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

#pragma once

// Host descriptions within the library: reading, checking, writing into a
// transaction, exporting from one.

#include "host/description/Section.h"
#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

class Transaction;

// The description format this build reads and writes.
constexpr int kDescriptionFormat = 1;

// The embedded default description, parsed.
const Json& DefaultDescription();

// Parses JSON text; DescriptionError names the line and column of a syntax error.
Json ParseDescriptionText(const std::string& text);

// Checks a whole description (DescriptionError on the first problem).
ParsedDescription ParseDescription(const Json& description);

// Replaces the host in t with description, checked first.
void WriteDescription(Transaction& t, const Json& description);
void WriteDescription(Transaction& t, const ParsedDescription& description);

Json ExportDescription(const Transaction& t);

// Writes section key of the default description into t (migrations).
void WriteSectionOfDefault(Transaction& t, const std::string& key);

// The canonical text of a description: 2-space indents, a final line break.
std::string DescriptionText(const Json& description);

}  // namespace Host
}  // namespace Trellis

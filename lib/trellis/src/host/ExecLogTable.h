#pragma once

#include <vector>

#include "trellis/host/ExecLog.h"

namespace Trellis {
namespace Host {

class Database;

// The exec_log table, within a transaction that the caller holds.
void AppendExecEntry(Database& db, const ExecEntry& entry);
std::vector<ExecEntry> ReadExecEntries(Database& db);

}  // namespace Host
}  // namespace Trellis

#include "host/ExecLogTable.h"

#include <array>
#include <cstdint>
#include <string>

#include <nlohmann/json.hpp>

#include "gantry/lib/GantryException.h"
#include "host/Sqlite.h"

namespace Trellis {
namespace Host {

namespace {

std::array<bool, 3> ReadOptions(const std::string& text, std::int64_t id) {
    try {
        return nlohmann::json::parse(text).get<std::array<bool, 3>>();
    } catch (const nlohmann::json::exception&) {
        throw Gantry::Lib::GantryException("The host store holds a damaged record: exec log entry " +
                                           std::to_string(id) + ": its options are not three flags");
    }
}

}  // namespace

void AppendExecEntry(Database& db, const ExecEntry& entry) {
    db.Prepare("INSERT INTO exec_log (command_line, options, status) VALUES (?, ?, ?)")
        .Bind(1, entry.commandLine)
        .Bind(2, nlohmann::json(entry.options).dump())
        .Bind(3, entry.status)
        .Run();
}

std::vector<ExecEntry> ReadExecEntries(Database& db) {
    std::vector<ExecEntry> entries;
    Statement query = db.Prepare("SELECT command_line, options, status, id FROM exec_log ORDER BY id");
    while (query.Step()) {
        ExecEntry entry;
        entry.commandLine = query.Text(0);
        entry.options = ReadOptions(query.Text(1), query.Int(3));
        entry.status = static_cast<int>(query.Int(2));
        entries.push_back(entry);
    }
    return entries;
}

}  // namespace Host
}  // namespace Trellis

#include "trellis/host/Transaction.h"

#include <algorithm>
#include <cstdint>
#include <stdexcept>

#include <nlohmann/json.hpp>

#include "host/Sqlite.h"
#include "host/Store.h"
#include "host/StoredText.h"

namespace Trellis {
namespace Host {

namespace {

[[noreturn]] void Damaged(const std::string& kind, const std::string& name, const std::string& problem) {
    throw Gantry::Lib::GantryException("The host store holds a damaged record: " + kind + " \"" + name + "\": " +
                                       problem);
}

Json ParseStored(const std::string& kind, const std::string& name, const std::string& text) {
    try {
        return Json::parse(text);
    } catch (const nlohmann::json::parse_error&) {
        Damaged(kind, name, "its data is not valid JSON");
    }
}

// The data as the store keeps it; a text that is not valid UTF-8 cannot be
// written as JSON.
std::string StorableText(const std::string& kind, const std::string& name, const Json& data) {
    try {
        if (IsValidUtf8(name)) return data.dump();
    } catch (const nlohmann::json::type_error&) {
    }
    throw Gantry::Lib::GantryException("The host cannot store the " + kind + " record " + Quoted(name) +
                                       ": it holds text that is not valid UTF-8");
}

// Rows of one kind come in the order of their index; the rowid puts them in
// the order of first storing. Sorting here costs less than SQLite's sorter,
// which would copy every row, data and all, before giving the first.
template <class Row>
std::vector<Row> InStoringOrder(std::vector<std::pair<std::int64_t, Row>>& rows) {
    std::sort(rows.begin(), rows.end(),
              [](const std::pair<std::int64_t, Row>& a, const std::pair<std::int64_t, Row>& b) {
                  return a.first < b.first;
              });
    std::vector<Row> ordered;
    ordered.reserve(rows.size());
    for (auto& row : rows) ordered.push_back(std::move(row.second));
    return ordered;
}

// The JSON path of a top-level member, for SQLite's JSON functions.
std::string MemberPath(const char* field) {
    return std::string("$.\"") + field + "\"";
}

}  // namespace

void Transaction::MissingRecord(const std::string& kind, const std::string& name) {
    throw Gantry::Lib::GantryException("No " + kind + " \"" + name + "\" on the host");
}

void Transaction::RequireWrite() const {
    if (!write_) throw std::logic_error("A change to the host inside a read-only operation");
}

std::optional<Json> Transaction::FindData(const std::string& kind, const std::string& name) const {
    return GuardedSql(store_, [&]() -> std::optional<Json> {
        Statement query = store_.Db().Prepare("SELECT data FROM records WHERE kind = ? AND name = ?");
        query.Bind(1, kind).Bind(2, name);
        if (!query.Step()) return std::nullopt;
        return ParseStored(kind, name, query.Text(0));
    });
}

std::vector<std::pair<std::string, Json>> Transaction::ListData(const std::string& kind) const {
    return GuardedSql(store_, [&] {
        std::vector<std::pair<std::int64_t, std::pair<std::string, Json>>> records;
        Statement query = store_.Db().Prepare("SELECT rowid, name, data FROM records WHERE kind = ?");
        query.Bind(1, kind);
        while (query.Step()) {
            std::string name = query.Text(1);
            Json data = ParseStored(kind, name, query.Text(2));
            records.emplace_back(query.Int(0), std::make_pair(std::move(name), std::move(data)));
        }
        return InStoringOrder(records);
    });
}

std::vector<std::pair<std::string, Json>> Transaction::ChildrenData(const std::string& kind,
                                                                    const std::string& parent) const {
    return GuardedSql(store_, [&] {
        std::vector<std::pair<std::string, Json>> records;
        Statement query =
            store_.Db().Prepare("SELECT name, data FROM records WHERE kind = ? AND parent = ? ORDER BY rowid");
        query.Bind(1, kind).Bind(2, parent);
        while (query.Step()) {
            std::string name = query.Text(0);
            records.emplace_back(name, ParseStored(kind, name, query.Text(1)));
        }
        return records;
    });
}

std::size_t Transaction::CountChildrenWhere(const std::string& kind, const std::string& parent, const char* field,
                                            const std::string& value) const {
    return GuardedSql(store_, [&] {
        Statement query = store_.Db().Prepare(
            "SELECT count(*) FROM records WHERE kind = ? AND parent = ? AND json_extract(data, ?) = ?");
        query.Bind(1, kind).Bind(2, parent).Bind(3, MemberPath(field)).Bind(4, value);
        query.Step();
        return static_cast<std::size_t>(query.Int(0));
    });
}

std::vector<std::string> Transaction::ChildrenTexts(const std::string& kind, const std::string& parent,
                                                    const char* field) const {
    return GuardedSql(store_, [&] {
        std::vector<std::pair<std::int64_t, std::string>> texts;
        Statement query = store_.Db().Prepare(
            "SELECT rowid, json_extract(data, ?1) FROM records WHERE kind = ?2 AND parent = ?3 AND "
            "json_type(data, ?1) = 'text'");
        query.Bind(1, MemberPath(field)).Bind(2, kind).Bind(3, parent);
        while (query.Step()) texts.emplace_back(query.Int(0), query.Text(1));
        return InStoringOrder(texts);
    });
}

std::vector<std::pair<std::string, std::string>> Transaction::ChildrenTextPairs(const std::string& kind,
                                                                                const std::string& parent,
                                                                                const char* first,
                                                                                const char* second) const {
    return GuardedSql(store_, [&] {
        std::vector<std::pair<std::int64_t, std::pair<std::string, std::string>>> pairs;
        Statement query = store_.Db().Prepare(
            "SELECT rowid, json_extract(data, ?1), json_extract(data, ?2) FROM records WHERE kind = ?3 AND "
            "parent = ?4 AND json_type(data, ?1) = 'text' AND json_type(data, ?2) = 'text'");
        query.Bind(1, MemberPath(first)).Bind(2, MemberPath(second)).Bind(3, kind).Bind(4, parent);
        while (query.Step()) pairs.emplace_back(query.Int(0), std::make_pair(query.Text(1), query.Text(2)));
        return InStoringOrder(pairs);
    });
}

std::size_t Transaction::CountChildren(const std::string& kind, const std::string& parent) const {
    return GuardedSql(store_, [&] {
        Statement query = store_.Db().Prepare("SELECT count(*) FROM records WHERE kind = ? AND parent = ?");
        query.Bind(1, kind).Bind(2, parent);
        query.Step();
        return static_cast<std::size_t>(query.Int(0));
    });
}

std::vector<std::string> Transaction::NamesOf(const std::string& kind) const {
    return GuardedSql(store_, [&] {
        // Read from the index of (kind, name) alone, which holds the rowids too.
        std::vector<std::pair<std::int64_t, std::string>> names;
        Statement query = store_.Db().Prepare("SELECT rowid, name FROM records WHERE kind = ?");
        query.Bind(1, kind);
        while (query.Step()) names.emplace_back(query.Int(0), query.Text(1));
        return InStoringOrder(names);
    });
}

bool Transaction::ContainsData(const std::string& kind, const std::string& name) const {
    return GuardedSql(store_, [&] {
        Statement query = store_.Db().Prepare("SELECT 1 FROM records WHERE kind = ? AND name = ?");
        query.Bind(1, kind).Bind(2, name);
        return query.Step();
    });
}

std::size_t Transaction::CountOf(const std::string& kind) const {
    return GuardedSql(store_, [&] {
        Statement query = store_.Db().Prepare("SELECT count(*) FROM records WHERE kind = ?");
        query.Bind(1, kind);
        query.Step();
        return static_cast<std::size_t>(query.Int(0));
    });
}

void Transaction::PutData(const std::string& kind, const std::string& name, const Json& data,
                          const std::optional<std::string>& parent) {
    RequireWrite();
    const std::string text = StorableText(kind, name, data);
    GuardedSql(store_, [&] {
        // An upsert keeps the rowid, and so the record's place in its list.
        store_.Db()
            .Prepare("INSERT INTO records (kind, name, data, parent) VALUES (?, ?, ?, ?)"
                     " ON CONFLICT (kind, name) DO UPDATE SET data = excluded.data, parent = excluded.parent")
            .Bind(1, kind)
            .Bind(2, name)
            .Bind(3, text)
            .Bind(4, parent)
            .Run();
    });
}

bool Transaction::EraseData(const std::string& kind, const std::string& name) {
    RequireWrite();
    return GuardedSql(store_, [&] {
        store_.Db().Prepare("DELETE FROM records WHERE kind = ? AND name = ?").Bind(1, kind).Bind(2, name).Run();
        return store_.Db().Changes() > 0;
    });
}

void Transaction::EraseKind(const std::string& kind) {
    RequireWrite();
    GuardedSql(store_, [&] { store_.Db().Prepare("DELETE FROM records WHERE kind = ?").Bind(1, kind).Run(); });
}

TransactionScope::TransactionScope(Store& store, bool write) : transaction_(store, write) {
    if (store.InTransaction())
        throw std::logic_error("A host operation started inside another one; operations do not nest");
    GuardedSql(store, [&] { store.Db().Prepare(write ? "BEGIN IMMEDIATE" : "BEGIN").Run(); });
    open_ = true;
}

TransactionScope::~TransactionScope() {
    if (!open_) return;
    try {
        transaction_.GetStore().Db().Execute("ROLLBACK");
    } catch (...) {
        // The connection rolled back by itself (e.g. after an I/O error).
    }
}

void TransactionScope::Commit() {
    Store& store = transaction_.GetStore();
    GuardedSql(store, [&] { store.Db().Prepare("COMMIT").Run(); });
    open_ = false;
}

}  // namespace Host
}  // namespace Trellis

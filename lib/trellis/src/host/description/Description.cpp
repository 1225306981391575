#include "trellis/host/Description.h"

#include <cstdint>

#include <nlohmann/json.hpp>

#include "host/Store.h"
#include "host/description/DescriptionIo.h"
#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

namespace {

constexpr const char* kFormatKey = "format";

void EraseHost(Transaction& t) {
    Store& store = t.GetStore();
    GuardedSql(store, [&] { store.Db().Execute("DELETE FROM records; DELETE FROM faults; DELETE FROM exec_log"); });
}

const SectionType& TypeOf(const std::string& key) {
    static const std::vector<SectionType> types = SectionTypes();
    for (const SectionType& type : types)
        if (type.key == key) return type;
    throw std::logic_error("No description section \"" + key + "\"");
}

}  // namespace

const Json& DefaultDescription() {
    static const Json description = ParseDescriptionText(kDefaultHostDescription);
    return description;
}

ParsedDescription ParseDescription(const Json& description) {
    JsonReader root(&description, "");
    root.ExpectObject();
    JsonReader format = root.Member(kFormatKey);
    // Compared as an integer: JSON equality would take 1.0 for 1.
    if (!format.Value().is_number_integer() || format.Value().get<std::int64_t>() != kDescriptionFormat)
        format.Fail("expected " + std::to_string(kDescriptionFormat) + ", the format this version reads");
    std::vector<ParsedDescription::Entry> sections;
    for (const SectionType& type : SectionTypes()) {
        std::unique_ptr<Section> section = type.make();
        section->Parse(root.Member(type.key.c_str()));
        sections.push_back({type.key, std::move(section)});
    }
    root.RejectUnknownMembers();
    ParsedDescription parsed(std::move(sections));
    for (const auto& entry : parsed.Sections()) entry.section->CheckReferences(parsed);
    return parsed;
}

void WriteDescription(Transaction& t, const ParsedDescription& description) {
    EraseHost(t);
    for (const auto& entry : description.Sections()) entry.section->Write(t);
}

void WriteDescription(Transaction& t, const Json& description) {
    WriteDescription(t, ParseDescription(description));
}

Json ExportDescription(const Transaction& t) {
    Json description{{kFormatKey, kDescriptionFormat}};
    for (const SectionType& type : SectionTypes()) description[type.key] = type.make()->Export(t);
    return description;
}

void WriteSectionOfDefault(Transaction& t, const std::string& key) {
    const Json& defaults = DefaultDescription();
    auto value = defaults.find(key);
    std::unique_ptr<Section> section = TypeOf(key).make();
    section->Parse(JsonReader(value == defaults.end() ? nullptr : &*value, key));
    section->Write(t);
}

std::string DescriptionText(const Json& description) {
    try {
        return description.dump(2) + "\n";
    } catch (const nlohmann::json::type_error&) {
        // Only text stored by an older build that checked less can get here.
        throw Gantry::Lib::GantryException("The host store holds text that is not valid UTF-8; it cannot be exported");
    }
}

std::string ExportHost() {
    Store& store = CurrentStore();
    TransactionScope scope(store, false);
    Json description = ExportDescription(scope.Get());
    scope.Commit();
    return DescriptionText(description);
}

void ImportHost(const std::string& descriptionText) {
    // Everything is checked before the write lock is taken.
    ParsedDescription description = ParseDescription(ParseDescriptionText(descriptionText));
    Store& store = CurrentStore();
    {
        TransactionScope scope(store, true);
        WriteDescription(scope.Get(), description);
        scope.Commit();
    }
    GuardedSql(store, [&] { store.Faults().Reload(); });
}

}  // namespace Host
}  // namespace Trellis

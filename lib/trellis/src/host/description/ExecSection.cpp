// "exec": the log of Trellis_Exec, each {commandLine, options, status}.

#include <nlohmann/json.hpp>

#include "host/ExecLogTable.h"
#include "host/Store.h"
#include "host/description/Section.h"
#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

namespace {

ExecEntry ReadEntry(const JsonReader& in) {
    ExecEntry entry;
    entry.commandLine = in.String("commandLine");
    std::vector<JsonReader> options = in.Array("options");
    if (options.size() != entry.options.size()) in.Member("options").Fail("expected three flags");
    for (std::size_t i = 0; i < options.size(); ++i) {
        if (!options[i].Value().is_boolean()) options[i].Fail("expected true or false");
        entry.options[i] = options[i].Value().get<bool>();
    }
    entry.status = static_cast<int>(in.Int("status", INT32_MIN, INT32_MAX));
    in.RejectUnknownMembers();
    return entry;
}

class ExecSection : public Section {
public:
    void Parse(const JsonReader& value) override {
        for (const JsonReader& element : value.Elements()) entries_.push_back(ReadEntry(element));
    }

    void Write(Transaction& t) const override {
        Store& store = t.GetStore();
        GuardedSql(store, [&] {
            for (const ExecEntry& entry : entries_) AppendExecEntry(store.Db(), entry);
        });
    }

    Json Export(const Transaction& t) const override {
        Store& store = t.GetStore();
        Json entries = Json::array();
        for (const ExecEntry& entry : GuardedSql(store, [&] { return ReadExecEntries(store.Db()); }))
            entries.push_back(Json{{"commandLine", entry.commandLine}, {"options", entry.options}, {"status", entry.status}});
        return entries;
    }

private:
    std::vector<ExecEntry> entries_;
};

const SectionRegistration kExec("exec", 910, [] { return std::make_unique<ExecSection>(); });

}  // namespace

}  // namespace Host
}  // namespace Trellis

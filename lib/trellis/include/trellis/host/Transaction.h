#pragma once

// Access to the host's records inside one SQLite transaction.
//
// A record type is a plain struct of one object kind, keyed by its natural
// name:
//
//   struct FirewallRulesetRecord {
//       static constexpr const char* kKind = "firewall.ruleset";
//       std::string name;                                  // the key
//       ...
//       Json ToJson() const;                               // as in a host description
//       static FirewallRulesetRecord FromJson(const JsonReader& in);  // checks every field
//   };
//
// A record that belongs to another object declares that object's name as its
// parent, by a member found at compile time:
//
//   std::string Parent() const { return vswitch; }     // a port group's switch
//
// Put stores it, so that ChildrenOf and CountChildrenOf find the children of
// one parent through an index, without reading the other records of the kind.
//
// Records of one kind are listed in the order they were first stored; Put of
// an existing name replaces the record in place. Reading one kind touches no
// other kind. Failures of the store itself surface as GantryException.

#include <cstddef>
#include <memory>
#include <optional>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

#include <nlohmann/json.hpp>

#include "gantry/lib/GantryException.h"
#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

class Store;

// Whether records of type R declare a parent.
template <class R, class = void>
struct HasParent : std::false_type {};
template <class R>
struct HasParent<R, std::void_t<decltype(std::declval<const R&>().Parent())>> : std::true_type {};

class Transaction {
public:
    Transaction(Store& store, bool write) : store_(store), write_(write) {}
    Transaction(const Transaction&) = delete;
    Transaction& operator=(const Transaction&) = delete;

    template <class R>
    std::optional<R> Find(const std::string& name) const {
        std::optional<Json> data = FindData(R::kKind, name);
        if (!data) return std::nullopt;
        return Decode<R>(*data, name);
    }

    // The record, or a GantryException naming the kind and the name.
    template <class R>
    R Require(const std::string& name) const {
        std::optional<Json> data = FindData(R::kKind, name);
        if (!data) MissingRecord(R::kKind, name);
        return Decode<R>(*data, name);
    }

    template <class R>
    std::vector<R> List() const {
        std::vector<R> records;
        for (const auto& entry : ListData(R::kKind)) records.push_back(Decode<R>(entry.second, entry.first));
        return records;
    }

    template <class R>
    std::vector<std::string> Names() const {
        return NamesOf(R::kKind);
    }

    template <class R>
    bool Contains(const std::string& name) const {
        return ContainsData(R::kKind, name);
    }

    template <class R>
    std::size_t Count() const {
        return CountOf(R::kKind);
    }

    // The records whose parent is parent, in the order of List.
    template <class R>
    std::vector<R> ChildrenOf(const std::string& parent) const {
        static_assert(HasParent<R>::value, "the record type declares no Parent()");
        std::vector<R> records;
        for (const auto& entry : ChildrenData(R::kKind, parent)) records.push_back(Decode<R>(entry.second, entry.first));
        return records;
    }

    template <class R>
    std::size_t CountChildrenOf(const std::string& parent) const {
        static_assert(HasParent<R>::value, "the record type declares no Parent()");
        return CountChildren(R::kKind, parent);
    }

    // The count of those children whose stored field (a member of the
    // record's JSON) holds value, counted in the store without decoding them.
    template <class R>
    std::size_t CountChildrenWith(const std::string& parent, const char* field, const std::string& value) const {
        static_assert(HasParent<R>::value, "the record type declares no Parent()");
        return CountChildrenWhere(R::kKind, parent, field, value);
    }

    // The text of one stored field (a member of the record's JSON) of each
    // child that has it as a text, in the order of List, read in the store
    // without decoding the records.
    template <class R>
    std::vector<std::string> ChildrenTextsOf(const std::string& parent, const char* field) const {
        static_assert(HasParent<R>::value, "the record type declares no Parent()");
        return ChildrenTexts(R::kKind, parent, field);
    }

    // The texts of two stored fields of each child that has both as texts,
    // in the order of List, read in the store without decoding the records.
    template <class R>
    std::vector<std::pair<std::string, std::string>> ChildrenTextPairsOf(const std::string& parent,
                                                                        const char* first,
                                                                        const char* second) const {
        static_assert(HasParent<R>::value, "the record type declares no Parent()");
        return ChildrenTextPairs(R::kKind, parent, first, second);
    }

    // Inserts the record, or replaces the one of the same name in its place.
    template <class R>
    void Put(const R& record) {
        if constexpr (HasParent<R>::value)
            PutData(R::kKind, record.name, record.ToJson(), record.Parent());
        else
            PutData(R::kKind, record.name, record.ToJson());
    }

    // Whether there was such a record.
    template <class R>
    bool Erase(const std::string& name) {
        return EraseData(R::kKind, name);
    }

    template <class R>
    void EraseAll() {
        EraseKind(R::kKind);
    }

    // The same by kind name, on the stored JSON, for code that handles every
    // kind alike (host descriptions, migrations).
    std::optional<Json> FindData(const std::string& kind, const std::string& name) const;
    std::vector<std::pair<std::string, Json>> ListData(const std::string& kind) const;
    std::vector<std::string> NamesOf(const std::string& kind) const;
    bool ContainsData(const std::string& kind, const std::string& name) const;
    std::size_t CountOf(const std::string& kind) const;
    std::vector<std::pair<std::string, Json>> ChildrenData(const std::string& kind, const std::string& parent) const;
    std::size_t CountChildren(const std::string& kind, const std::string& parent) const;
    std::vector<std::string> ChildrenTexts(const std::string& kind, const std::string& parent,
                                           const char* field) const;
    std::vector<std::pair<std::string, std::string>> ChildrenTextPairs(const std::string& kind,
                                                                       const std::string& parent, const char* first,
                                                                       const char* second) const;
    std::size_t CountChildrenWhere(const std::string& kind, const std::string& parent, const char* field,
                                   const std::string& value) const;
    void PutData(const std::string& kind, const std::string& name, const Json& data,
                 const std::optional<std::string>& parent = std::nullopt);
    bool EraseData(const std::string& kind, const std::string& name);
    void EraseKind(const std::string& kind);

    Store& GetStore() const { return store_; }

private:
    template <class R>
    static R Decode(const Json& data, const std::string& name) {
        try {
            return R::FromJson(JsonReader(&data, R::kKind, name));
        } catch (const DescriptionError& e) {
            throw Gantry::Lib::GantryException(std::string("The host store holds a damaged record: ") + e.what());
        }
    }
    [[noreturn]] static void MissingRecord(const std::string& kind, const std::string& name);
    void RequireWrite() const;

    Store& store_;
    bool write_;
};

// One transaction on a store: begins in the constructor (BEGIN, or BEGIN
// IMMEDIATE for a write), rolls back in the destructor unless Commit was
// called. Operation uses it; so do host descriptions and migrations.
class TransactionScope {
public:
    TransactionScope(Store& store, bool write);
    ~TransactionScope();
    TransactionScope(const TransactionScope&) = delete;
    TransactionScope& operator=(const TransactionScope&) = delete;

    Transaction& Get() { return transaction_; }
    void Commit();

private:
    Transaction transaction_;
    bool open_ = false;
};

}  // namespace Host
}  // namespace Trellis

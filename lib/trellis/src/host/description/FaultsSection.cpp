// "faults": the armed faults, each {operation, message or status, remaining}.

#include <set>
#include <stdexcept>

#include <nlohmann/json.hpp>

#include "host/FaultBook.h"
#include "host/Store.h"
#include "host/description/Section.h"
#include "trellis/host/Operation.h"
#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

namespace {

Fault ReadFault(const JsonReader& in) {
    Fault fault;
    fault.operation = in.String("operation");
    if (!Operation::IsKnown(fault.operation))
        in.Member("operation").Fail("unknown operation \"" + fault.operation + "\"");
    if (Operation::KindOf(fault.operation) == FaultKind::Status)
        fault.status = static_cast<int>(in.Int("status", INT32_MIN, INT32_MAX));
    else
        fault.message = in.String("message");
    if (in.Member("remaining").IsPresent()) fault.remaining = static_cast<int>(in.Int("remaining", 1, INT32_MAX));
    in.RejectUnknownMembers();
    try {
        CheckFault(fault);
    } catch (const std::invalid_argument& e) {
        in.Fail(e.what());
    }
    return fault;
}

class FaultsSection : public Section {
public:
    void Parse(const JsonReader& value) override {
        std::set<std::string> operations;
        for (const JsonReader& element : value.Elements()) {
            Fault fault = ReadFault(element);
            if (!operations.insert(fault.operation).second)
                element.Member("operation").Fail("a second fault for \"" + fault.operation + "\"");
            faults_.push_back(fault);
        }
    }

    void Write(Transaction& t) const override {
        Store& store = t.GetStore();
        GuardedSql(store, [&] { FaultBook::Write(store.Db(), faults_); });
    }

    Json Export(const Transaction& t) const override {
        Store& store = t.GetStore();
        Json faults = Json::array();
        for (const Fault& fault : GuardedSql(store, [&] { return FaultBook::Read(store.Db()); })) {
            Json json{{"operation", fault.operation}};
            if (Operation::IsKnown(fault.operation) && Operation::KindOf(fault.operation) == FaultKind::Status)
                json["status"] = fault.status;
            else
                json["message"] = fault.message;
            if (fault.remaining) json["remaining"] = *fault.remaining;
            faults.push_back(json);
        }
        return faults;
    }

private:
    std::vector<Fault> faults_;
};

const SectionRegistration kFaults("faults", 900, [] { return std::make_unique<FaultsSection>(); });

}  // namespace

}  // namespace Host
}  // namespace Trellis

#include "trellis/host/ObjectNames.h"

#include "host/Store.h"
#include "trellis/host/Transaction.h"
#include "trellis/host/records/DVSwitchRecords.h"
#include "trellis/host/records/FirewallRecords.h"
#include "trellis/host/records/NetstackRecord.h"
#include "trellis/host/records/PnicRecord.h"
#include "trellis/host/records/SwitchRecords.h"
#include "trellis/host/records/TslNicRecord.h"

namespace Trellis {
namespace Host {

namespace {

std::vector<std::string> NamesIn(const Transaction& t, ObjectKind kind) {
    switch (kind) {
    case ObjectKind::StandardSwitch:
        return t.Names<StandardSwitchRecord>();
    case ObjectKind::PortGroup:
        return t.Names<PortGroupRecord>();
    case ObjectKind::PhysicalNic:
        return t.Names<PnicRecord>();
    case ObjectKind::KernelInterface:
        return t.Names<TslNicRecord>();
    case ObjectKind::FirewallRuleset:
        return t.Names<FirewallRulesetRecord>();
    case ObjectKind::Netstack:
        return t.Names<NetstackRecord>();
    case ObjectKind::DistributedSwitch:
        return t.Names<DVSwitchRecord>();
    }
    return {};
}

}  // namespace

std::vector<std::string> ObjectNames(ObjectKind kind) {
    Store& store = CurrentStore();
    return GuardedSql(store, [&] {
        TransactionScope scope(store, false);
        return NamesIn(scope.Get(), kind);
    });
}

}  // namespace Host
}  // namespace Trellis

#include "trellis/host/ExecLog.h"

#include "host/ExecLogTable.h"
#include "host/Store.h"
#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

std::vector<ExecEntry> ReadExecLog() {
    Store& store = CurrentStore();
    TransactionScope scope(store, false);
    std::vector<ExecEntry> entries = GuardedSql(store, [&] { return ReadExecEntries(store.Db()); });
    scope.Commit();
    return entries;
}

}  // namespace Host
}  // namespace Trellis

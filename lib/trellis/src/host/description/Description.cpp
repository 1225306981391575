#include "trellis/host/Description.h"

#include <nlohmann/json.hpp>

#include "host/Store.h"
#include "host/description/DescriptionIo.h"
#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

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

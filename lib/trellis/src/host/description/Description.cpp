#include "trellis/host/Description.h"

#include <stdexcept>
#include <string>

#include <nlohmann/json.hpp>

#include "host/HostCreation.h"
#include "host/Store.h"
#include "host/description/DescriptionIo.h"
#include "host/description/ScaledDescription.h"
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

namespace {

// The description was checked before the write lock is taken.
void ImportParsed(const ParsedDescription& description) {
    Store& store = CurrentStore();
    RemoveAbandonedTemporaries(store.Path());
    {
        TransactionScope scope(store, true);
        WriteDescription(scope.Get(), description);
        scope.Commit();
    }
    GuardedSql(store, [&] { store.Faults().Reload(); });
}

}  // namespace

void ImportHost(const std::string& descriptionText) {
    ImportParsed(ParseDescription(ParseDescriptionText(descriptionText)));
}

void ImportScaledDefaultHost(int scale) {
    if (scale < 1 || scale > kMaxHostScale)
        throw std::invalid_argument("A host scale from 1 to " + std::to_string(kMaxHostScale) + " was expected, not " +
                                    std::to_string(scale));
    ImportParsed(ParseDescription(ScaledDescription(DefaultDescription(), scale)));
}

}  // namespace Host
}  // namespace Trellis

#include "trellis/util/Exec.h"

#include "host/ExecLogTable.h"
#include "host/Store.h"
#include "host/StoredText.h"
#include "trellis/host/Operation.h"

namespace Trellis {
namespace Util {

namespace {

const Host::Operation kTrellisExec("Trellis_Exec", Host::FaultKind::Status);

}  // namespace

int Trellis_Exec(std::string const& commandLine, bool option1, bool option2, bool option3) {
    // Refused before a fault fires, so that a refused call uses up no fault.
    std::string problem = Host::TextProblem(commandLine);
    if (!problem.empty()) throw Gantry::Lib::GantryException("Trellis_Exec: the command line " + problem);
    int status = kTrellisExec.FaultStatus();
    kTrellisExec.Write([&](Host::Transaction& t) {
        Host::Store& store = t.GetStore();
        Host::GuardedSql(store, [&] {
            Host::AppendExecEntry(store.Db(), {commandLine, {option1, option2, option3}, status});
        });
    });
    return status;
}

}  // namespace Util
}  // namespace Trellis

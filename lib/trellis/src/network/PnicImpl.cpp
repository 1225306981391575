#include "trellis/network/PnicImpl.h"

#include <utility>

#include "trellis/host/Operation.h"
#include "trellis/host/records/PnicRecord.h"

namespace Trellis {
namespace Network {

namespace {
const Trellis::Host::Operation kGetName("Pnic::GetName");
const Trellis::Host::Operation kIsValidPnic("PnicImpl::IsValidPnic");
}  // namespace

PnicImpl::PnicImpl(std::string name) : name_(std::move(name)) {}

PnicImpl::~PnicImpl() {}

std::string PnicImpl::GetName() {
    kGetName.Check();
    return name_;
}

bool PnicImpl::IsValidPnic(std::string const& name) {
    return kIsValidPnic.Read(
        [&](Trellis::Host::Transaction& t) { return t.Contains<Trellis::Host::PnicRecord>(name); });
}

}  // namespace Network
}  // namespace Trellis

#include "trellis/network/PnicImpl.h"

#include <utility>

#include "trellis/host/Operation.h"

namespace Trellis {
namespace Network {

namespace {
const Trellis::Host::Operation kGetName("Pnic::GetName");
const Trellis::Host::Operation kIsValidPnic("PnicImpl::IsValidPnic");
}  // namespace

PnicImpl::PnicImpl(Trellis::Host::PnicRecord snapshot) : snapshot_(std::move(snapshot)) {}

PnicImpl::~PnicImpl() {}

std::string PnicImpl::GetName() {
    kGetName.Check();
    return snapshot_.name;
}

bool PnicImpl::IsValidPnic(std::string const& name) {
    return kIsValidPnic.Read(
        [&](Trellis::Host::Transaction& t) { return t.Contains<Trellis::Host::PnicRecord>(name); });
}

}  // namespace Network
}  // namespace Trellis

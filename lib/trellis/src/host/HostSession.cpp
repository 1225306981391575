#include "trellis/host/HostSession.h"

#include "host/Store.h"

namespace Trellis {
namespace Host {

namespace {

std::unique_ptr<Store>& Current() {
    static std::unique_ptr<Store> current;
    return current;
}

}  // namespace

void OpenHost(const std::string& path) {
    CloseHost();
    Current() = Store::Open(path);
}

void CloseHost() {
    Current().reset();
}

Store& CurrentStore() {
    if (!Current()) throw Gantry::Lib::GantryException("No host is open");
    return *Current();
}

}  // namespace Host
}  // namespace Trellis

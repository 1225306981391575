#include "VirtualSwitchChange.h"

#include "gantry/network/NetworkFactory.h"

namespace KorvexCli {
namespace NetworkNamespace {

void ChangeVirtualSwitch(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output, Parameter const& vswitchName,
                         Parameter const& otherName,
                         std::function<void(Gantry::Network::VirtualSwitch&, std::string const&)> const& change) {
    try {
        std::string name = input->GetString(otherName);
        std::unique_ptr<Gantry::Network::VirtualSwitch> vswitch(
            Gantry::Network::NetworkFactory::GetVirtualSwitchById(input->GetString(vswitchName)));
        change(*vswitch, name);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli

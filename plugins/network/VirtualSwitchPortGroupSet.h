#pragma once

#include <boost/shared_ptr.hpp>

#include "plinth/autocli/Command.h"

namespace KorvexCli {
namespace NetworkNamespace {

class VirtualSwitchPortGroupSet : public virtual Plinth::AutoCli::Command {
public:
    static boost::shared_ptr<VirtualSwitchPortGroupSet> New();
    ~VirtualSwitchPortGroupSet() override;

    boost::shared_ptr<Plinth::CallSpec::InputSpec> GetInputSpecInternal() override;
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> GetOutputSpecInternal() override;
    void ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                         boost::shared_ptr<Plinth::CallSpec::Output> output) override;

private:
    VirtualSwitchPortGroupSet();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli

#pragma once

#include <boost/shared_ptr.hpp>

#include "plinth/autocli/Command.h"

namespace KorvexCli {
namespace NetworkNamespace {

class VirtualSwitchStandardSet : public virtual Plinth::AutoCli::Command {
public:
    static boost::shared_ptr<VirtualSwitchStandardSet> New();
    ~VirtualSwitchStandardSet() override;

    boost::shared_ptr<Plinth::CallSpec::InputSpec> GetInputSpecInternal() override;
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> GetOutputSpecInternal() override;
    void ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                         boost::shared_ptr<Plinth::CallSpec::Output> output) override;

private:
    VirtualSwitchStandardSet();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli

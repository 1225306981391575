#pragma once

#include <boost/shared_ptr.hpp>

#include "plinth/autocli/Command.h"
#include "plinth/metaobj/MetaStruct.h"

namespace KorvexCli {
namespace NetworkNamespace {

class FirewallRulesetRuleList : public virtual Plinth::AutoCli::Command {
public:
    static boost::shared_ptr<FirewallRulesetRuleList> New();
    ~FirewallRulesetRuleList() override;

    boost::shared_ptr<Plinth::CallSpec::InputSpec> GetInputSpecInternal() override;
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> GetOutputSpecInternal() override;
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
    void ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                         boost::shared_ptr<Plinth::CallSpec::Output> output) override;

private:
    FirewallRulesetRuleList();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli

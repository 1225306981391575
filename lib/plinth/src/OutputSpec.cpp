#include "plinth/callspec/OutputSpec.h"

namespace Plinth {
namespace CallSpec {

boost::shared_ptr<OutputSpec> OutputSpec::New() { return boost::shared_ptr<OutputSpec>(new OutputSpec()); }
boost::shared_ptr<OutputSpec> OutputSpec::Of(boost::shared_ptr<MetaObj::MetaObject> resultType) {
    boost::shared_ptr<OutputSpec> outputSpec = New();
    outputSpec->SetResultType(resultType);
    return outputSpec;
}
OutputSpec::~OutputSpec() = default;
void OutputSpec::SetResultType(boost::shared_ptr<MetaObj::MetaObject> resultType) {
    resultType_ = resultType;
}
boost::shared_ptr<MetaObj::MetaObject> OutputSpec::GetResultType() const { return resultType_; }

}  // namespace CallSpec
}  // namespace Plinth

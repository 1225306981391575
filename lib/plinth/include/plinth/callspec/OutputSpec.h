#pragma once

#include <boost/shared_ptr.hpp>

#include "plinth/metaobj/MetaObject.h"

namespace Plinth {
namespace CallSpec {

// The shape of a command's result: MetaBool::New() for a boolean, a structure
// from GetOutputStructure(), or MetaList::New(3, GetOutputStructure()).
class OutputSpec {
public:
    static boost::shared_ptr<OutputSpec> New();
    // Beyond the commands' operations: New and SetResultType in one call.
    static boost::shared_ptr<OutputSpec> Of(boost::shared_ptr<MetaObj::MetaObject> resultType);

    virtual ~OutputSpec();

    virtual void SetResultType(boost::shared_ptr<MetaObj::MetaObject> resultType);

    // Null until SetResultType.
    boost::shared_ptr<MetaObj::MetaObject> GetResultType() const;

private:
    OutputSpec() = default;

    boost::shared_ptr<MetaObj::MetaObject> resultType_;
};

}  // namespace CallSpec
}  // namespace Plinth

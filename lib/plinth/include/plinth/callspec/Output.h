#pragma once

#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "plinth/metaobj/MetaObject.h"

namespace Plinth {
namespace CallSpec {

// What one call delivers: any number of failure texts, in the order set, and
// at most one result. An error does not end the call; a result set after an
// error is kept and shown as well.
class Output {
public:
    static boost::shared_ptr<Output> New();

    virtual ~Output();

    virtual void SetError(std::string const& text);
    virtual bool HasError() const;
    // A second call replaces the first result.
    virtual void SetResult(boost::shared_ptr<MetaObj::MetaObject> result);
    virtual void Finish();

    // Read access for the tool.
    std::vector<std::string> const& GetErrors() const;
    // Null when no result was set.
    boost::shared_ptr<MetaObj::MetaObject> GetResult() const;
    bool IsFinished() const;

private:
    Output() = default;

    std::vector<std::string> errors_;
    boost::shared_ptr<MetaObj::MetaObject> result_;
    bool finished_ = false;
};

}  // namespace CallSpec
}  // namespace Plinth

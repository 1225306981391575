#pragma once

#include <boost/shared_ptr.hpp>

#include "plinth/metaobj/MetaObject.h"

namespace Plinth {
namespace MetaObj {

class MetaInt : public MetaObject {
public:
    // Unset: a shape, or a value that is not known.
    static boost::shared_ptr<MetaInt> New();
    static boost::shared_ptr<MetaInt> New(long long value);

    ~MetaInt() override;

    MetaType GetMetaType() const override;
    bool IsSet() const override;

    // The value; 0 when unset.
    long long GetValue() const;

private:
    MetaInt();
    explicit MetaInt(long long value);

    long long value_{};
    bool set_ = false;
};

}  // namespace MetaObj
}  // namespace Plinth

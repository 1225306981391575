#pragma once

#include <boost/shared_ptr.hpp>

#include "plinth/metaobj/MetaObject.h"

namespace Plinth {
namespace MetaObj {

class MetaBool : public MetaObject {
public:
    // Unset: a shape, or a value that is not known.
    static boost::shared_ptr<MetaBool> New();
    static boost::shared_ptr<MetaBool> New(bool value);

    ~MetaBool() override;

    MetaType GetMetaType() const override;
    bool IsSet() const override;

    // The value; false when unset.
    bool GetValue() const;

private:
    MetaBool();
    explicit MetaBool(bool value);

    bool value_{};
    bool set_ = false;
};

}  // namespace MetaObj
}  // namespace Plinth

#pragma once

#include <boost/shared_ptr.hpp>

#include "plinth/metaobj/MetaType.h"

namespace Plinth {
namespace MetaObj {

// The common base of all result values. A value made by New() without an
// argument is "unset": it declares a shape but carries nothing.
class MetaObject {
public:
    virtual ~MetaObject();

    virtual MetaType GetMetaType() const = 0;
    // False for a plain value made without an argument. Structures and lists
    // are always set.
    virtual bool IsSet() const;

protected:
    MetaObject() = default;
    MetaObject(const MetaObject&) = default;
    MetaObject& operator=(const MetaObject&) = default;
};

}  // namespace MetaObj
}  // namespace Plinth

#pragma once

#include <string>

#include <boost/shared_ptr.hpp>

#include "plinth/metaobj/MetaObject.h"

namespace Plinth {
namespace MetaObj {

class MetaString : public MetaObject {
public:
    // Unset: a shape, or a value that is not known.
    static boost::shared_ptr<MetaString> New();
    static boost::shared_ptr<MetaString> New(std::string const& value);

    ~MetaString() override;

    MetaType GetMetaType() const override;
    bool IsSet() const override;

    // The value; empty when unset.
    std::string GetValue() const;

private:
    MetaString();
    explicit MetaString(std::string const& value);

    std::string value_{};
    bool set_ = false;
};

}  // namespace MetaObj
}  // namespace Plinth

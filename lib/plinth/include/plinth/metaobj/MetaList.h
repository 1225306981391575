#pragma once

#include <string>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "plinth/metaobj/MetaObject.h"
#include "plinth/metaobj/MetaType.h"

namespace Plinth {
namespace MetaObj {

class MetaString;
class MetaStruct;

// An ordered list of values. MetaList::New(META_STRING) (or New(2)) is a list
// of strings; MetaList::New(META_STRUCT, shape) (or New(3, shape)) a list of
// structures whose elements have the shape's fields.
class MetaList : public MetaObject {
public:
    static boost::shared_ptr<MetaList> New(MetaType elementType);
    static boost::shared_ptr<MetaList> New(MetaType elementType, boost::shared_ptr<MetaObject> shape);
    // The same with the element type as a number (2 strings, 3 structures).
    static boost::shared_ptr<MetaList> New(int elementType);
    static boost::shared_ptr<MetaList> New(int elementType, boost::shared_ptr<MetaObject> shape);

    ~MetaList() override;

    MetaType GetMetaType() const override;

    virtual void AddMetaString(boost::shared_ptr<MetaString> value);
    virtual void AddMetaStruct(boost::shared_ptr<MetaStruct> value);
    virtual void AddCString(char const* value);
    virtual void AddString(std::string const& value);

    // Beyond the commands' operations: read access for the formatters.
    MetaType GetElementType() const;
    // The element shape given to New, or null.
    boost::shared_ptr<MetaObject> GetShape() const;
    std::vector<boost::shared_ptr<MetaObject> > const& GetElements() const;
    size_t Size() const;

private:
    MetaList(MetaType elementType, boost::shared_ptr<MetaObject> shape);

    MetaType elementType_;
    boost::shared_ptr<MetaObject> shape_;
    std::vector<boost::shared_ptr<MetaObject> > elements_;
};

}  // namespace MetaObj
}  // namespace Plinth

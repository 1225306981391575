#pragma once

#include <string>
#include <utility>
#include <vector>

#include <boost/shared_ptr.hpp>

#include "plinth/metaobj/MetaObject.h"

namespace Plinth {
namespace MetaObj {

class MetaBool;
class MetaInt;
class MetaList;
class MetaString;

// A named structure of titled fields. The name is the key of the output
// hints ("fields:<Name>", "header:<Name>", ...). Fields keep the order of the
// first SetField call for each title; a later call for the same title replaces
// the value in place.
class MetaStruct : public MetaObject {
public:
    typedef std::pair<std::string, boost::shared_ptr<MetaObject> > Field;

    static boost::shared_ptr<MetaStruct> New(std::string const& name);

    ~MetaStruct() override;

    MetaType GetMetaType() const override;

    virtual void SetField(std::string const& title, boost::shared_ptr<MetaString> value);
    virtual void SetField(std::string const& title, boost::shared_ptr<MetaBool> value);
    virtual void SetField(std::string const& title, boost::shared_ptr<MetaInt> value);
    virtual void SetField(std::string const& title, boost::shared_ptr<MetaList> value);
    virtual void SetField(std::string const& title, boost::shared_ptr<MetaStruct> value);
    virtual void SetField(std::string const& title, std::string const& value);
    virtual void SetField(std::string const& title, char const* value);
    virtual void SetField(std::string const& title, bool value);
    virtual void SetField(std::string const& title, int value);
    virtual void SetField(std::string const& title, long long value);
    virtual void SetField(std::string const& title, std::vector<std::string> const& value);

    // Beyond the commands' operations: integer types that would otherwise be
    // ambiguous between the int, long long and bool forms. Stored as MetaInt.
    void SetField(std::string const& title, unsigned int value);
    void SetField(std::string const& title, unsigned long value);

    // Read access for the formatters.
    std::string const& GetName() const;
    std::vector<Field> const& GetFields() const;
    // The field's value, or null when no field has this title. A declared
    // field may hold a null pointer too; formatters treat it as unset.
    boost::shared_ptr<MetaObject> GetField(std::string const& title) const;
    bool HasField(std::string const& title) const;

private:
    explicit MetaStruct(std::string const& name);
    void Store(std::string const& title, boost::shared_ptr<MetaObject> value);

    std::string name_;
    std::vector<Field> fields_;
};

}  // namespace MetaObj
}  // namespace Plinth

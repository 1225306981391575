#pragma once

#include <stdexcept>

#include <boost/shared_ptr.hpp>

#include "plinth/metaobj/MetaList.h"

namespace Plinth {
namespace MetaObj {

class MetaStruct;

// A row was appended through a MetaListRef that holds no list: a fault in
// the command's own steps, not in the host. It is no GantryException, so a
// command's handler lets it pass, and the tool reports it as one line.
class ListNotMadeError : public std::logic_error {
public:
    ListNotMadeError();
};

// A reference to a command's result list that may be taken before the list
// is made. Appending through it while it is empty throws ListNotMadeError
// instead of touching a null pointer:
//
//   MetaListRef rows;
//   rows.AddMetaStruct(row);          // throws: no list yet
//   rows = MetaList::New(3, shape);
//   rows.AddMetaStruct(row);          // appends
//   output->SetResult(rows.Get());
class MetaListRef {
public:
    MetaListRef() = default;

    MetaListRef& operator=(boost::shared_ptr<MetaList> list);

    // Appends to the list; throws ListNotMadeError while there is none.
    void AddMetaStruct(boost::shared_ptr<MetaStruct> value);

    // The list, or null before one was taken.
    boost::shared_ptr<MetaList> Get() const;

private:
    boost::shared_ptr<MetaList> list_;
};

}  // namespace MetaObj
}  // namespace Plinth

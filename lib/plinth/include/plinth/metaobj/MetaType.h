#pragma once

namespace Plinth {
namespace MetaObj {

// The kind of a result value, and of the elements of a MetaList.
// MetaList::New(2) is a list of strings, MetaList::New(3, shape) a list of
// structures; the other values exist for the framework's own use.
enum MetaType {
    META_BOOL = 0,
    META_INT = 1,
    META_STRING = 2,
    META_STRUCT = 3,
    META_LIST = 4,
};

}  // namespace MetaObj
}  // namespace Plinth

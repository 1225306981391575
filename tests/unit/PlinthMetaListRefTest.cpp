// The checked list reference: appending before a list was taken is a
// framework error of its own, not a null pointer.
#include <stdexcept>

#include <gtest/gtest.h>

#include "plinth/metaobj/MetaList.h"
#include "plinth/metaobj/MetaListRef.h"
#include "plinth/metaobj/MetaStruct.h"

using namespace Plinth::MetaObj;

TEST(PlinthMetaListRef, AppendingBeforeAListIsTakenThrowsThenAppendsGoToTheList) {
    MetaListRef rows;
    EXPECT_FALSE(rows.Get());
    try {
        rows.AddMetaStruct(MetaStruct::New("Row"));
        ADD_FAILURE() << "an empty reference took a row";
    } catch (const std::logic_error& e) {
        EXPECT_NE(dynamic_cast<const ListNotMadeError*>(&e), nullptr);
        EXPECT_STREQ(e.what(), "The command appended a row to a result list that was never made.");
    }

    boost::shared_ptr<MetaList> list = MetaList::New(META_STRUCT);
    rows = list;
    boost::shared_ptr<MetaStruct> row = MetaStruct::New("Row");
    rows.AddMetaStruct(row);
    EXPECT_EQ(rows.Get(), list);
    ASSERT_EQ(list->Size(), 1u);
    EXPECT_EQ(list->GetElements()[0], row);
}

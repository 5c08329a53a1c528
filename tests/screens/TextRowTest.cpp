// What the editor's rows with a title and a choice have in common.

#include <memory>

#include <gtest/gtest.h>

#include "AlarmRepeatItem.h"
#include "AlarmToneItem.h"
#include "AlarmTypeItem.h"
#include "screens/TextRowFixture.h"

namespace {

template <class RowClass>
class TextRowTest : public TextRowFixture<RowClass> {
protected:
    void tap() {
        this->stage().tapRow(this->page->item());
        this->stage().settle();
    }
};

using TextRows = testing::Types<AlarmRepeatItem, AlarmTypeItem, AlarmToneItem>;
TYPED_TEST_SUITE(TextRowTest, TextRows);

TYPED_TEST(TextRowTest, EachItemClassIsANewOneOfTheTwoLineStyle) {
    this->show();
    Elm_Genlist_Item_Class* const one = this->row->getItemClassNew();
    Elm_Genlist_Item_Class* const other = this->row->getItemClassNew();
    EXPECT_NE(one, other);
    EXPECT_STREQ(one->item_style, "2line.top");
    EXPECT_EQ(one->func.content_get, nullptr);
    EXPECT_NE(one->func.del, nullptr);
    elm_genlist_item_class_free(one);
    elm_genlist_item_class_free(other);
}

TYPED_TEST(TextRowTest, ServesNoOtherPart) {
    this->show();
    for (const char* part : {"elm.text", "elm.text.main.left", "elm.icon.2", ""})
        EXPECT_EQ(this->answer(part), "(null)") << part;
    EXPECT_EQ(this->answer(nullptr), "(null)");
}

TYPED_TEST(TextRowTest, TheLastFunctionCounts) {
    this->show();
    this->row->setSelectedCb([this] { this->selections += 10; });
    this->tap();
    EXPECT_EQ(this->selections, 10);
}

TYPED_TEST(TextRowTest, WithoutAFunctionATapDoesNothing) {
    this->show();
    this->row->setSelectedCb(nullptr);
    this->tap();
    this->row->onSelect(nullptr);
    EXPECT_EQ(this->selections, 0);
}

TYPED_TEST(TextRowTest, ThePageMayGoFromWithinATap) {
    this->show();
    const auto alive = this->page->getWeakPtr();
    this->row->setSelectedCb([this] {
        ++this->selections;
        this->page->destroy();
    });
    this->tap();
    EXPECT_EQ(this->selections, 1);
    EXPECT_FALSE(alive);
}

TYPED_TEST(TextRowTest, GoesWithItsListItem) {
    this->show();
    const auto held = std::make_shared<int>(0);
    this->row->setSelectedCb([held] { ++*held; });
    EXPECT_EQ(held.use_count(), 2);
    elm_object_item_del(this->page->item());
    this->stage().settle();
    EXPECT_EQ(held.use_count(), 1);
}

TYPED_TEST(TextRowTest, AMissingRowIsLogged) {
    this->show();
    Elm_Genlist_Item_Class* const itemClass = this->row->getItemClassNew();
    EXPECT_EQ(itemClass->func.text_get(nullptr, this->page->genlist(), "elm.text.main.left.top"),
              nullptr);
    itemClass->func.del(nullptr, this->page->genlist());
    elm_genlist_item_class_free(itemClass);
    this->expectLog("Data is NULL !!");
}

} // namespace

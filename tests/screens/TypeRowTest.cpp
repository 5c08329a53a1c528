// The editor's row for the alert type.

#include <climits>
#include <cstdlib>
#include <memory>
#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "AlarmTypeItem.h"
#include "screens/RowPage.h"
#include "screens/TestCatalogue.h"
#include "support/ScreenTest.h"

using testing::ElementsAre;

namespace {

class TypeRowTest : public ScreenTest {
protected:
    void show() {
        row = new AlarmTypeItem(alarm);
        row->setSelectedCb([this] { ++selections; });
        page = new RowPage(row);
        stage().push(page);
    }

    std::vector<std::string> texts() { return Stage::rows(page->genlist()).front().texts; }

    /** What the row answers for a part; "(null)" for nothing. */
    std::string answer(const char* part) {
        const std::unique_ptr<Elm_Genlist_Item_Class, decltype(&elm_genlist_item_class_free)>
            itemClass(row->getItemClassNew(), &elm_genlist_item_class_free);
        const std::unique_ptr<char, decltype(&std::free)> text(
            itemClass->func.text_get(row, page->genlist(), part), &std::free);
        return text ? text.get() : "(null)";
    }

    ClockAlarmDbData alarm{};
    AlarmTypeItem* row = nullptr;
    RowPage* page = nullptr;
    int selections = 0;
};

TEST_F(TypeRowTest, NamesTheTypeOfTheRecord) {
    show();
    EXPECT_THAT(texts(), ElementsAre("Alarm type", "Sound"));
    const char* const names[] = {"Sound", "Vibration", "Vibration and sound"};
    for (int type = 0; type < 3; ++type) {
        alarm.type = type;
        elm_genlist_item_update(page->item());
        stage().settle();
        EXPECT_THAT(texts(), ElementsAre("Alarm type", names[type]));
    }
}

TEST_F(TypeRowTest, AnUnknownTypeHasNoName) {
    alarm.type = 3;
    show();
    EXPECT_THAT(texts(), ElementsAre("Alarm type"));
    for (const int type : {-1, 3, INT_MIN, INT_MAX}) {
        alarm.type = type;
        EXPECT_EQ(answer("elm.text.sub.left.bottom"), "(null)") << type;
        EXPECT_EQ(answer("elm.text.main.left.top"), "Alarm type");
    }
}

TEST_F(TypeRowTest, ServesNoOtherPart) {
    show();
    for (const char* part : {"elm.text", "elm.text.main.left", "elm.icon.2", ""})
        EXPECT_EQ(answer(part), "(null)") << part;
    EXPECT_EQ(answer(nullptr), "(null)");
}

TEST_F(TypeRowTest, FormatsInTranslationsAreOnlyText) {
    show();
    const TestCatalogue hostile{{"IDS_ALM_BODY_SOUND", "%n"},
                                {"IDS_CLOCK_TMBODY_ALARM_TYPE", "%s%s"}};
    EXPECT_EQ(answer("elm.text.sub.left.bottom"), "%n");
    EXPECT_EQ(answer("elm.text.main.left.top"), "%s%s");
}

TEST_F(TypeRowTest, EachItemClassIsANewOneOfTheTwoLineStyle) {
    show();
    Elm_Genlist_Item_Class* const one = row->getItemClassNew();
    Elm_Genlist_Item_Class* const other = row->getItemClassNew();
    EXPECT_NE(one, other);
    EXPECT_STREQ(one->item_style, "2line.top");
    EXPECT_EQ(one->func.content_get, nullptr);
    elm_genlist_item_class_free(one);
    elm_genlist_item_class_free(other);
}

TEST_F(TypeRowTest, EveryTapCounts) {
    show();
    stage().tapText("Alarm type");
    EXPECT_EQ(selections, 1);
    EXPECT_FALSE(elm_genlist_item_selected_get(page->item()));
    stage().tapText("Sound");
    EXPECT_EQ(selections, 2);
    EXPECT_EQ(alarm.type, 0);
}

TEST_F(TypeRowTest, TheLastFunctionCounts) {
    show();
    row->setSelectedCb([this] { selections += 10; });
    stage().tapRow(page->item());
    EXPECT_EQ(selections, 10);
}

TEST_F(TypeRowTest, WithoutAFunctionATapDoesNothing) {
    show();
    row->setSelectedCb(nullptr);
    stage().tapRow(page->item());
    row->onSelect(nullptr);
    EXPECT_EQ(selections, 0);
}

TEST_F(TypeRowTest, AMissingRowIsLogged) {
    show();
    Elm_Genlist_Item_Class* const itemClass = row->getItemClassNew();
    EXPECT_EQ(itemClass->func.text_get(nullptr, page->genlist(), "elm.text.main.left.top"),
              nullptr);
    itemClass->func.del(nullptr, page->genlist());
    elm_genlist_item_class_free(itemClass);
    expectLog("Data is NULL !!");
}

} // namespace

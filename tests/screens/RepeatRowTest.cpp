// The editor's row for the weekly repeat.

#include <cstdlib>
#include <memory>
#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "AlarmRepeatItem.h"
#include "screens/RowPage.h"
#include "screens/TestCatalogue.h"
#include "support/ScreenTest.h"

using testing::ElementsAre;

namespace {

class RepeatRowTest : public ScreenTest {
protected:
    void show() {
        row = new AlarmRepeatItem(alarm);
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
    std::string summaryOf(int weekdays) {
        alarm.repeatWeekly = weekdays;
        return answer("elm.text.sub.left.bottom");
    }

    ClockAlarmDbData alarm{};
    AlarmRepeatItem* row = nullptr;
    RowPage* page = nullptr;
    int selections = 0;
};

TEST_F(RepeatRowTest, ShowsItsTitleAndTheDays) {
    alarm.repeatWeekly = 62;
    show();
    EXPECT_THAT(texts(), ElementsAre("Repeat weekly", "Mon Tue Wed Thu Fri "));
}

TEST_F(RepeatRowTest, ShowsThatItNeverRepeats) {
    show();
    EXPECT_THAT(texts(), ElementsAre("Repeat weekly", "Never"));
}

TEST_F(RepeatRowTest, SummarisesTheDays) {
    show();
    EXPECT_EQ(summaryOf(0), "Never");
    EXPECT_EQ(summaryOf(127), "Every day");
    EXPECT_EQ(summaryOf(65), "Sat Sun ");
    EXPECT_EQ(summaryOf(1), "Sun ");
    EXPECT_EQ(summaryOf(126), "Mon Tue Wed Thu Fri Sat ");
    EXPECT_EQ(summaryOf(128), "Never");
    EXPECT_EQ(summaryOf(255), "Mon Tue Wed Thu Fri Sat Sun ");
}

TEST_F(RepeatRowTest, FollowsTheRecordWhenItIsRefreshed) {
    show();
    alarm.repeatWeekly = 127;
    elm_genlist_item_update(page->item());
    stage().settle();
    EXPECT_THAT(texts(), ElementsAre("Repeat weekly", "Every day"));
}

TEST_F(RepeatRowTest, LongDayNamesAreCutPieceByPiece) {
    show();
    const TestCatalogue wordy{{"IDS_CLOCK_SBODY_MON_ABB2", std::string(100, 'm')},
                              {"IDS_CLOCK_SBODY_SUN_ABB2", std::string(100, 's')}};
    EXPECT_EQ(summaryOf(3), std::string(63, 'm') + std::string(63, 's'));
}

TEST_F(RepeatRowTest, FormatsInDayNamesAreOnlyText) {
    show();
    const TestCatalogue hostile{{"IDS_CLOCK_SBODY_MON_ABB2", "%n"},
                                {"IDS_CLOCK_SBODY_SUN_ABB2", "%s%s"},
                                {"IDS_CLOCK_MBODY_NEVER", "%n%n"},
                                {"IDS_ALM_BODY_EVERYDAY", "%s"}};
    EXPECT_EQ(summaryOf(3), "%n %s%s ");
    EXPECT_EQ(summaryOf(0), "%n%n");
    EXPECT_EQ(summaryOf(127), "%s");
}

TEST_F(RepeatRowTest, ServesNoOtherPart) {
    show();
    for (const char* part : {"elm.text", "elm.text.main.left", "elm.icon.2", ""})
        EXPECT_EQ(answer(part), "(null)") << part;
    EXPECT_EQ(answer(nullptr), "(null)");
}

TEST_F(RepeatRowTest, EachItemClassIsANewOneOfTheTwoLineStyle) {
    show();
    Elm_Genlist_Item_Class* const one = row->getItemClassNew();
    Elm_Genlist_Item_Class* const other = row->getItemClassNew();
    EXPECT_NE(one, other);
    EXPECT_STREQ(one->item_style, "2line.top");
    EXPECT_EQ(one->func.content_get, nullptr);
    EXPECT_NE(one->func.del, nullptr);
    elm_genlist_item_class_free(one);
    elm_genlist_item_class_free(other);
}

TEST_F(RepeatRowTest, EveryTapCounts) {
    show();
    stage().tapText("Repeat weekly");
    EXPECT_EQ(selections, 1);
    EXPECT_FALSE(elm_genlist_item_selected_get(page->item()));
    stage().tapText("Never");
    EXPECT_EQ(selections, 2);
}

TEST_F(RepeatRowTest, TheLastFunctionCounts) {
    show();
    row->setSelectedCb([this] { selections += 10; });
    stage().tapRow(page->item());
    EXPECT_EQ(selections, 10);
}

TEST_F(RepeatRowTest, WithoutAFunctionATapDoesNothing) {
    show();
    row->setSelectedCb(nullptr);
    stage().tapRow(page->item());
    row->onSelect(nullptr);
    EXPECT_EQ(selections, 0);
}

TEST_F(RepeatRowTest, ThePageMayGoFromWithinATap) {
    show();
    const auto alive = page->getWeakPtr();
    row->setSelectedCb([this] {
        ++selections;
        page->destroy();
    });
    stage().tapRow(page->item());
    stage().settle();
    EXPECT_EQ(selections, 1);
    EXPECT_FALSE(alive);
}

TEST_F(RepeatRowTest, AMissingRowIsLogged) {
    show();
    Elm_Genlist_Item_Class* const itemClass = row->getItemClassNew();
    EXPECT_EQ(itemClass->func.text_get(nullptr, page->genlist(), "elm.text.main.left.top"),
              nullptr);
    itemClass->func.del(nullptr, page->genlist());
    elm_genlist_item_class_free(itemClass);
    expectLog("Data is NULL !!");
}

} // namespace

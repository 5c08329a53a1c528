// The editor's row for the weekly repeat.

#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "AlarmRepeatItem.h"
#include "screens/TestCatalogue.h"
#include "screens/TextRowFixture.h"

using testing::ElementsAre;

namespace {

class RepeatRowTest : public TextRowFixture<AlarmRepeatItem> {
protected:
    std::string summaryOf(int weekdays) {
        alarm.repeatWeekly = weekdays;
        return answer("elm.text.sub.left.bottom");
    }
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

TEST_F(RepeatRowTest, EveryTapCounts) {
    show();
    stage().tapText("Repeat weekly");
    EXPECT_EQ(selections, 1);
    EXPECT_FALSE(elm_genlist_item_selected_get(page->item()));
    stage().tapText("Never");
    EXPECT_EQ(selections, 2);
}

} // namespace

// The editor's row for the alert type.

#include <climits>
#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "AlarmTypeItem.h"
#include "screens/TestCatalogue.h"
#include "screens/TextRowFixture.h"

using testing::ElementsAre;

namespace {

using TypeRowTest = TextRowFixture<AlarmTypeItem>;

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

TEST_F(TypeRowTest, FormatsInTranslationsAreOnlyText) {
    show();
    const TestCatalogue hostile{{"IDS_ALM_BODY_SOUND", "%n"},
                                {"IDS_CLOCK_TMBODY_ALARM_TYPE", "%s%s"}};
    EXPECT_EQ(answer("elm.text.sub.left.bottom"), "%n");
    EXPECT_EQ(answer("elm.text.main.left.top"), "%s%s");
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

} // namespace

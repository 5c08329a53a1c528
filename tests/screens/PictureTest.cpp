// The editor's screens, compared with pictures that somebody has looked at.

#include <cstdlib>
#include <string_view>

#include <gtest/gtest-spi.h>

#include "screens/EditorFixture.h"

namespace {

constexpr const char* HOURS_KEY = "db/menu_widget/regionformat_time1224";

class PictureTest : public EditorFixture {
protected:
    void TearDown() override {
        takeErrors();
        EditorFixture::TearDown();
    }

    /** An alarm of 07:30 that is not in the store. */
    static ClockAlarmDbData morning() {
        ClockAlarmDbData alarm{};
        alarm.hour = 7;
        alarm.min = 30;
        alarm.name = "Gym";
        return alarm;
    }

    /** A comparison that is to fail would take its picture for the new one. */
    static bool isUpdate() {
        const char* const update = std::getenv("CLOCK_UPDATE_PICTURES");
        return update != nullptr && std::string_view(update) == "1";
    }

    Evas_Object* button(const char* text) { return stage().findText(text)->widget; }
};

TEST_F(PictureTest, ANewAlarmWith24Hours) {
    createAlarm();
    stage().expectPicture("editor-24h");
}

TEST_F(PictureTest, ANewAlarmWith12Hours) {
    device().setSetting(HOURS_KEY, 1);
    createAlarm();
    stage().expectPicture("editor-12h");
}

TEST_F(PictureTest, AnAlarmWithADate) {
    ClockAlarmDbData alarm = morning();
    alarm.autoDate = alarm.manualDate = static_cast<std::int32_t>(at("2026-12-24 00:00:00"));
    editAlarm(alarm);
    stage().expectPicture("editor-date");
}

TEST_F(PictureTest, TheVolumeInTheMiddle) {
    editAlarm(morning());
    stage().showRow(elm_genlist_nth_item_get(genlist(), 3));
    stage().settle();
    stage().expectPicture("editor-volume");
}

TEST_F(PictureTest, TheNameInTheMiddle) {
    editAlarm(morning());
    stage().showRow(nameRow().getElmObjectItem());
    stage().settle();
    stage().expectPicture("editor-name");
}

TEST_F(PictureTest, TheQuestionBeforeDiscarding) {
    createAlarm();
    pick(7, 30);
    stage().backKey();
    stage().settle();
    ASSERT_TRUE(asksToDiscard());
    stage().expectPicture("discard-popup");
}

TEST_F(PictureTest, AMissingButtonIsSeen) {
    if (isUpdate())
        GTEST_SKIP();
    for (const char* text : {"Cancel", "Done", "DATE"}) {
        SCOPED_TRACE(text);
        createAlarm();
        evas_object_hide(button(text));
        stage().settle();
        ASSERT_FALSE(stage().shows(text));
        EXPECT_NONFATAL_FAILURE(stage().expectPicture("editor-24h"), "unlike");
        takeStageDown();
    }
}

TEST_F(PictureTest, AnotherMinuteIsSeen) {
    if (isUpdate())
        GTEST_SKIP();
    createAlarm();
    std::tm shown{};
    elm_datetime_value_get(picker(), &shown);
    pick(shown.tm_hour, (shown.tm_min + 1) % 60);
    stage().settle();
    EXPECT_NONFATAL_FAILURE(stage().expectPicture("editor-24h"), "unlike");
}

TEST_F(PictureTest, AShadeDarkerIsTheSame) {
    if (isUpdate())
        GTEST_SKIP();
    createAlarm();
    Evas_Object* const shade = evas_object_rectangle_add(stage().canvas());
    evas_object_color_set(shade, 0, 0, 0, 16);
    evas_object_geometry_set(shade, 0, 0, Stage::SIZE, Stage::SIZE);
    evas_object_layer_set(shade, EVAS_LAYER_MAX);
    evas_object_show(shade);
    stage().settle();
    stage().expectPicture("editor-24h");
}

} // namespace

// The editor's row for the volume, alone.

#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "AlarmVolumeItem.h"
#include "screens/RowPage.h"
#include "screens/SliderHand.h"
#include "support/ScreenTest.h"
#include "support/SoundFake.h"

using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

namespace {

constexpr const char* NORMAL = "volume.normal.bg";
constexpr const char* VIBRATE = "volume.vibrate.bg";
constexpr const char* MUTE = "volume.mute.bg";
constexpr double CLOSE = 0.12; // A pixel of the slider's way.

class VolumeRowTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        alarm.volume = 7;
        alarm.soundPath = "/opt/usr/share/settings/Ringtones/Alarm_Impatient.ogg";
        alarm.tonePosition = 3;
    }

    void TearDown() override {
        takeStageDown();
        EXPECT_THAT(soundDevice().players(), IsEmpty()) << "a preview outlived its row";
        ScreenTest::TearDown();
    }

    void show(int level, int type = 0) {
        alarm.volume = level;
        alarm.type = type;
        row = new AlarmVolumeItem(alarm);
        page = new RowPage(row);
        stage().push(page);
        device().clearCalls();
    }

    Evas_Object* slider() const { return row->getSliderObj(); }
    double shown() const { return elm_slider_value_get(slider()); }
    std::string icon() const { return iconGroupOf(slider()); }
    static std::size_t previewsBegun() {
        return device().callsTo("ClockSoundPlayer::initialize").size();
    }
    static std::size_t starts() { return device().callsTo("sound_player_start").size(); }
    SliderHand& hand() { return _hand ? *_hand : _hand.emplace(stage()); }
    void blur() {
        Evas_Object* const other = elm_button_add(stage().window());
        evas_object_geometry_set(other, 150, 300, 60, 30);
        evas_object_show(other);
        elm_object_focus_set(other, EINA_TRUE);
        stage().settle();
        ASSERT_FALSE(elm_object_focus_get(slider()));
    }

    using ItemClass =
        std::unique_ptr<Elm_Genlist_Item_Class, decltype(&elm_genlist_item_class_free)>;
    ItemClass itemClass() const { return {row->getItemClassNew(), &elm_genlist_item_class_free}; }

    ClockAlarmDbData alarm{};
    AlarmVolumeItem* row = nullptr;
    RowPage* page = nullptr;

private:
    std::optional<SliderHand> _hand;
};

TEST_F(VolumeRowTest, IsASliderFromSilentToLoudest) {
    show(7);
    double least = -1;
    double most = -1;
    elm_slider_min_max_get(slider(), &least, &most);
    EXPECT_EQ(least, 0.0);
    EXPECT_EQ(most, 15.0);
    EXPECT_EQ(shown(), 7.0);
    EXPECT_FALSE(elm_slider_indicator_show_get(slider()));
    EXPECT_FALSE(evas_object_propagate_events_get(slider()));
    double x = 0;
    double y = 0;
    evas_object_size_hint_weight_get(slider(), &x, &y);
    EXPECT_EQ(std::pair(x, y), std::pair(1.0, 1.0));
    evas_object_size_hint_align_get(slider(), &x, &y);
    EXPECT_EQ(std::pair(x, y), std::pair(-1.0, -1.0));
    EXPECT_TRUE(stage().canBeSeen(slider()));
    EXPECT_THAT(soundDevice().players(), IsEmpty()) << "showing it plays nothing";
}

TEST_F(VolumeRowTest, HasOneControlAndNoTexts) {
    show(7);
    const auto made = itemClass();
    EXPECT_STREQ(made->item_style, "1icon");
    EXPECT_EQ(made->func.text_get, nullptr);
    EXPECT_EQ(made->func.content_get(row, page->genlist(), "elm.icon.2"), nullptr);
    EXPECT_EQ(made->func.content_get(row, page->genlist(), nullptr), nullptr);
    EXPECT_THAT(stage().widgets("Slider"), SizeIs(1));
}

TEST_F(VolumeRowTest, CallbacksWithoutARowAreErrorLines) {
    show(7);
    EXPECT_EQ(AlarmVolumeItem::_getVolumeItemContent(nullptr, page->genlist(), "elm.icon"),
              nullptr);
    expectLog("Data is NULL !!");
    EXPECT_EQ(
        AlarmVolumeItem::_keepVolumeItemContent(nullptr, page->genlist(), "elm.icon", slider()),
        nullptr);
    expectLog("Data is NULL !!");
    for (auto* callback :
         {&AlarmVolumeItem::_volumeSliderChangeCb, &AlarmVolumeItem::_volumeSliderStopCb,
          &AlarmVolumeItem::_volumeSliderUnfocusedCb}) {
        callback(nullptr, slider(), nullptr);
        expectLog("Data is NULL !!");
    }
    EXPECT_EQ(alarm.volume, 7);
}

// The icon.

TEST_F(VolumeRowTest, TheIconTellsTheLevelAndTheType) {
    struct Case {
        int level;
        int type;
        const char* group;
    };
    for (const Case& c : {Case{7, 0, NORMAL}, Case{1, 2, NORMAL}, Case{0, 0, MUTE},
                          Case{0, 2, VIBRATE}, Case{15, 2, NORMAL}}) {
        show(c.level, c.type);
        EXPECT_EQ(icon(), c.group) << c.level << ' ' << c.type;
    }
}

TEST_F(VolumeRowTest, TheIconIsSquareAndReplacesTheOneBefore) {
    show(7);
    Evas_Object* before = elm_object_part_content_get(slider(), "elm.swallow.icon");
    bool deleted = false;
    evas_object_event_callback_add(
        before, EVAS_CALLBACK_DEL,
        [](void* data, Evas*, Evas_Object*, void*) { *static_cast<bool*>(data) = true; }, &deleted);
    row->_updateVolumeIcon(slider());
    stage().settle();
    EXPECT_TRUE(deleted);
    Evas_Object* icon = elm_object_part_content_get(slider(), "elm.swallow.icon");
    Evas_Aspect_Control control{};
    int width = 0;
    int height = 0;
    evas_object_size_hint_aspect_get(icon, &control, &width, &height);
    EXPECT_EQ(control, EVAS_ASPECT_CONTROL_VERTICAL);
    EXPECT_EQ(width, 1);
    EXPECT_EQ(height, 1);
    EXPECT_EQ(Stage::area(icon).width, Stage::area(icon).height);
}

TEST_F(VolumeRowTest, WhereTheIconsAreIsLoggedAsAnError) {
    show(7);
    const std::size_t before = device().log().size();
    row->_updateVolumeIcon(nullptr);
    ASSERT_EQ(device().log().size(), before + 1);
    EXPECT_TRUE(device().log().back().text.starts_with("path: "));
    EXPECT_TRUE(device().log().back().text.ends_with("edje/AlarmEditViewController.edj"));
    EXPECT_EQ(device().log().back().tag, "alarm-ui-common");
    EXPECT_TRUE(takeErrors().empty());
}

TEST_F(VolumeRowTest, WithoutThemeTheIconIsEmptyAndTheSliderWorks) {
    device().fail("app_resource_manager_get");
    show(7);
    EXPECT_NE(elm_object_part_content_get(slider(), "elm.swallow.icon"), nullptr);
    EXPECT_EQ(icon(), "");
    for (const std::string& line : takeErrors())
        EXPECT_EQ(line, "path is NULL !!");
    hand().drag(slider(), 10);
    EXPECT_EQ(alarm.volume, 10);
    expectLog("path is NULL !!");
    takeErrors();
}

// The finger.

TEST_F(VolumeRowTest, TheLevelFollowsTheFingerAtOnce) {
    show(7);
    hand().take(slider());
    EXPECT_EQ(alarm.volume, 7) << "taking hold of the knob changes nothing";
    EXPECT_EQ(previewsBegun(), 0U);
    for (const int level : {9, 12, 15, 8, 3, 0, 5}) {
        hand().moveTo(slider(), level);
        EXPECT_EQ(alarm.volume, level);
    }
    hand().letGo();
    EXPECT_EQ(alarm.volume, 5);
}

TEST_F(VolumeRowTest, ATapOnTheBarSetsTheLevel) {
    show(7);
    stage().tap(SliderHand::place(slider(), 12));
    stage().settle();
    EXPECT_NEAR(alarm.volume, 12, 1) << "near the ends, the knob's middle is not under the finger";
    EXPECT_NEAR(shown(), alarm.volume, 0.5);
    EXPECT_EQ(previewsBegun(), 1U);
}

TEST_F(VolumeRowTest, HalfALevelIsRoundedUp) {
    show(7);
    for (const auto& [value, level] :
         {std::pair(9.3, 9), std::pair(9.7, 10), std::pair(10.3, 10), std::pair(0.7, 1)}) {
        hand().take(slider());
        hand().moveTo(slider(), value);
        EXPECT_NEAR(shown(), value, CLOSE);
        EXPECT_EQ(alarm.volume, level) << value;
        hand().letGo();
        EXPECT_NEAR(shown(), value, CLOSE) << "the slider does not jump to the level";
    }
}

TEST_F(VolumeRowTest, LettingGoNearSilenceMovesTheSliderToIt) {
    show(7);
    hand().take(slider());
    hand().moveTo(slider(), 0.3);
    EXPECT_GT(shown(), 0.0);
    EXPECT_LT(shown(), 0.5);
    EXPECT_EQ(alarm.volume, 0);
    hand().letGo();
    EXPECT_EQ(shown(), 0.0);
    EXPECT_EQ(alarm.volume, 0);
    EXPECT_EQ(icon(), MUTE);
}

TEST_F(VolumeRowTest, LettingGoJustAboveFourteenShowsFifteenAndKeepsFourteen) {
    show(7);
    hand().take(slider());
    hand().moveTo(slider(), 14.2);
    EXPECT_GT(shown(), 14.0);
    EXPECT_LT(shown(), 14.5);
    EXPECT_EQ(alarm.volume, 14);
    hand().letGo();
    EXPECT_EQ(shown(), 15.0);
    EXPECT_EQ(alarm.volume, 14);
}

TEST_F(VolumeRowTest, LettingGoNearTheLoudestStoresIt) {
    show(7);
    hand().take(slider());
    hand().moveTo(slider(), 14.65);
    const double before = shown();
    EXPECT_GT(before, 14.5);
    EXPECT_LT(before, 15.0);
    EXPECT_EQ(alarm.volume, 15);
    hand().letGo();
    EXPECT_EQ(shown(), before) << "only below the middle it snaps";
    EXPECT_EQ(alarm.volume, 15);
    EXPECT_EQ(icon(), NORMAL);
}

TEST_F(VolumeRowTest, TheIconFollowsTheFinger) {
    show(7, 2);
    hand().take(slider());
    hand().moveTo(slider(), 0);
    EXPECT_EQ(icon(), VIBRATE);
    alarm.type = 0;
    hand().moveTo(slider(), 1);
    EXPECT_EQ(icon(), NORMAL);
    hand().moveTo(slider(), 0);
    EXPECT_EQ(icon(), MUTE);
    hand().letGo();
}

TEST_F(VolumeRowTest, MovingTheSliderDoesNotSelectTheRow) {
    show(7);
    int selected = 0;
    row->setSelectedCb([&selected] { ++selected; });
    hand().drag(slider(), 3);
    stage().tap(SliderHand::place(slider(), 10));
    EXPECT_EQ(selected, 0);
}

// The preview.

TEST_F(VolumeRowTest, TheFirstChangeBeginsAPreview) {
    show(7);
    hand().take(slider());
    hand().moveTo(slider(), 7.6);
    ASSERT_EQ(alarm.volume, 8);
    EXPECT_THAT(device().callsTo("ClockSoundPlayer::initialize"),
                ElementsAre("ClockSoundPlayer::initialize("
                            R"("/opt/usr/share/settings/Ringtones/Alarm_Impatient.ogg", )"
                            R"("/opt/usr/share/settings/Ringtones/Alarm_Impatient.ogg", )"
                            "1, 8, 0, true, 3)"));
    ASSERT_THAT(soundDevice().players(), SizeIs(1));
    EXPECT_EQ(soundDevice().players().front().level, 8);
    EXPECT_TRUE(soundDevice().players().front().loop);
    EXPECT_TRUE(soundDevice().players().front().playing);
    EXPECT_EQ(starts(), 1U) << "beginning it is enough";
    hand().letGo();
    EXPECT_THAT(soundDevice().players(), SizeIs(1)) << "the preview goes on";
}

TEST_F(VolumeRowTest, FurtherChangesSetTheLevelAndStartAgain) {
    show(7);
    row->increaseVolume();
    device().clearCalls();
    hand().take(slider());
    hand().moveTo(slider(), 8.6);
    ASSERT_EQ(alarm.volume, 9);
    EXPECT_EQ(previewsBegun(), 0U);
    EXPECT_THAT(device().callsTo("sound_player_set_level"),
                ElementsAre("sound_player_set_level(player, 9)"));
    EXPECT_EQ(starts(), 1U);
    EXPECT_THAT(soundDevice().players(), SizeIs(1));
    hand().letGo();
}

TEST_F(VolumeRowTest, MovesWithinALevelAreNotHeard) {
    show(7);
    hand().take(slider());
    hand().moveTo(slider(), 7.3);
    hand().moveTo(slider(), 6.7);
    EXPECT_EQ(previewsBegun(), 0U);
    hand().letGo();
    EXPECT_EQ(alarm.volume, 7);
}

TEST_F(VolumeRowTest, ThePreviewEndsWhenTheSliderLosesTheFocus) {
    show(7);
    hand().drag(slider(), 10);
    ASSERT_TRUE(elm_object_focus_get(slider()));
    ASSERT_THAT(soundDevice().players(), SizeIs(1));
    blur();
    EXPECT_THAT(soundDevice().players(), IsEmpty());
}

TEST_F(VolumeRowTest, AfterTheFocusWasLostAChangeBeginsANewPreview) {
    show(7);
    for (const int level : {10, 3, 12}) {
        hand().drag(slider(), level);
        EXPECT_THAT(soundDevice().players(), SizeIs(1));
        blur();
        EXPECT_THAT(soundDevice().players(), IsEmpty());
    }
    EXPECT_EQ(previewsBegun(), 3U);
}

TEST_F(VolumeRowTest, WithoutAChangeTheFocusIsNotWatched) {
    show(7);
    row->increaseVolume();
    ASSERT_THAT(soundDevice().players(), SizeIs(1));
    elm_object_focus_set(slider(), EINA_TRUE);
    stage().settle();
    blur();
    EXPECT_THAT(soundDevice().players(), SizeIs(1)) << "a step is no change of the slider";
}

TEST_F(VolumeRowTest, ALostFocusIsHeardOnceForEachChange) {
    show(7);
    hand().drag(slider(), 8);
    blur();
    row->increaseVolume();
    ASSERT_THAT(soundDevice().players(), SizeIs(1));
    elm_object_focus_set(slider(), EINA_TRUE);
    stage().settle();
    blur();
    EXPECT_THAT(soundDevice().players(), SizeIs(1));
}

TEST_F(VolumeRowTest, ThePreviewCanBeStoppedAgainAndAgain) {
    show(7);
    row->stopSound();
    hand().drag(slider(), 10);
    row->stopSound();
    EXPECT_THAT(soundDevice().players(), IsEmpty());
    row->stopSound();
    hand().drag(slider(), 5);
    EXPECT_THAT(soundDevice().players(), SizeIs(1));
}

TEST_F(VolumeRowTest, ThePreviewEndsWithTheRow) {
    show(7);
    hand().drag(slider(), 10);
    ASSERT_THAT(soundDevice().players(), SizeIs(1));
    elm_genlist_clear(page->genlist());
    stage().settle();
    EXPECT_THAT(soundDevice().players(), IsEmpty());
}

TEST_F(VolumeRowTest, TheRowMayGoWhileAFingerIsOnItsSlider) {
    show(7);
    hand().take(slider());
    hand().moveTo(slider(), 12);
    elm_genlist_clear(page->genlist());
    stage().moveTo(100, 150);
    stage().release();
    stage().settle();
    EXPECT_EQ(alarm.volume, 12);
    EXPECT_THAT(soundDevice().players(), IsEmpty());
}

TEST_F(VolumeRowTest, APreviewThatCannotPlayStopsNothing) {
    device().fail("sound_player_create", SOUND_PLAYER_ERROR_NOT_SUPPORTED);
    show(7);
    hand().drag(slider(), 10);
    EXPECT_EQ(alarm.volume, 10);
    row->increaseVolume();
    EXPECT_EQ(alarm.volume, 11);
    row->stopSound();
    takeErrors();
}

// Steps.

TEST_F(VolumeRowTest, AStepMovesTheSliderAndIsHeard) {
    show(7, 2);
    row->increaseVolume();
    EXPECT_EQ(alarm.volume, 8);
    EXPECT_EQ(shown(), 8.0);
    EXPECT_EQ(previewsBegun(), 1U);
    row->decreaseVolume();
    EXPECT_EQ(alarm.volume, 7);
    EXPECT_EQ(shown(), 7.0);
    EXPECT_EQ(previewsBegun(), 1U);
    ASSERT_THAT(soundDevice().players(), SizeIs(1));
    EXPECT_EQ(soundDevice().players().front().level, 7);
    EXPECT_EQ(starts(), 2U);
}

TEST_F(VolumeRowTest, AStepChangesTheIcon) {
    show(1, 2);
    row->decreaseVolume();
    EXPECT_EQ(icon(), VIBRATE);
    row->increaseVolume();
    EXPECT_EQ(icon(), NORMAL);
}

TEST_F(VolumeRowTest, StepsEndAtTheLoudest) {
    show(14);
    row->increaseVolume();
    EXPECT_EQ(alarm.volume, 15);
    EXPECT_EQ(shown(), 15.0);
    device().clearCalls();
    row->increaseVolume();
    EXPECT_EQ(alarm.volume, 15);
    EXPECT_THAT(device().calls(), IsEmpty()) << "nothing is played, and no icon looked up";
}

TEST_F(VolumeRowTest, StepsEndAtSilence) {
    show(1);
    row->decreaseVolume();
    EXPECT_EQ(alarm.volume, 0);
    EXPECT_EQ(shown(), 0.0);
    EXPECT_EQ(icon(), MUTE);
    device().clearCalls();
    row->decreaseVolume();
    EXPECT_EQ(alarm.volume, 0);
    EXPECT_THAT(device().calls(), IsEmpty());
}

TEST_F(VolumeRowTest, ARowThatWasNeverShownCanBeStepped) {
    {
        AlarmVolumeItem unseen(alarm);
        EXPECT_EQ(unseen.getSliderObj(), nullptr);
        unseen.increaseVolume();
        EXPECT_EQ(alarm.volume, 8);
        ASSERT_THAT(soundDevice().players(), SizeIs(1));
        unseen.decreaseVolume();
        unseen.moveSlider(3);
        unseen._updateVolumeIcon(nullptr);
        EXPECT_EQ(alarm.volume, 7);
    }
    EXPECT_THAT(soundDevice().players(), IsEmpty());
    expectLog("path is NULL !!");
    takeErrors();
}

// A level from outside.

TEST_F(VolumeRowTest, ALevelFromOutsideIsStoredAndNothingElse) {
    show(7);
    row->setVolume(3);
    EXPECT_EQ(alarm.volume, 3);
    EXPECT_EQ(shown(), 7.0);
    EXPECT_THAT(device().calls(), IsEmpty());
}

TEST_F(VolumeRowTest, ALevelFromOutsideIsNotExamined) {
    show(7);
    row->setVolume(20);
    EXPECT_EQ(alarm.volume, 20);
    alarm.volume = 15;
    row->setVolume(-1);
    EXPECT_EQ(alarm.volume, -1);
    EXPECT_THAT(takeErrors(), IsEmpty());
}

TEST_F(VolumeRowTest, AStoredLevelOutOfRangeRefusesEveryOther) {
    show(7);
    for (const int stored : {20, 16, -1}) {
        alarm.volume = stored;
        row->setVolume(5);
        EXPECT_EQ(alarm.volume, stored);
        EXPECT_THAT(takeErrors(), ElementsAre("volume in not valid(5), return"));
    }
}

// The row's own tap.

TEST_F(VolumeRowTest, ATapOnTheRowCallsItsFunctionIfItHasOne) {
    show(7);
    row->onSelect(page->item());
    std::vector<std::string> calls;
    row->setSelectedCb([&calls] { calls.emplace_back("first"); });
    row->setSelectedCb([&calls] { calls.emplace_back("second"); });
    row->onSelect(page->item());
    row->onSelect(nullptr);
    EXPECT_THAT(calls, ElementsAre("second", "second"));
    row->setSelectedCb(nullptr);
    row->onSelect(nullptr);
    EXPECT_EQ(alarm.volume, 7);
}

// Several sliders, or none.

TEST_F(VolumeRowTest, RefreshingTheRowKeepsTheSliderUnderTheFinger) {
    show(7);
    Evas_Object* before = slider();
    hand().take(slider());
    hand().moveTo(slider(), 9);
    elm_genlist_item_update(page->item());
    Stage::frames(3);
    EXPECT_EQ(slider(), before);
    hand().moveTo(slider(), 12);
    EXPECT_EQ(alarm.volume, 12);
    hand().letGo();
}

TEST_F(VolumeRowTest, EverySliderOfTheRowFollows) {
    show(7);
    Evas_Object* first = slider();
    Evas_Object* second = itemClass()->func.content_get(row, page->genlist(), "elm.icon");
    ASSERT_EQ(slider(), second);
    row->increaseVolume();
    EXPECT_EQ(elm_slider_value_get(first), 8.0);
    EXPECT_EQ(elm_slider_value_get(second), 8.0);
    row->moveSlider(0);
    alarm.volume = 1;
    row->decreaseVolume();
    EXPECT_EQ(elm_slider_value_get(first), 0.0);
    EXPECT_EQ(iconGroupOf(first), MUTE);
    EXPECT_EQ(iconGroupOf(second), MUTE);
    evas_object_del(second);
    EXPECT_EQ(slider(), first);
    row->increaseVolume();
    EXPECT_EQ(elm_slider_value_get(first), 1.0);
}

TEST_F(VolumeRowTest, ARowWhoseSliderDiedCanStillBeStepped) {
    show(7);
    evas_object_del(slider());
    EXPECT_EQ(slider(), nullptr);
    row->increaseVolume();
    EXPECT_EQ(alarm.volume, 8);
    row->setVolume(3);
    EXPECT_EQ(alarm.volume, 3);
}

TEST_F(VolumeRowTest, ADamagedLevelIsShownAtTheNearerEnd) {
    show(20);
    EXPECT_EQ(shown(), 15.0);
    EXPECT_EQ(alarm.volume, 20) << "showing it writes nothing";
    show(-4);
    EXPECT_EQ(shown(), 0.0);
    EXPECT_EQ(icon(), MUTE);
}

TEST_F(VolumeRowTest, Pictures) {
    struct Case {
        int level;
        int type;
        const char* name;
    };
    for (const Case& c : {Case{0, 0, "volume-silent"}, Case{0, 2, "volume-vibrates"},
                          Case{7, 0, "volume-7"}, Case{15, 0, "volume-loudest"}}) {
        show(c.level, c.type);
        stage().screenshot(c.name);
    }
}

} // namespace

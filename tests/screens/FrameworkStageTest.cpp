// The stage itself: time, gestures, keys and looking.

#include <ctime>
#include <filesystem>
#include <string>
#include <vector>

#include <Ecore_Evas.h>
#include <Ecore_Input.h>
#include <gtest/gtest-spi.h>

#include "app_assist/WContentViewController.h"
#include "app_assist/WUiTimer.h"
#include "support/LiveObjects.h"
#include "support/Picture.h"
#include "support/ScreenTest.h"

#define LOG_TAG "app-assist"
#include "base/Log.h"

namespace {

class ButtonPage : public app_assist::WContentViewController {
public:
    Evas_Object* button = nullptr;
    int clicks = 0;

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void* /*param*/) override {
        Evas_Object* const box = elm_box_add(parent);
        button = elm_button_add(box);
        elm_object_text_set(button, "Press me");
        evas_object_size_hint_min_set(button, 160, 60);
        evas_object_smart_callback_add(
            button, "clicked",
            [](void* data, Evas_Object*, void*) { ++static_cast<ButtonPage*>(data)->clicks; },
            this);
        elm_box_pack_end(box, button);
        evas_object_show(button);
        return box;
    }
};

class EntryPage : public app_assist::WContentViewController {
public:
    Evas_Object* entry = nullptr;

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void* /*param*/) override {
        entry = elm_entry_add(parent);
        elm_entry_single_line_set(entry, EINA_TRUE);
        return entry;
    }
};

class ListPage : public app_assist::WContentViewController {
public:
    static constexpr int COUNT = 40;
    Evas_Object* list = nullptr;
    std::vector<int> selected;

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void* /*param*/) override {
        list = elm_genlist_add(parent);
        elm_genlist_mode_set(list, ELM_LIST_COMPRESS);
        Elm_Genlist_Item_Class* const itemClass = elm_genlist_item_class_new();
        itemClass->item_style = "default";
        itemClass->func.text_get = [](void* data, Evas_Object*, const char*) {
            return strdup(("Row " + std::to_string(reinterpret_cast<std::intptr_t>(data))).c_str());
        };
        for (std::intptr_t i = 0; i < COUNT; ++i) {
            elm_genlist_item_append(list, itemClass, reinterpret_cast<void*>(i), nullptr,
                                    ELM_GENLIST_ITEM_NONE, selectedCb, this);
        }
        elm_genlist_item_class_free(itemClass);
        return list;
    }

private:
    static void selectedCb(void* data, Evas_Object* /*list*/, void* info) {
        auto* const item = static_cast<Elm_Object_Item*>(info);
        static_cast<ListPage*>(data)->selected.push_back(
            static_cast<int>(reinterpret_cast<std::intptr_t>(elm_object_item_data_get(item))));
    }
};

std::string localTime(std::time_t time) {
    char text[32];
    std::tm civil{};
    std::strftime(text, sizeof text, "%Y-%m-%d %H:%M:%S", localtime_r(&time, &civil));
    return text;
}

class FrameworkStageTest : public ScreenTest {};

} // namespace

TEST_F(FrameworkStageTest, aTestBeginsOnANovemberMorningInBerlin) {
    EXPECT_EQ(localTime(std::time(nullptr)), "2026-11-18 09:41:00");
    EXPECT_EQ(std::time(nullptr), 1794991260);
}

TEST_F(FrameworkStageTest, timePassesInTheZoneThatTheTestChose) {
    VirtualClock::setNow("America/New_York", "2026-03-08 01:59:58");
    stage().advance(3);
    EXPECT_EQ(localTime(VirtualClock::now()), "2026-03-08 03:00:01");
}

TEST_F(FrameworkStageTest, timersFireAfterTheirTimeAndNotBefore) {
    int fired = 0;
    Ecore_Timer* const timer = ecore_timer_add(
        2.0,
        [](void* data) {
            ++*static_cast<int*>(data);
            return ECORE_CALLBACK_RENEW;
        },
        &fired);
    VirtualClock::advance(1.9);
    EXPECT_EQ(fired, 0);
    VirtualClock::advance(0.2);
    EXPECT_EQ(fired, 1);
    VirtualClock::advance(4);
    EXPECT_EQ(fired, 3);
    ecore_timer_del(timer);
}

TEST_F(FrameworkStageTest, settingTheClockLetsNoTimePass) {
    int fired = 0;
    Ecore_Timer* const timer = ecore_timer_add(
        5,
        [](void* data) {
            ++*static_cast<int*>(data);
            return ECORE_CALLBACK_RENEW;
        },
        &fired);
    VirtualClock::jump(3600);
    VirtualClock::frames(2);
    EXPECT_EQ(localTime(VirtualClock::now()), "2026-11-18 10:41:00");
    EXPECT_EQ(fired, 0);
    VirtualClock::jump(-7200);
    VirtualClock::advance(5.1);
    EXPECT_EQ(localTime(VirtualClock::now()), "2026-11-18 08:41:05");
    EXPECT_EQ(fired, 1);
    ecore_timer_del(timer);
}

TEST_F(FrameworkStageTest, aTapPressesTheButtonUnderIt) {
    auto* const page = new ButtonPage;
    stage().push(page);
    stage().tap(page->button);
    EXPECT_EQ(page->clicks, 1);
    stage().tapText("Press me");
    EXPECT_EQ(page->clicks, 2);
    stage().tap(10, 180);
    EXPECT_EQ(page->clicks, 2);
}

TEST_F(FrameworkStageTest, aTextIsFoundWithItsWidgetAndPlace) {
    auto* const page = new ButtonPage;
    stage().push(page);
    const auto found = stage().findText("Press me");
    ASSERT_TRUE(found.has_value());
    EXPECT_EQ(found->widget, page->button);
    EXPECT_TRUE(found->area.insideCircle());
    EXPECT_EQ(stage().widgets("Button"), std::vector<Evas_Object*>{page->button});
    evas_object_hide(page->button);
    stage().frames(2);
    EXPECT_FALSE(stage().shows("Press me"));
    EXPECT_FALSE(stage().shows("Press"));
}

TEST_F(FrameworkStageTest, theFaceIsStillWhenNothingMoves) {
    stage().push(new ButtonPage);
    EXPECT_TRUE(stage().settle());
    const int before = stage().renderedFrames();
    stage().advance(1);
    EXPECT_EQ(stage().renderedFrames(), before);
}

TEST_F(FrameworkStageTest, rowsAreReadWhereTheyAreInView) {
    auto* const page = new ListPage;
    stage().push(page);
    const auto rows = Stage::rows(page->list);
    ASSERT_EQ(rows.size(), static_cast<std::size_t>(ListPage::COUNT));
    EXPECT_EQ(rows[0].texts, std::vector<std::string>{"Row 0"});
    EXPECT_FALSE(rows[39].realized);
    stage().tapRow(rows[30].item);
    EXPECT_EQ(page->selected, std::vector<int>{30});
    EXPECT_TRUE(stage().shows("Row 30"));
    EXPECT_FALSE(stage().shows("Row 0"));
}

TEST_F(FrameworkStageTest, aDragScrollsAsFarAsTheFingerAndAFlickScrollsOn) {
    auto* const page = new ListPage;
    stage().push(page);
    int y = 0;
    stage().drag(180, 250, 0, -100);
    stage().settle();
    elm_scroller_region_get(page->list, nullptr, &y, nullptr, nullptr);
    EXPECT_NEAR(y, 100, 45);
    const int before = y;
    stage().flick(180, 300, 0, -200);
    stage().settle();
    elm_scroller_region_get(page->list, nullptr, &y, nullptr, nullptr);
    EXPECT_GT(y - before, 300);
    EXPECT_TRUE(page->selected.empty());
}

TEST_F(FrameworkStageTest, theWheelScrolls) {
    auto* const page = new ListPage;
    stage().push(page);
    stage().wheel(180, 180, 3);
    stage().settle();
    int y = 0;
    elm_scroller_region_get(page->list, nullptr, &y, nullptr, nullptr);
    EXPECT_GT(y, 20);
}

TEST_F(FrameworkStageTest, typingReachesTheFocusedEntryOnceForEachKey) {
    auto* const page = new EntryPage;
    stage().push(page);
    elm_object_focus_set(page->entry, EINA_TRUE);
    stage().type("Gym at 7, größer");
    EXPECT_STREQ(elm_entry_entry_get(page->entry), "Gym at 7, gr&ouml;&szlig;er");
    stage().key("BackSpace");
    EXPECT_STREQ(elm_entry_entry_get(page->entry), "Gym at 7, gr&ouml;&szlig;e");
}

TEST_F(FrameworkStageTest, aKeyReachesEachHandlerAndTheFocusedWidgetOnce) {
    struct Counts {
        int ecore = 0;
        int canvas = 0;
    } counts;
    auto* const page = new ButtonPage;
    stage().push(page);
    elm_object_focus_set(page->button, EINA_TRUE);
    evas_object_event_callback_add(
        page->button, EVAS_CALLBACK_KEY_DOWN,
        [](void* data, Evas*, Evas_Object*, void*) { ++static_cast<Counts*>(data)->canvas; },
        &counts);
    Ecore_Event_Handler* const handler = ecore_event_handler_add(
        ECORE_EVENT_KEY_DOWN,
        [](void* data, int, void* event) {
            EXPECT_STREQ(static_cast<Ecore_Event_Key*>(event)->keyname, "Return");
            ++static_cast<Counts*>(data)->ecore;
            return ECORE_CALLBACK_PASS_ON;
        },
        &counts);
    stage().key("Return");
    EXPECT_EQ(counts.ecore, 1);
    EXPECT_EQ(counts.canvas, 1);
    ecore_event_handler_del(handler);
}

TEST_F(FrameworkStageTest, picturesTellWhatChanged) {
    const Picture one{2, 2, std::vector<std::uint32_t>(4, 0xFF102030)};
    Picture other = one;
    EXPECT_EQ(comparePictures(one, other, 0).fraction, 0);
    other.pixels[1] += 10;
    EXPECT_EQ(comparePictures(one, other, 10).fraction, 0);
    other.pixels[1] += 30;
    EXPECT_EQ(comparePictures(one, other, 9).fraction, 0.25);
    EXPECT_EQ(comparePictures(other, one, 9).fraction, 0.25);
    EXPECT_EQ(comparePictures(one, other, 9).picture.pixels[1], 0xFFFF0000);
    EXPECT_EQ(comparePictures(one, {}, 255).fraction, 1);
}

TEST_F(FrameworkStageTest, aMovedEdgeIsNoChangeButAMissingLineIs) {
    constexpr std::uint32_t BLACK = 0xFF000000;
    constexpr std::uint32_t WHITE = 0xFFFFFFFF;
    const Picture line{6, 1, {BLACK, BLACK, WHITE, WHITE, BLACK, BLACK}};
    const Picture moved{6, 1, {BLACK, BLACK, 0xFF787878, WHITE, 0xFF888888, BLACK}};
    const Picture missing{6, 1, std::vector<std::uint32_t>(6, BLACK)};
    EXPECT_EQ(comparePictures(line, moved, 24).fraction, 0);
    EXPECT_EQ(comparePictures(moved, line, 24).fraction, 0);
    EXPECT_GT(comparePictures(line, missing, 24).fraction, 0.3);
    EXPECT_GT(comparePictures(missing, line, 24).fraction, 0.3);
}

TEST_F(FrameworkStageTest, aScreenshotIsWhatTheFaceShows) {
    stage().push(new ButtonPage);
    Evas_Object* const spot = evas_object_rectangle_add(stage().canvas());
    evas_object_color_set(spot, 0x12, 0x34, 0x56, 0xFF);
    evas_object_geometry_set(spot, 20, 190, 4, 2);
    evas_object_layer_set(spot, EVAS_LAYER_MAX);
    evas_object_show(spot);
    stage().frames(1);
    const Picture picture = Picture::load(stage().screenshot("stage"));
    ASSERT_EQ(picture.width, Stage::SIZE);
    ASSERT_EQ(picture.height, Stage::SIZE);
    EXPECT_EQ(picture.pixels[190 * Stage::SIZE + 20] & 0xFFFFFF, 0x123456U);
    EXPECT_NE(picture.pixels[190 * Stage::SIZE + 24] & 0xFFFFFF, 0x123456U);
    EXPECT_EQ(stage().pixel(23, 191) & 0xFFFFFF, 0x123456U);
    EXPECT_EQ(picture.pixels[0], stage().pixel(0, 0));
    EXPECT_NE(picture.pixels[0], stage().pixel(180, 350)) << "the bezel";
}

TEST_F(FrameworkStageTest, keysStillArriveAfterAPictureWasTaken) {
    auto* const page = new EntryPage;
    stage().push(page);
    elm_object_focus_set(page->entry, EINA_TRUE);
    stage().type("a");
    EXPECT_FALSE(Picture::load(stage().screenshot("keys")).empty());
    stage().type("b");
    EXPECT_STREQ(elm_entry_entry_get(page->entry), "ab");
}

TEST_F(FrameworkStageTest, aPictureUnlikeTheApprovedOneFailsAndIsLeftBehind) {
    const std::filesystem::path folder = CLOCK_TEST_OUTPUT_DIR "/screens";
    std::filesystem::remove(folder / "no-such-picture.png");
    stage().frames(1);
    EXPECT_NONFATAL_FAILURE(stage().expectPicture("no-such-picture"), "no approved picture");
    EXPECT_TRUE(std::filesystem::exists(folder / "no-such-picture.png"));
    EXPECT_TRUE(std::filesystem::exists(folder / "no-such-picture-difference.png"));
}

TEST_F(FrameworkStageTest, whatIsNotThereCannotBeTapped) {
    stage().frames(1);
    EXPECT_NONFATAL_FAILURE(stage().tap(nullptr), "cannot be seen");
    EXPECT_NONFATAL_FAILURE(stage().tapText("Nothing"), "does not show");
    EXPECT_NONFATAL_FAILURE(stage().tapPart(stage().window(), "nothing"), "no part");
}

TEST_F(FrameworkStageTest, anErrorLineMustBeExpected) {
    LOG_ERROR("one");
    LOG_ERROR("another");
    expectLog("another");
    EXPECT_NONFATAL_FAILURE(expectLog("another"), "no error line");
    EXPECT_EQ(takeErrors(), std::vector<std::string>{"one"});
}

TEST_F(FrameworkStageTest, liveObjectsAreCounted) {
    const int controllers = liveControllers();
    const int timers = liveTimers();
    auto* const page = new ButtonPage;
    EXPECT_EQ(liveControllers(), controllers + 1);
    delete page;
    EXPECT_EQ(liveControllers(), controllers);
    const auto timer = app_assist::WUiTimer::addTimer(
        1, [](void*) { return true; }, nullptr);
    EXPECT_EQ(liveTimers(), timers + 1);
    app_assist::WUiTimer::destroy(timer);
    EXPECT_EQ(liveTimers(), timers);
}

// The list of alarms by keys and by the bezel alone, and what a screen reader is told of it.
#define EFL_BETA_API_SUPPORT
#define EFL_ACCESS_OBJECT_PROTECTED
#include <Elementary.h>

#include <string>
#include <vector>

#include <gmock/gmock.h>

#include "AlarmListFixture.h"
#include "WorldClockViewController.h"
#include "support/Ring.h"
#include "support/ToolkitErrors.h"

using testing::Contains;
using testing::IsEmpty;
using testing::SizeIs;

namespace {

class AlarmListKeysTest : public AlarmListFixture {
protected:
    void keys(const std::vector<std::string>& names) {
        for (const std::string& name : names)
            stage().keySettled(name);
    }
    void bezelDown() {
        evas_event_feed_mouse_move(stage().canvas(), 180, 180, ++_stamp, nullptr);
        evas_event_feed_mouse_down(stage().canvas(), 2, EVAS_BUTTON_NONE, ++_stamp, nullptr);
        Stage::frames(1);
    }
    void bezelUp() {
        evas_event_feed_mouse_up(stage().canvas(), 2, EVAS_BUTTON_NONE, ++_stamp, nullptr);
        stage().settle();
    }
    void holdBezel() {
        bezelDown();
        Stage::advance(0.8);
        bezelUp();
    }
    /** A page above the list, with the focus on a row. */
    void openAlarm() {
        stage().pressBezel();
        EXPECT_EQ(pages(), 2U);
        for (int step = 0; step < 9 && ringedName(stage()) != "Repeat weekly"; ++step)
            stage().bezel(1);
        EXPECT_EQ(ringedName(stage()), "Repeat weekly");
    }
    bool asks() { return stage().shows("Remove"); }
    /** What is read of the switches and rows, with " (on)" where it is checked. */
    static void collect(Eo* object, Efl_Access_Role role, std::vector<std::string>& names) {
        const Efl_Access_State_Set states = efl_access_object_state_set_get(object);
        const char* const name = efl_access_object_i18n_name_get(object);
        if (efl_access_object_role_get(object) == role) {
            const bool checked = (states & (1ULL << EFL_ACCESS_STATE_TYPE_CHECKED)) != 0;
            names.push_back((name == nullptr ? "" : name) + std::string(checked ? " (on)" : ""));
        }
        Eina_List* children = efl_access_object_access_children_get(object);
        while (children != nullptr) {
            collect(static_cast<Eo*>(eina_list_data_get(children)), role, names);
            children = eina_list_remove_list(children, children);
        }
    }
    std::vector<std::string> read(Efl_Access_Role role) {
        std::vector<std::string> names;
        collect(stage().window(), role, names);
        return names;
    }

private:
    unsigned _stamp = 1000000;
};

} // namespace

TEST_F(AlarmListKeysTest, aRowAndItsSwitchAreReachedOneAfterTheOther) {
    const auto alarm = add(10, 30, true, WEDNESDAY);
    openPage();
    // The button of the title, the row, its switch.
    keys({"Tab", "Tab", "Tab", "space"});
    EXPECT_EQ(stored(alarm).enable, 0);
    EXPECT_FALSE(isOn("10:30"));
    EXPECT_EQ(pages(), 1U);
    keys({"space"});
    EXPECT_EQ(stored(alarm).enable, 1) << "the switch keeps the focus";
    EXPECT_TRUE(isOn("10:30"));
    keys({"Up", "Return"});
    EXPECT_EQ(pages(), 2U) << "the row opens the editor";
    takeStageDown();
    takeErrors();
}

TEST_F(AlarmListKeysTest, theSwitchesOfSeveralRowsAreReachedByTheBezel) {
    const auto first = add(10, 30, true, WEDNESDAY);
    const auto second = add(10, 45, true, WEDNESDAY);
    openPage();
    // It begins with the row in the middle.
    stage().bezel(1);
    stage().bezel(3);
    stage().pressBezel();
    EXPECT_EQ(stored(first).enable, 1);
    EXPECT_EQ(stored(second).enable, 0);
    stage().bezel(-2);
    stage().pressBezel();
    EXPECT_EQ(stored(first).enable, 0);
    stage().bezel(-1);
    stage().pressBezel();
    EXPECT_EQ(pages(), 2U);
    takeStageDown();
    takeErrors();
}

TEST_F(AlarmListKeysTest, aBezelThatIsHeldOnARowAsksWhetherToRemoveIt) {
    add(10, 30, true, WEDNESDAY);
    openPage();
    stage().bezel(1);
    holdBezel();
    EXPECT_TRUE(asks()) << readFace();
    EXPECT_EQ(pages(), 1U);
    stage().bezel(1);
    stage().bezel(1);
    stage().pressBezel();
    EXPECT_THAT(alarms(), IsEmpty());
    EXPECT_TRUE(stage().shows("No alarms")) << readFace();
}

TEST_F(AlarmListKeysTest, theDeleteKeyAsksToo) {
    add(10, 30, true, WEDNESDAY);
    openPage();
    keys({"Delete"});
    EXPECT_FALSE(asks()) << "nothing has the focus";
    keys({"Tab", "Delete"});
    EXPECT_FALSE(asks()) << "a button is not removed";
    keys({"Tab", "Delete"});
    EXPECT_TRUE(asks()) << readFace();
    keys({"Delete", "Escape"});
    EXPECT_FALSE(asks());
    EXPECT_THAT(alarms(), SizeIs(1));
    keys({"Delete"});
    EXPECT_TRUE(asks()) << "the focus is where it was";
}

TEST_F(AlarmListKeysTest, aBezelThatIsHeldOnASwitchFlipsItOnce) {
    const auto alarm = add(10, 30, true, WEDNESDAY);
    openPage();
    stage().bezel(1);
    stage().bezel(1);
    holdBezel();
    EXPECT_FALSE(asks());
    EXPECT_EQ(stored(alarm).enable, 0);
}

TEST_F(AlarmListKeysTest, aBezelThatIsHeldWhileItsPageGoesMeansNoOtherRow) {
    add(10, 30, true, WEDNESDAY);
    openPage();
    stage().bezel(1);
    openAlarm();
    bezelDown();
    stage().backKey();
    stage().settle();
    ASSERT_EQ(pages(), 1U);
    Stage::advance(0.8);
    EXPECT_FALSE(asks()) << "the row of the list was not what was pressed";
    bezelUp();
    EXPECT_EQ(pages(), 1U);
    takeErrors();
}

TEST_F(AlarmListKeysTest, aBezelThatIsLetGoWhenItsPageHasGoneMeansNoOtherRow) {
    add(10, 30, true, WEDNESDAY);
    openPage();
    stage().bezel(1);
    openAlarm();
    const double usual = elm_config_longpress_timeout_get();
    elm_config_longpress_timeout_set(60);
    bezelDown();
    stage().backKey();
    stage().settle();
    ASSERT_EQ(pages(), 1U);
    bezelUp();
    elm_config_longpress_timeout_set(usual);
    EXPECT_EQ(pages(), 1U) << "the row of the list was pressed";
    takeErrors();
}

TEST_F(AlarmListKeysTest, aBezelThatIsTurnedWhileItIsPressedMeansNoOtherRow) {
    add(10, 30, true, WEDNESDAY);
    add(10, 45, true, WEDNESDAY);
    openPage();
    stage().bezel(1);
    bezelDown();
    stage().bezel(2);
    EXPECT_EQ(theRinged(stage()).type, "Elm_Genlist");
    Stage::advance(0.8);
    EXPECT_FALSE(asks());
    bezelUp();
    EXPECT_EQ(pages(), 1U);
    holdBezel();
    EXPECT_TRUE(asks()) << "it can be held where it is now";
}

TEST_F(AlarmListKeysTest, aBezelThatIsPressedAnewIsHeldFromThen) {
    add(10, 30, true, WEDNESDAY);
    openPage();
    stage().bezel(1);
    const double timeout = elm_config_longpress_timeout_get();
    bezelDown();
    Stage::advance(0.7 * timeout);
    bezelDown();
    Stage::advance(0.7 * timeout);
    EXPECT_FALSE(asks()) << "the first press counts still";
    Stage::advance(0.7 * timeout);
    EXPECT_TRUE(asks());
    bezelUp();
}

TEST_F(AlarmListKeysTest, aBezelThatIsHeldWhileTheWindowGoesMeansNothing) {
    add(10, 30, true, WEDNESDAY);
    openPage();
    stage().bezel(1);
    bezelDown();
    const ToolkitErrors errors;
    takeStageDown();
    Stage::advance(0.8);
    EXPECT_THAT(takeErrors(), IsEmpty());
    EXPECT_EQ(errors.count(), 0);
}

TEST_F(AlarmListKeysTest, everythingHasANameForScreenReaders) {
    elm_config_atspi_mode_set(EINA_TRUE);
    add(10, 30, true, WEDNESDAY, "Tea");
    openPage();
    stage().settle();
    EXPECT_THAT(read(EFL_ACCESS_ROLE_CHECK_BOX), Contains("10:30, in 49 min, Tea, Wed (on)"));
    EXPECT_THAT(read(EFL_ACCESS_ROLE_LIST_ITEM), Contains("10:30, in 49 min, Tea, Wed"));
    flip("10:30");
    EXPECT_THAT(read(EFL_ACCESS_ROLE_CHECK_BOX), Contains("10:30, Tea, Wed"));
    takeStageDown();
    elm_config_atspi_mode_set(EINA_FALSE);
}

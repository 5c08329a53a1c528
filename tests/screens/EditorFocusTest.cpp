// Where the focus goes in the editor, and what a person sees of it.

#include <gtest/gtest.h>

#include "screens/EditorFixture.h"

namespace {

class EditorFocusTest : public EditorFixture {
protected:
    void TearDown() override {
        takeErrors();
        EditorFixture::TearDown();
    }

    Area nameField() { return Stage::area(nameRow().getNameEntryObj()); }
    bool nameHasFocus() { return elm_object_focus_get(nameRow().getNameEntryObj()); }
    Evas_Object* wheel(const char* part) { return elm_object_part_content_get(picker(), part); }

    std::string time() {
        std::tm shown{};
        EXPECT_TRUE(elm_datetime_value_get(picker(), &shown));
        return std::to_string(shown.tm_hour) + ":" + std::to_string(shown.tm_min);
    }

    /** The widget that has the keys; for a look at a failure. */
    std::string focused() {
        Evas_Object* const object = elm_object_focused_object_get(stage().window());
        return object == nullptr ? "nothing" : elm_object_widget_type_get(object);
    }
};

TEST_F(EditorFocusTest, TheNameStaysWhereItIsAfterDoneOnTheKeyboard) {
    createAlarm();
    typeName("Gym");
    ASSERT_TRUE(nameHasFocus());
    const int y = nameField().y;
    stage().key("Return");
    stage().settle();
    EXPECT_FALSE(nameHasFocus());
    EXPECT_EQ(nameField().y, y) << "the focus went to " << focused();
    EXPECT_TRUE(stage().shows("Gym"));
    EXPECT_TRUE(stage().shows("Alarm name"));
}

TEST_F(EditorFocusTest, TheNameStaysWhereItIsAfterAWheelHadTheFocus) {
    createAlarm();
    stage().tap(wheel("wheel.minute"));
    stage().settle();
    ASSERT_TRUE(elm_object_focus_get(wheel("wheel.minute")));
    typeName("Gym");
    ASSERT_TRUE(nameHasFocus());
    const int y = nameField().y;
    stage().key("Return");
    stage().settle();
    EXPECT_FALSE(nameHasFocus());
    EXPECT_EQ(nameField().y, y) << "the focus went to " << focused();
}

TEST_F(EditorFocusTest, NoKeyTurnsAWheelThatIsOutOfSight) {
    createAlarm();
    pick(7, 30);
    // Far enough to hide the wheels, not so far that the list puts the row aside.
    stage().drag(180, 255, 0, -150, 600);
    stage().settle();
    const Area minutes = Stage::area(wheel("wheel.minute"));
    ASSERT_LT(minutes.y + minutes.height / 2, 84) << "the title is above the list";
    elm_object_focus_set(wheel("wheel.minute"), EINA_TRUE);
    ASSERT_TRUE(elm_object_focus_get(wheel("wheel.minute")));
    stage().key("Down");
    stage().settle();
    EXPECT_EQ(time(), "7:30");
}

TEST_F(EditorFocusTest, TheTabKeyGoesFromWheelToWheelAndThePageStands) {
    createAlarm();
    const int y = Stage::area(picker()).y;
    stage().tap(wheel("wheel.hour"));
    stage().settle();
    stage().key("Tab");
    EXPECT_TRUE(elm_object_focus_get(wheel("wheel.minute")));
    stage().key("Left");
    EXPECT_TRUE(elm_object_focus_get(wheel("wheel.hour")));
    stage().settle();
    EXPECT_EQ(Stage::area(picker()).y, y);
}

TEST_F(EditorFocusTest, TheArrowKeysTurnTheWheelAndThePageStands) {
    createAlarm();
    pick(7, 30);
    const int y = Stage::area(picker()).y;
    stage().tap(wheel("wheel.minute"));
    stage().settle();
    for (int i = 0; i < 3; ++i)
        stage().key("Down");
    stage().settle();
    EXPECT_EQ(time(), "7:33");
    EXPECT_EQ(Stage::area(picker()).y, y);
}

} // namespace

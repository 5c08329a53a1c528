// The volume level on the face.

#include "VolumeView.h"

#include <string>

#include "ButtonBelow.h"
#include "support/ScreenTest.h"

using simulator::setVolumeLevel;
using simulator::VolumeView;

namespace {

const std::string THEME = CLOCK_RESOURCE_DIR "/edje/simulator.edj";

class VolumeViewTest : public ScreenTest {
protected:
    /** Width of the bar that stands for a level. */
    int barOf(Evas_Object* layout, int level) {
        setVolumeLevel(layout, level);
        stage().settle();
        Area bar;
        edje_object_part_geometry_get(elm_layout_edje_get(layout), "volume.level", &bar.x, &bar.y,
                                      &bar.width, &bar.height);
        return bar.width;
    }
    Evas_Object* layoutOf(const char* group) {
        Evas_Object* layout = elm_layout_add(stage().window());
        EXPECT_TRUE(elm_layout_file_set(layout, THEME.c_str(), group));
        evas_object_resize(layout, 360, 360);
        evas_object_show(layout);
        return layout;
    }
};

} // namespace

TEST_F(VolumeViewTest, aLevelShowsForAMoment) {
    VolumeView view(stage().window(), THEME);
    EXPECT_FALSE(stage().shows("9"));
    view.show(9);
    Stage::advance(0.5);
    const auto number = stage().findText("9");
    ASSERT_TRUE(number);
    EXPECT_TRUE(number->area.insideCircle());
    Stage::advance(2);
    EXPECT_FALSE(stage().shows("9"));
}

TEST_F(VolumeViewTest, eachStepShowsForAMomentOfItsOwn) {
    VolumeView view(stage().window(), THEME);
    view.show(9);
    Stage::advance(1.2);
    view.show(10);
    Stage::advance(1.2);
    EXPECT_TRUE(stage().shows("10"));
    EXPECT_FALSE(stage().shows("9"));
}

TEST_F(VolumeViewTest, theBarGrowsWithTheLevel) {
    for (const char* group : {"simulator/volume", "simulator/quickpanel"}) {
        Evas_Object* layout = layoutOf(group);
        const int full = barOf(layout, 15);
        EXPECT_GT(full, 100) << group;
        EXPECT_NEAR(barOf(layout, 5), full / 3.0, 2) << group;
        EXPECT_LE(barOf(layout, 0), 1) << group;
        evas_object_del(layout);
    }
}

TEST_F(VolumeViewTest, theBarGrowsOnAMirroredFaceToo) {
    elm_config_mirrored_set(EINA_TRUE);
    Evas_Object* layout = layoutOf("simulator/volume");
    const int full = barOf(layout, 15);
    EXPECT_GT(full, 100);
    EXPECT_NEAR(barOf(layout, 5), full / 3.0, 2);
    takeStageDown();
    elm_config_mirrored_set(EINA_FALSE);
}

TEST_F(VolumeViewTest, itLetsInputThrough) {
    VolumeView view(stage().window(), THEME);
    const ButtonBelow button(stage().window());
    view.show(3);
    Stage::advance(0.5);
    stage().tap(180, 64);
    EXPECT_EQ(button.clicks(), 1);
}

TEST_F(VolumeViewTest, aViewThatGoesWhileItShowsLeavesNothingBehind) {
    {
        VolumeView view(stage().window(), THEME);
        view.show(3);
    }
    Stage::advance(3);
    EXPECT_FALSE(stage().shows("3"));
}

TEST_F(VolumeViewTest, aThemeWithoutAVolumeIsLogged) {
    const VolumeView view(stage().window(), "/nowhere.edj");
    expectLog("'/nowhere.edj' has no volume");
}

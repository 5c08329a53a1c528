// A title that is wider than its place is read to the end, and then stands again.

#include <optional>
#include <string>

#include <Elementary.h>
#include <gtest/gtest.h>

#include "support/ScreenTest.h"

namespace {

constexpr const char* LONG_TITLE = "Kraftfahrzeughaftpflicht";

class TitleSlideTest : public ScreenTest {
protected:
    void show(const char* title, bool toTheLeft = false) {
        elm_config_mirrored_set(toTheLeft);
        Evas_Object* pages = stage().naviframe().getEvasObj();
        page = elm_naviframe_item_push(pages, nullptr, nullptr, nullptr,
                                       elm_layout_add(stage().window()), "basic");
        elm_object_item_part_text_set(page, "elm.text.title", title);
        Stage::advance(0.4);
    }
    void TearDown() override {
        takeStageDown();
        elm_config_mirrored_set(EINA_FALSE);
        ScreenTest::TearDown();
    }
    /** Where the title's letters begin and end, cut or not. */
    Area title() {
        const Area none;
        for (const FoundText& found : stage().texts())
            if (found.area.y < 40)
                return Stage::area(found.object);
        return none;
    }
    static int end(const Area& area) { return area.x + area.width; }

    static constexpr int FROM = 115;
    static constexpr int TO = 245;
    Elm_Object_Item* page = nullptr;
};

TEST_F(TitleSlideTest, ALongTitleIsReadToItsEndAndStandsAgain) {
    show(LONG_TITLE);
    const Area rest = title();
    EXPECT_GE(rest.x, FROM);
    EXPECT_LE(end(rest), TO + 1);
    Stage::advance(1.2);
    const Area moving = title();
    EXPECT_GT(moving.width, TO - FROM);
    EXPECT_LT(moving.x, FROM + 1);
    Stage::advance(1.6);
    EXPECT_NEAR(end(title()), TO, 2);
    EXPECT_LT(title().x, FROM);
    Stage::advance(1.5);
    EXPECT_EQ(title().x, rest.x);
    EXPECT_EQ(title().width, rest.width);
    const int frames = stage().renderedFrames();
    Stage::advance(30);
    EXPECT_EQ(stage().renderedFrames(), frames) << "it moves by itself";
}

TEST_F(TitleSlideTest, ATouchLetsItSlideOnceMore) {
    show(LONG_TITLE);
    Stage::advance(6);
    const Area rest = title();
    stage().tap(180, 22);
    Stage::advance(2.7);
    EXPECT_NEAR(end(title()), TO, 2);
    Stage::advance(2);
    EXPECT_EQ(title().x, rest.x);
}

TEST_F(TitleSlideTest, AMirroredTitleSlidesTheOtherWay) {
    show(LONG_TITLE, true);
    Stage::advance(2.9);
    EXPECT_NEAR(title().x, FROM, 2);
    EXPECT_GT(end(title()), TO);
}

TEST_F(TitleSlideTest, AShortTitleDoesNotMove) {
    show("Alarm");
    const Area rest = title();
    EXPECT_NEAR(rest.x + end(rest), 2 * 180, 2);
    const int frames = stage().renderedFrames();
    Stage::advance(10);
    EXPECT_EQ(stage().renderedFrames(), frames);
    EXPECT_EQ(title().x, rest.x);
}

TEST_F(TitleSlideTest, APageThatGoesLeavesNoTimerBehind) {
    show(LONG_TITLE);
    elm_object_item_del(page);
    Stage::advance(3);
    show(LONG_TITLE);
    Stage::advance(1.2);
    takeStageDown();
}

} // namespace

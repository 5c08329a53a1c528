// A row that has no room for its words shows them to the end while it rests in the middle.

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

#include <Elementary.h>
#include <gtest/gtest.h>

#include "support/ScreenTest.h"

namespace {

constexpr const char* LONG_NAME = "Sunrise over the Carpathians, recorded in June & <b>July</b>";

/** Every other row is long. */
char* rowText(void* data, Evas_Object*, const char* part) {
    const auto number = reinterpret_cast<std::intptr_t>(data);
    if (std::string(part) == "elm.text.main.left.top")
        return strdup("Alarm tone");
    return strdup(number % 2 == 0 ? LONG_NAME : "Bells");
}

class RowSlideTest : public ScreenTest, public testing::WithParamInterface<const char*> {
protected:
    static constexpr int ROWS = 12;

    void TearDown() override {
        takeStageDown();
        elm_config_mirrored_set(EINA_FALSE);
        elm_config_transition_duration_factor_set(1);
        ScreenTest::TearDown();
    }
    void show() {
        list = elm_genlist_add(stage().window());
        elm_genlist_mode_set(list, ELM_LIST_COMPRESS);
        elm_genlist_homogeneous_set(list, EINA_TRUE);
        Elm_Genlist_Item_Class* rowClass = elm_genlist_item_class_new();
        rowClass->item_style = GetParam();
        rowClass->func.text_get = rowText;
        for (std::intptr_t row = 0; row < ROWS; ++row)
            elm_genlist_item_append(list, rowClass, reinterpret_cast<void*>(row), nullptr,
                                    ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
        elm_genlist_item_class_free(rowClass);
        evas_object_resize(list, Stage::SIZE, Stage::SIZE);
        evas_object_show(list);
        Stage::advance(0.4);
    }
    void centre(int row) {
        const int height = std::string(GetParam()) == "1line" ? 72 : 88;
        elm_scroller_region_show(list, 0, row * height + (height - Stage::SIZE) / 2, Stage::SIZE,
                                 Stage::SIZE);
        Stage::advance(0.3);
    }
    /** Where the words nearest to the middle begin and end, cut or not. */
    Area words() {
        Area nearest{0, -1000, 0, 0};
        for (const FoundText& found : stage().texts()) {
            const Area area = Stage::area(found.object);
            if (found.text != "Alarm tone" &&
                std::abs(area.middle().y - 180) < std::abs(nearest.middle().y - 180))
                nearest = area;
        }
        return nearest;
    }
    static int end(const Area& area) { return area.x + area.width; }

    Evas_Object* list = nullptr;
};

TEST_P(RowSlideTest, LongWordsAreReadToTheirEndAndStandAgain) {
    show();
    centre(6);
    const Area rest = words();
    EXPECT_LE(end(rest), 316);
    Stage::advance(2.5);
    const Area read = words();
    EXPECT_GT(read.width, rest.width);
    EXPECT_LT(read.x, rest.x);
    EXPECT_LE(end(read), 316);
    Stage::advance(2);
    EXPECT_EQ(words().x, rest.x);
    EXPECT_EQ(words().width, rest.width);
    const int frames = stage().renderedFrames();
    Stage::advance(20);
    EXPECT_EQ(stage().renderedFrames(), frames) << "it moves by itself";
}

TEST_P(RowSlideTest, AListThatHasNeverMovedShowsItToo) {
    show();
    const auto widest = [this] {
        int width = 0;
        for (const FoundText& found : stage().texts())
            width = std::max(width, Stage::area(found.object).width);
        return width;
    };
    const int rest = widest();
    Stage::advance(2.5);
    EXPECT_GT(widest(), rest);
}

TEST_P(RowSlideTest, ScrollingEndsIt) {
    show();
    centre(6);
    const Area rest = words();
    Stage::advance(2);
    EXPECT_GT(words().width, rest.width);
    stage().drag(180, 200, 0, -30);
    EXPECT_EQ(words().width, rest.width);
}

TEST_P(RowSlideTest, ShortWordsDoNotMove) {
    show();
    centre(7);
    stage().settle();
    const Area rest = words();
    const int frames = stage().renderedFrames();
    Stage::advance(10);
    EXPECT_EQ(stage().renderedFrames(), frames);
    EXPECT_EQ(words().x, rest.x);
}

TEST_P(RowSlideTest, MirroredWordsSlideTheOtherWay) {
    elm_config_mirrored_set(EINA_TRUE);
    show();
    centre(6);
    const Area rest = words();
    Stage::advance(2.5);
    EXPECT_GT(words().width, rest.width);
    EXPECT_GT(end(words()), end(rest));
    EXPECT_GE(words().x, 44);
}

TEST_P(RowSlideTest, WithoutMotionTheEndIsShownForAWhile) {
    elm_config_transition_duration_factor_set(1e-6);
    show();
    centre(6);
    const Area rest = words();
    Stage::advance(1.2);
    EXPECT_LT(words().x, rest.x);
    EXPECT_LE(end(words()), 316);
    Stage::advance(1.5);
    EXPECT_EQ(words().x, rest.x);
}

TEST_P(RowSlideTest, AListThatGoesLeavesNoTimerBehind) {
    show();
    centre(6);
    evas_object_del(list);
    Stage::advance(3);
    show();
    centre(6);
    Stage::advance(1.6);
    takeStageDown();
}

INSTANTIATE_TEST_SUITE_P(Styles, RowSlideTest, testing::Values("1line", "2line.top"),
                         [](const auto& style) { return std::string(style.param).substr(0, 5); });

} // namespace

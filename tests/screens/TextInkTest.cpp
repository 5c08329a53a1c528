// What is wrong with the pixels of texts is found.

#include <string>
#include <vector>

#include <Elementary.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "support/ScreenTest.h"
#include "support/TextInk.h"

using testing::ElementsAre;
using testing::IsEmpty;
using testing::StartsWith;

namespace {

class TextInkTest : public ScreenTest {
protected:
    void TearDown() override {
        takeStageDown();
        for (Evas_Textblock_Style* style : _styles)
            evas_textblock_style_free(style);
        ScreenTest::TearDown();
    }
    Evas_Object* write(const char* text, int x, int y) {
        Evas_Object* object = evas_object_text_add(stage().canvas());
        evas_object_text_font_set(object, "Roboto", 24);
        evas_object_text_text_set(object, text);
        return show(object, x, y);
    }
    Evas_Object* writeBlock(const std::string& style, const char* text, int width, int height) {
        Evas_Object* object = evas_object_textblock_add(stage().canvas());
        _styles.push_back(evas_textblock_style_new());
        evas_textblock_style_set(_styles.back(),
                                 ("DEFAULT='font=Roboto color=#FFFFFF " + style + "'").c_str());
        evas_object_textblock_style_set(object, _styles.back());
        evas_object_resize(object, width, height);
        evas_object_textblock_text_markup_set(object, text);
        return show(object, 60, 210);
    }
    /** Leaves only some lines of pixels of an object. */
    void clip(Evas_Object* object, int from, int to) {
        Evas_Object* clip = evas_object_rectangle_add(stage().canvas());
        evas_object_move(clip, 0, from);
        evas_object_resize(clip, Stage::SIZE, to - from);
        evas_object_show(clip);
        evas_object_clip_set(object, clip);
    }
    std::vector<std::string> faults() { return inkFaultsOf(stage().texts()); }
    std::vector<FoundText> texts() { return stage().texts(); }

private:
    Evas_Object* show(Evas_Object* object, int x, int y) {
        evas_object_color_set(object, 255, 255, 255, 255);
        evas_object_layer_set(object, EVAS_LAYER_MAX);
        evas_object_move(object, x, y);
        evas_object_show(object);
        stage().settle();
        return object;
    }
    std::vector<Evas_Textblock_Style*> _styles;
};

TEST_F(TextInkTest, TextsThatStandFreelyAreRight) {
    write("Ägypten", 80, 120);
    write("हिंदी", 80, 160);
    writeBlock("font_size=20 wrap=word", "ज़िंदगी हैं<br/>إلغاء ج", 200, 80);
    EXPECT_THAT(faults(), IsEmpty());
    for (const TextInk& ink : textInkOf(texts()))
        EXPECT_GT(ink.pixels.size(), 100U) << ink.text;
}

TEST_F(TextInkTest, MarksAboveAndBelowLettersMustNotBeCut) {
    int top = 160;
    Evas_Object* above = write("Ä", 80, top);
    clip(above, top + 8, 300);
    EXPECT_THAT(faults(), ElementsAre(StartsWith("Ä loses ")));
    evas_object_del(above);
    Evas_Object* below = write("ج", 80, top);
    clip(below, 0, top + 22);
    EXPECT_THAT(faults(), ElementsAre(StartsWith("ج loses ")));
}

TEST_F(TextInkTest, TextsOverEachOtherAreFound) {
    write("Tomorrow", 80, 160);
    Evas_Object* other = write("Tomorrow", 84, 168);
    EXPECT_THAT(faults(), ElementsAre("Tomorrow overlaps Tomorrow"));
    evas_object_move(other, 80, 200);
    EXPECT_THAT(faults(), IsEmpty());
}

TEST_F(TextInkTest, DotsAtTheEndAreFound) {
    const char* text = "Petropavlovsk-Kamchatsky";
    writeBlock("font_size=22 wrap=none ellipsis=1.0", text, 120, 30);
    EXPECT_TRUE(endsInDots(texts().front()));
    takeStageDown();
    writeBlock("font_size=22 wrap=mixed ellipsis=1.0", text, 120, 30);
    EXPECT_TRUE(endsInDots(texts().front()));
    takeStageDown();
    writeBlock("font_size=22 wrap=none ellipsis=1.0", text, 300, 30);
    EXPECT_FALSE(endsInDots(texts().front()));
    takeStageDown();
    writeBlock("font_size=22 wrap=mixed ellipsis=1.0", text, 150, 90);
    EXPECT_FALSE(endsInDots(texts().front()));
}

} // namespace

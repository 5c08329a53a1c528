// Rows begin at the side from which the face is read, whichever way their own letters run.

#include <cstring>
#include <string>

#include <gtest/gtest.h>

#include "support/FaceInk.h"
#include "support/ScreenTest.h"

namespace {

constexpr const char* LATIN = "Alofi, نيوي";
constexpr const char* ARABIC = "باغو باغو";

class RowDirectionTest : public ScreenTest {
protected:
    void TearDown() override {
        takeStageDown();
        elm_config_mirrored_set(EINA_FALSE);
        ScreenTest::TearDown();
    }
    /** Where the first line of a row with a text is drawn. */
    InkArea lineOf(const char* text) {
        Evas_Object* list = elm_genlist_add(stage().window());
        evas_object_geometry_set(list, 0, 88, Stage::SIZE, 272);
        evas_object_show(list);
        Elm_Genlist_Item_Class* rows = elm_genlist_item_class_new();
        rows->item_style = "2line.top";
        rows->func.text_get = [](void* data, Evas_Object*, const char* part) -> char* {
            const bool isMain = std::strcmp(part, "elm.text.main.left.top") == 0;
            return isMain ? strdup(static_cast<const char*>(data)) : nullptr;
        };
        elm_genlist_item_append(list, rows, text, nullptr, ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
        elm_genlist_item_class_free(rows);
        stage().settle();
        for (const Ink& ink : inkOf(stage().canvas()))
            if (ink.isText && !ink.what.empty())
                return ink.area;
        ADD_FAILURE() << text << " is not drawn";
        return {};
    }
};

TEST_F(RowDirectionTest, LatinLettersBeginAtTheRightWhereOneReadsFromThere) {
    elm_config_mirrored_set(EINA_TRUE);
    const InkArea line = lineOf(LATIN);
    EXPECT_GT(line.x + line.width, 305);
    EXPECT_GT(line.x, 180);
}

TEST_F(RowDirectionTest, ArabicLettersDoSoToo) {
    elm_config_mirrored_set(EINA_TRUE);
    const InkArea line = lineOf(ARABIC);
    EXPECT_GT(line.x + line.width, 305);
    EXPECT_GT(line.x, 180);
}

TEST_F(RowDirectionTest, LatinLettersBeginAtTheLeftElsewhere) {
    const InkArea line = lineOf("Alofi, Niue");
    EXPECT_LT(line.x, 55);
}

} // namespace

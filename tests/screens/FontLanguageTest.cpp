// Languages that share characters draw them in their own forms, also while a screen is open.

#include <algorithm>
#include <climits>
#include <optional>
#include <string>
#include <vector>

#include <Elementary.h>
#include <gtest/gtest.h>

#include "support/LiveLanguage.h"
#include "support/ScreenTest.h"
#include "support/TextInk.h"

namespace {

constexpr const char* CHINESE = "WenQuanYi Micro Hei";
constexpr const char* JAPANESE = "IPAexGothic";
/** Their forms differ between the languages. */
constexpr const char* SHARED = "直骨";
constexpr const char* HANGUL = "알람";

struct Look {
    const char* language;
    const char* text;
    const char* font;
};

void PrintTo(const Look& look, std::ostream* out) {
    *out << look.text << " in " << look.language;
}

const std::vector<Look> LOOKS = {
    {"ja", SHARED, JAPANESE},   {"zh_CN", SHARED, CHINESE},     {"ko", HANGUL, CHINESE},
    {"ja", "アラー", JAPANESE}, {"zh_CN", "闹钟设置", CHINESE},
};

class FontLanguageTest : public ScreenTest, public testing::WithParamInterface<Look> {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        _language.emplace();
    }
    void TearDown() override {
        takeStageDown();
        for (Evas_Textblock_Style* style : _styles)
            evas_textblock_style_free(style);
        ScreenTest::TearDown();
        _language.reset();
    }
    void choose(const std::string& language) {
        _language->choose(language);
        stage().settle();
    }
    Evas_Object* addLine(const char* font) {
        Evas_Object* line = evas_object_text_add(stage().canvas());
        evas_object_text_font_set(line, font, 60);
        evas_object_text_text_set(line, GetParam().text);
        return show(line);
    }
    Evas_Object* addBlock(const std::string& font) {
        Evas_Object* block = evas_object_textblock_add(stage().canvas());
        _styles.push_back(evas_textblock_style_new());
        evas_textblock_style_set(
            _styles.back(),
            ("DEFAULT='font=" + font + " font_size=60 color=#FFFFFF'br='\n'").c_str());
        evas_object_textblock_style_set(block, _styles.back());
        evas_object_resize(block, 340, 120);
        evas_object_textblock_text_markup_set(block, GetParam().text);
        return show(block);
    }
    /** What is drawn, wherever it lies. */
    std::vector<std::pair<int, int>> shape(Evas_Object* object) {
        std::vector<std::pair<int, int>> pixels;
        int left = INT_MAX;
        int top = INT_MAX;
        for (const FoundText& found : stage().texts()) {
            if (found.object != object)
                continue;
            const TextInk ink = textInkOf({found}).front();
            for (const Spot& pixel : ink.pixels) {
                pixels.emplace_back(pixel.x, pixel.y);
                left = std::min(left, pixel.x);
                top = std::min(top, pixel.y);
            }
        }
        for (auto& [x, y] : pixels) {
            x -= left;
            y -= top;
        }
        std::ranges::sort(pixels);
        EXPECT_GT(pixels.size(), 100U);
        return pixels;
    }

private:
    Evas_Object* show(Evas_Object* object) {
        evas_object_color_set(object, 255, 255, 255, 255);
        evas_object_move(object, 10, 150);
        evas_object_show(object);
        stage().settle();
        return object;
    }
    std::optional<LiveLanguage> _language;
    std::vector<Evas_Textblock_Style*> _styles;
};

TEST_P(FontLanguageTest, ALineIsDrawnInTheFormsOfTheLanguage) {
    choose(GetParam().language);
    EXPECT_EQ(shape(addLine("Roboto")), shape(addLine(GetParam().font)))
        << "install what scripts/packages.txt names";
}

TEST_P(FontLanguageTest, ABlockIsDrawnInTheFormsOfTheLanguage) {
    choose(GetParam().language);
    EXPECT_EQ(shape(addBlock("Roboto")), shape(addBlock(GetParam().font)));
}

TEST_P(FontLanguageTest, TextsThatStandAlreadyFollow) {
    choose(std::string(GetParam().language) == "ja" ? "zh_CN" : "ja");
    Evas_Object* line = addLine("Roboto:style=Medium");
    Evas_Object* block = addBlock("Roboto");
    choose("en");
    choose(GetParam().language);
    EXPECT_EQ(shape(line), shape(addLine(GetParam().font)));
    EXPECT_EQ(shape(block), shape(addBlock(GetParam().font)));
}

INSTANTIATE_TEST_SUITE_P(Languages, FontLanguageTest, testing::ValuesIn(LOOKS));

class FontFormsTest : public FontLanguageTest {};

TEST_P(FontFormsTest, TheFormsDiffer) {
    EXPECT_NE(shape(addLine(JAPANESE)), shape(addLine(CHINESE)));
}

INSTANTIATE_TEST_SUITE_P(Languages, FontFormsTest, testing::Values(LOOKS.front()));

class WidgetFontTest : public FontLanguageTest {};

TEST_P(WidgetFontTest, WhatTheThemeWritesFollows) {
    choose("zh_CN");
    Evas_Object* button = elm_button_add(stage().window());
    elm_object_text_set(button, SHARED);
    evas_object_geometry_set(button, 60, 100, 240, 60);
    evas_object_show(button);
    Evas_Object* label = elm_label_add(stage().window());
    elm_object_text_set(label, SHARED);
    evas_object_geometry_set(label, 60, 200, 240, 60);
    evas_object_show(label);
    stage().settle();
    const auto shapes = [this] {
        std::vector<std::vector<std::pair<int, int>>> all;
        for (const FoundText& found : stage().texts())
            all.push_back(shape(found.object));
        return all;
    };
    const auto chinese = shapes();
    ASSERT_EQ(chinese.size(), 2U);
    choose("ja");
    const auto japanese = shapes();
    EXPECT_NE(japanese.at(0), chinese.at(0));
    EXPECT_NE(japanese.at(1), chinese.at(1));
    choose("zh_CN");
    EXPECT_EQ(shapes(), chinese);
}

INSTANTIATE_TEST_SUITE_P(Languages, WidgetFontTest, testing::Values(LOOKS.front()));

} // namespace

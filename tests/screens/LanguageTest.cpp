// The screens in every language that the clock has a catalogue for.

#include <algorithm>
#include <array>
#include <cstdint>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <memory>
#include <optional>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include <Ecore_Evas.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <clock/ClockText.h>

#include "screens/CityPickerFixture.h"
#include "screens/EditorFixture.h"
#include "screens/TestCatalogue.h"

namespace fs = std::filesystem;

using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

namespace {

constexpr const char* HOURS_KEY = "db/menu_widget/regionformat_time1224";

std::vector<std::string> languages() {
    std::vector<std::string> names;
    for (const auto& file : fs::directory_iterator(CLOCK_SOURCE_DIR "/po"))
        if (file.path().extension() == ".po")
            names.push_back(file.path().stem());
    std::sort(names.begin(), names.end());
    return names;
}

struct FontOf {
    const char* name = nullptr;
    int size = 0;
};

FontOf fontOf(const Evas_Object* text) {
    FontOf font;
    evas_object_text_font_get(text, &font.name, &font.size);
    return font;
}

/** The width of a text that has all the room it wants. */
int fullWidth(const FoundText& found) {
    const auto font = fontOf(found.object);
    Evas_Object* const copy = evas_object_text_add(evas_object_evas_get(found.object));
    evas_object_text_font_set(copy, font.name, font.size);
    evas_object_text_text_set(copy, found.text.c_str());
    const int width = Stage::area(copy).width;
    evas_object_del(copy);
    return width;
}

bool isCut(const FoundText& found) {
    return std::string_view(evas_object_type_get(found.object)) == "text" &&
           fullWidth(found) > Stage::area(found.object).width;
}

/** What is wrong with the texts that can be seen. */
std::vector<std::string> faultsOf(const std::vector<FoundText>& texts) {
    std::vector<std::string> faults;
    for (const FoundText& found : texts) {
        if (found.text.find("IDS_") != std::string::npos)
            faults.push_back(found.text + " has no translation");
        else if (isCut(found))
            faults.push_back(found.text + " is cut");
    }
    return faults;
}

std::vector<FoundText> without(std::vector<FoundText> texts, const char* widgetType) {
    std::erase_if(texts, [&](const FoundText& found) {
        return std::string_view(elm_object_widget_type_get(found.widget)) == widgetType;
    });
    return texts;
}

/** The editor and what opens over it. */
class EditorLanguageTest : public EditorFixture, public testing::WithParamInterface<std::string> {
protected:
    void speak(const std::string& language) {
        _language = std::make_unique<CatalogueLanguage>(language);
    }
    void TearDown() override {
        EditorFixture::TearDown();
        _language.reset();
    }

    /** The faults of the face at every row of the list. */
    std::set<std::string> faults() {
        std::set<std::string> all;
        for (Elm_Object_Item* row = elm_genlist_first_item_get(genlist()); row;
             row = elm_genlist_item_next_get(row)) {
            stage().showRow(row);
            stage().settle();
            all.merge(faultsNow());
        }
        return all;
    }
    std::set<std::string> faultsNow() {
        const auto found = faultsOf(stage().texts());
        return {found.begin(), found.end()};
    }
    void take(const std::string& name) { stage().screenshot("language-" + GetParam() + name); }

private:
    std::unique_ptr<CatalogueLanguage> _language;
};

TEST_P(EditorLanguageTest, EveryRowIsTranslatedAndFits) {
    speak(GetParam());
    device().setSetting(HOURS_KEY, 1);
    createAlarm();
    take("-editor");
    for (const char* id : {"IDS_COM_BODY_CREATE", "IDS_TPLATFORM_ACBUTTON_CANCEL_ABB",
                           "IDS_TPLATFORM_ACBUTTON_DONE_ABB"})
        EXPECT_TRUE(stage().shows(clockText(id))) << id;
    EXPECT_THAT(faults(), IsEmpty());
    take("-name");
}

TEST_P(EditorLanguageTest, AnAlarmWithADateIsTranslatedAndFits) {
    speak(GetParam());
    auto alarm = storedAlarm(7, 30);
    alarm.repeatWeekly = 0;
    alarm.autoDate = alarm.manualDate = static_cast<std::int32_t>(at("2026-11-19 00:00:00"));
    editAlarm(alarm);
    take("-date");
    EXPECT_TRUE(stage().shows(clockText("IDS_COM_SK_EDIT")));
    EXPECT_THAT(faultsNow(), IsEmpty());
}

TEST_P(EditorLanguageTest, TheQuestionBeforeDiscardingIsTranslatedAndFits) {
    speak(GetParam());
    createAlarm();
    pick(7, 30);
    stage().backKey();
    stage().settle();
    take("-discard");
    EXPECT_TRUE(stage().shows(clockText("IDS_CLD_HEADER_DISCARD_CHANGES_ABB")));
    EXPECT_TRUE(stage().shows(clockText("IDS_CLD_BUTTON_DISCARD_ABB")));
    EXPECT_THAT(faultsNow(), IsEmpty());
}

INSTANTIATE_TEST_SUITE_P(Language, EditorLanguageTest, testing::ValuesIn(languages()),
                         testing::PrintToStringParamName());

class LanguageFaultTest : public EditorFixture {};

TEST_F(LanguageFaultTest, ATextThatIsCutIsFound) {
    const TestCatalogue catalogue(
        {{"IDS_TPLATFORM_ACBUTTON_DONE_ABB", "Completed and done with"},
         {"IDS_COM_BODY_CREATE", "Create another alarm for a certain day"}});
    createAlarm();
    const auto faults = faultsOf(stage().texts());
    EXPECT_THAT(faults, testing::Contains("Completed and done with is cut"));
    EXPECT_THAT(faults, testing::Contains("Create another alarm for a certain day is cut"));
}

TEST_F(LanguageFaultTest, ATextWithoutATranslationIsFound) {
    const TestCatalogue catalogue({{"IDS_TPLATFORM_ACBUTTON_DONE_ABB", "Done"}});
    createAlarm();
    const auto faults = faultsOf(stage().texts());
    EXPECT_THAT(faults, testing::Contains("IDS_COM_BODY_CREATE has no translation"));
    EXPECT_THAT(faults, testing::Each(Not(HasSubstr("Done"))));
}

/** The city picker. */
class CitiesLanguageTest : public CityPickerFixture,
                           public testing::WithParamInterface<std::string> {
protected:
    void TearDown() override {
        CityPickerFixture::TearDown();
        _language.reset();
    }

    void open() {
        _language = std::make_unique<CatalogueLanguage>(GetParam());
        worldOf({"IDS_CITY_DE_BERLIN_BERLIN", "IDS_CITY_JP_TOKYO", "IDS_CITY_IN_NEW_DELHI"});
        openPicker();
    }
    // The names of cities may end in dots.
    std::vector<std::string> faults() { return faultsOf(without(stage().texts(), "Elm_Genlist")); }

private:
    std::unique_ptr<CatalogueLanguage> _language;
};

TEST_P(CitiesLanguageTest, ThePickerIsTranslatedAndFits) {
    open();
    stage().screenshot("language-" + GetParam() + "-cities");
    EXPECT_TRUE(stage().shows(clockText("IDS_WCL_OPT_ADDCITY")));
    EXPECT_TRUE(stage().shows(clockText("IDS_TPLATFORM_ACBUTTON_CANCEL_ABB")));
    EXPECT_TRUE(stage().shows(clockText("IDS_COM_BODY_SEARCH")));
    EXPECT_THAT(faults(), IsEmpty());
}

TEST_P(CitiesLanguageTest, TheWordsThatNothingWasFoundAreTranslatedAndFit) {
    open();
    search("qqxx");
    stage().key("Return");
    stage().settle();
    stage().screenshot("language-" + GetParam() + "-nothing");
    EXPECT_TRUE(stage().shows(clockText("IDS_CLOCK_NPBODY_NO_SEARCH_RESULTS")));
    EXPECT_THAT(faults(), IsEmpty());
}

INSTANTIATE_TEST_SUITE_P(Language, CitiesLanguageTest, testing::ValuesIn(languages()),
                         testing::PrintToStringParamName());

/** Draws characters one by one and looks at their shapes. */
class GlyphTest : public ScreenTest, public testing::WithParamInterface<std::string> {
protected:
    static constexpr int CELL = 30;
    static constexpr int CELLS = Stage::SIZE / CELL;
    using Shape = std::array<std::uint32_t, static_cast<std::size_t>(CELL) * CELL>;

    /** The characters beyond ASCII in a language's texts, without spaces. */
    static std::vector<std::string> characters(const std::string& language) {
        std::ifstream file(CLOCK_SOURCE_DIR "/po/" + language + ".po");
        const std::string text(std::istreambuf_iterator<char>(file), {});
        std::set<std::string> found;
        for (int next = 0, start = 0; start < static_cast<int>(text.size()); start = next) {
            const Eina_Unicode character = eina_unicode_utf8_next_get(text.c_str(), &next);
            const bool isSpace = character == 0xa0 || character == 0x202f;
            if (character > 0x7f && !isSpace)
                found.insert(text.substr(static_cast<std::size_t>(start),
                                         static_cast<std::size_t>(next - start)));
        }
        return {found.begin(), found.end()};
    }

    Shape shapeOf(const std::string& character) { return shapesOf({character}).front(); }

    std::vector<Shape> shapesOf(const std::vector<std::string>& characters) {
        std::vector<Shape> shapes;
        const std::size_t page = static_cast<std::size_t>(CELLS) * CELLS;
        for (std::size_t from = 0; from < characters.size(); from += page) {
            const auto begin = characters.begin() + static_cast<std::ptrdiff_t>(from);
            const auto count = std::min(page, characters.size() - from);
            const auto drawn = drawPage({begin, begin + static_cast<std::ptrdiff_t>(count)});
            shapes.insert(shapes.end(), drawn.begin(), drawn.end());
        }
        return shapes;
    }

private:
    std::vector<Shape> drawPage(const std::vector<std::string>& characters) {
        std::vector<Evas_Object*> objects;
        for (std::size_t i = 0; i < characters.size(); ++i)
            objects.push_back(draw(characters[i], cell(i)));
        Ecore_Evas* const window = ecore_evas_ecore_evas_get(stage().canvas());
        ecore_evas_manual_render(window);
        const auto* pixels =
            static_cast<const std::uint32_t*>(ecore_evas_buffer_pixels_get(window));
        std::vector<Shape> shapes;
        for (std::size_t i = 0; i < characters.size(); ++i)
            shapes.push_back(read(pixels, cell(i)));
        std::for_each(objects.begin(), objects.end(), evas_object_del);
        return shapes;
    }

    static Spot cell(std::size_t index) {
        const int number = static_cast<int>(index);
        return {number % CELLS * CELL, number / CELLS * CELL};
    }

    Evas_Object* draw(const std::string& character, const Spot& corner) {
        Evas_Object* const clip = evas_object_rectangle_add(stage().canvas());
        evas_object_geometry_set(clip, corner.x, corner.y, CELL, CELL);
        evas_object_show(clip);
        Evas_Object* const text = evas_object_text_add(stage().canvas());
        evas_object_text_font_set(text, "Roboto", 16);
        evas_object_text_text_set(text, character.c_str());
        evas_object_color_set(text, 255, 255, 255, 255);
        evas_object_layer_set(text, EVAS_LAYER_MAX);
        // Marks have their ink left of where they stand.
        evas_object_move(text, corner.x + CELL / 3, corner.y + 4);
        evas_object_clip_set(text, clip);
        evas_object_show(text);
        evas_object_event_callback_add(
            text, EVAS_CALLBACK_DEL,
            [](void* data, Evas*, Evas_Object*, void*) {
                evas_object_del(static_cast<Evas_Object*>(data));
            },
            clip);
        return text;
    }

    static Shape read(const std::uint32_t* pixels, const Spot& corner) {
        Shape shape{};
        for (int y = 0; pixels && y < CELL; ++y)
            std::copy_n(pixels + (corner.y + y) * Stage::SIZE + corner.x, CELL,
                        shape.begin() + static_cast<std::ptrdiff_t>(y) * CELL);
        return shape;
    }
};

// A character that no font has.
constexpr const char* NONE = "\xf4\x80\x80\x81";

TEST_P(GlyphTest, SomeFontHasEveryCharacter) {
    const Shape missing = shapeOf(NONE);
    const Shape blank = shapeOf(" ");
    const auto all = characters(GetParam());
    const auto shapes = shapesOf(all);
    std::string without;
    for (std::size_t i = 0; i < all.size(); ++i)
        if (shapes.at(i) == missing || shapes.at(i) == blank)
            without += all[i] + " ";
    EXPECT_EQ(without, "");
}

INSTANTIATE_TEST_SUITE_P(Language, GlyphTest, testing::ValuesIn(languages()),
                         testing::PrintToStringParamName());

} // namespace

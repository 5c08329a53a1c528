// What is typed begins at the side from which the face is read, and the cursor stands where the
// next letter comes.

#include <algorithm>
#include <ostream>
#include <string>
#include <vector>

#include <Elementary.h>
#include <gtest/gtest.h>

#include <device/uxt.h>

#include "AlarmNameItem.h"
#include "screens/RowPage.h"
#include "support/FaceInk.h"
#include "support/LiveLanguage.h"
#include "support/ScreenTest.h"

namespace {

/** Where something begins and ends, in pixels from the left of a field. */
struct Span {
    int left = Stage::SIZE;
    int right = -1;
    void add(int x) {
        left = std::min(left, x);
        right = std::max(right, x);
    }
    bool isSeen() const { return right >= 0; }
};

enum class Side { Left, Right };

struct Typing {
    const char* name;
    bool mirrored;
    const char* text;
    Side side;   ///< Of the field, where the text begins.
    Side cursor; ///< Of the letters, where the next one comes.
};

void PrintTo(const Typing& typing, std::ostream* out) {
    *out << typing.name;
}

const std::vector<Typing> TYPINGS = {
    {"LatinWhereOneReadsFromTheRight", true, "Yoga!", Side::Right, Side::Right},
    {"ArabicWhereOneReadsFromTheRight", true, "يوغا", Side::Right, Side::Left},
    {"BothWhereOneReadsFromTheRight", true, "Yoga يوم", Side::Right, Side::Right},
    {"DigitsWhereOneReadsFromTheRight", true, "730", Side::Right, Side::Right},
    {"LongLatinWhereOneReadsFromTheRight", true, "WWWWWWWWWWWWWWWWWWWW", Side::Right, Side::Right},
    {"LongArabicWhereOneReadsFromTheRight", true, "سسسسس سسسسس سسسسس سس", Side::Right, Side::Left},
    {"NothingWhereOneReadsFromTheRight", true, "", Side::Right, Side::Right},
    {"LatinWhereOneReadsFromTheLeft", false, "Yoga!", Side::Left, Side::Right},
    {"ArabicWhereOneReadsFromTheLeft", false, "يوغا", Side::Left, Side::Left},
    {"LongLatinWhereOneReadsFromTheLeft", false, "WWWWWWWWWWWWWWWWWWWW", Side::Left, Side::Right},
    {"LongArabicWhereOneReadsFromTheLeft", false, "سسسسس سسسسس سسسسس سس", Side::Left, Side::Left},
    {"NothingWhereOneReadsFromTheLeft", false, "", Side::Left, Side::Left},
};

/** A field as it is drawn. */
class FieldDirectionTest : public ScreenTest {
protected:
    /** As near to the side as soft edges of letters let them be. */
    static constexpr int NEAR = 6;

    void TearDown() override {
        takeStageDown();
        elm_config_mirrored_set(EINA_FALSE);
        ScreenTest::TearDown();
    }
    void look(Evas_Object* entry) {
        // The toolkit draws its pointer over a field.
        stage().moveTo(180, 20);
        stage().settle();
        letters = {};
        cursor = {};
        const Area area = Stage::area(entry);
        // The line below is in the colour of the cursor.
        constexpr int LINE = 8;
        width = area.width;
        const auto pixels = stage().pixels(area.x, area.y, area.width, area.height - LINE);
        for (std::size_t i = 0; i < pixels.size(); ++i) {
            const int x = static_cast<int>(i) % area.width;
            const int red = static_cast<int>(pixels[i] >> 16U & 0xFF);
            const int blue = static_cast<int>(pixels[i] & 0xFF);
            if (blue > red + 90)
                cursor.add(x);
            else if (red > 160)
                letters.add(x);
        }
    }
    void expectAtSide(const Span& span, Side side) const {
        ASSERT_TRUE(span.isSeen());
        if (side == Side::Right)
            EXPECT_GE(span.right, width - NEAR);
        else
            EXPECT_LE(span.left, NEAR);
    }
    /** Whatever letters the guide has. */
    void expectGuide(Evas_Object* entry, Side side) {
        const int middle = Stage::area(entry).middle().x;
        const auto inks = inkOf(stage().canvas());
        const auto guide =
            std::ranges::find_if(inks, [](const Ink& ink) { return ink.what == "Alarm"; });
        ASSERT_NE(guide, inks.end());
        if (side == Side::Right)
            EXPECT_GT(guide->area.x, middle);
        else
            EXPECT_LT(guide->area.x + guide->area.width, middle);
    }
    void expectCursor(Side side) const {
        ASSERT_TRUE(cursor.isSeen());
        if (!letters.isSeen())
            return expectAtSide(cursor, side);
        if (side == Side::Right)
            EXPECT_GE(cursor.right, letters.right);
        else
            EXPECT_LE(cursor.left, letters.left);
    }

    Span letters;
    Span cursor;
    int width = 0;
};

/** The field of the editor's last row. */
class NameDirectionTest : public FieldDirectionTest, public testing::WithParamInterface<Typing> {
protected:
    void TearDown() override {
        takeStageDown();
        takeErrors();
        FieldDirectionTest::TearDown();
    }
    void showRow() {
        elm_config_mirrored_set(GetParam().mirrored ? EINA_TRUE : EINA_FALSE);
        row = new AlarmNameItem(alarm);
        stage().push(new RowPage(row));
        stage().tap(row->getNameEntryObj());
        stage().settle();
    }

    ClockAlarmDbData alarm{};
    AlarmNameItem* row = nullptr;
};

TEST_P(NameDirectionTest, ANameBeginsWhereOneReadsFrom) {
    showRow();
    stage().type(GetParam().text);
    stage().settle();
    look(row->getNameEntryObj());
    stage().screenshot(std::string("field-") + GetParam().name);
    EXPECT_EQ(letters.isSeen(), *GetParam().text != '\0');
    if (letters.isSeen())
        expectAtSide(letters, GetParam().side);
    else
        expectGuide(row->getNameEntryObj(), GetParam().side);
    expectCursor(GetParam().cursor);
}

TEST_P(NameDirectionTest, AStoredNameDoesSoToo) {
    alarm.name = GetParam().text;
    showRow();
    stage().key("End");
    stage().settle();
    look(row->getNameEntryObj());
    if (letters.isSeen())
        expectAtSide(letters, GetParam().side);
    expectCursor(GetParam().cursor);
}

INSTANTIATE_TEST_SUITE_P(Typing, NameDirectionTest, testing::ValuesIn(TYPINGS),
                         [](const auto& info) { return info.param.name; });

/** The field that searches for a city. */
class SearchDirectionTest : public FieldDirectionTest, public testing::WithParamInterface<Typing> {
protected:
    /** Beside the field's own padding. */
    void showField() {
        Evas_Object* field = uxt_edit_field_layout_add(stage().window(), UXT_EDIT_FIELD_SEARCH);
        evas_object_geometry_set(field, 40, 100, 280, 48);
        evas_object_show(field);
        entry = uxt_edit_field_layout_get_entry(field);
        stage().tap(entry);
        stage().settle();
    }
    void expectTyped() {
        look(entry);
        if (letters.isSeen())
            expectAtSide(letters, GetParam().side);
        expectCursor(GetParam().cursor);
    }

    Evas_Object* entry = nullptr;
};

TEST_P(SearchDirectionTest, ASearchBeginsWhereOneReadsFrom) {
    elm_config_mirrored_set(GetParam().mirrored ? EINA_TRUE : EINA_FALSE);
    showField();
    stage().type(GetParam().text);
    stage().settle();
    expectTyped();
}

TEST_P(SearchDirectionTest, ATypedSearchGoesToTheOtherSideWithTheFace) {
    LiveLanguage language;
    language.choose(GetParam().mirrored ? "en" : "ar");
    showField();
    stage().type(GetParam().text);
    language.choose(GetParam().mirrored ? "ar" : "en");
    stage().settle();
    expectTyped();
    stage().screenshot(std::string("search-field-") + GetParam().name);
}

INSTANTIATE_TEST_SUITE_P(Typing, SearchDirectionTest, testing::ValuesIn(TYPINGS),
                         [](const auto& info) { return info.param.name; });

} // namespace

// Searching, the index, and the rows of the city picker.

#include <array>
#include <cstdlib>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "WorldClockAddCityItem.h"
#include "screens/CityPickerFixture.h"

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Le;

namespace {

constexpr const char* BERLIN = "IDS_CITY_DE_BERLIN_BERLIN";
constexpr const char* KATHMANDU = "IDS_CITY_NP_KATHMANDU";
constexpr const char* SINGAPORE = "IDS_CITY_SG_SINGAPORE";
constexpr const char* BAKER_CITY = "IDS_CITY_US_OREGON_BAKER_CITY";

// The index takes touches along the rim, so far from the edge of the face.
constexpr int RIM = 16;

class CityPickerSearchTest : public CityPickerFixture {
protected:
    /** The first row that is seen as a whole. */
    Elm_Object_Item* firstOnTheFace() {
        for (const Row& row : Stage::rows(genlist()))
            if (row.realized && row.area.y >= Stage::area(genlist()).y)
                return row.item;
        ADD_FAILURE() << "no row is seen";
        return nullptr;
    }
};

TEST_F(CityPickerSearchTest, CitiesStandInTheOrderOfOffsetAndName) {
    openPicker();
    float last = -100;
    for (Elm_Object_Item* item : items()) {
        const float offset =
            WorldClockAddCityViewController::_getGmtOffset(cityOf(item).timezone.c_str());
        EXPECT_GE(offset, last) << cityOf(item).city;
        last = offset;
    }
}

TEST_F(CityPickerSearchTest, WithoutASearchTheIndexHasEachHourFromMinusElevenOn) {
    openPicker();
    const auto labels = hours();
    ASSERT_GT(labels.size(), 20U);
    EXPECT_EQ(labels.front(), "-11");
    EXPECT_THAT(labels, Contains("0"));
    EXPECT_THAT(labels, Contains("5"));
    int last = -12;
    for (const std::string& label : labels) {
        EXPECT_GT(std::stoi(label), last);
        last = std::stoi(label);
    }
}

TEST_F(CityPickerSearchTest, AnHourLeadsToItsFirstCity) {
    openPicker();
    for (const std::string& hour : hours()) {
        Elm_Object_Item* row = rowOf(firstCityOf(hour));
        EXPECT_EQ(static_cast<int>(
                      WorldClockAddCityViewController::_getGmtOffset(cityOf(row).timezone.c_str())),
                  std::stoi(hour));
        if (Elm_Object_Item* above = elm_genlist_item_prev_get(row)) {
            EXPECT_LT(static_cast<int>(WorldClockAddCityViewController::_getGmtOffset(
                          cityOf(above).timezone.c_str())),
                      std::stoi(hour));
        }
    }
}

TEST_F(CityPickerSearchTest, TypingNarrowsTheListWithEachKey) {
    openPicker();
    search("kathm");
    EXPECT_THAT(cities(), ElementsAre(KATHMANDU));
    EXPECT_TRUE(stage().shows("Kathmandu, Nepal"));
    EXPECT_FALSE(showsFastScroll());
    eraseSearch();
    EXPECT_GT(items().size(), 3500U);
    EXPECT_TRUE(showsFastScroll());
}

TEST_F(CityPickerSearchTest, TheSearchTextIsColouredInTheRow) {
    openPicker();
    search("kathm");
    EXPECT_THAT(markupOf(items().at(0), "elm.text.main.left.top"),
                testing::MatchesRegex("<color=#[0-9a-f]{8}>Kathm</color>andu, Nepal"));
    EXPECT_EQ(markupOf(items().at(0), "elm.text.sub.left.bottom"), "GMT+05:45");
    EXPECT_EQ(markupOf(items().at(0), "elm.text.other"), "(null)");
}

TEST_F(CityPickerSearchTest, ACityThatIsItsOwnCountryStandsAlone) {
    worldOf({SINGAPORE});
    openPicker();
    EXPECT_TRUE(stage().shows("Singapore"));
}

TEST_F(CityPickerSearchTest, TheCountryIsSearchedToo) {
    openPicker();
    search("nepal");
    EXPECT_THAT(cities(), Contains(KATHMANDU));
}

TEST_F(CityPickerSearchTest, UpToTenResultsAreListedWithoutTheIndex) {
    openPicker();
    search("berlin");
    EXPECT_THAT(items().size(), testing::AllOf(testing::Ge(2U), Le(10U)));
    EXPECT_FALSE(showsFastScroll());
    EXPECT_TRUE(stage().canBeSeen(genlist()));
}

TEST_F(CityPickerSearchTest, NothingFoundReplacesTheListAndTheNextResultBringsItBack) {
    openPicker();
    search("qqxx");
    EXPECT_EQ(genlist(), nullptr);
    EXPECT_TRUE(stage().shows("No results found."));
    EXPECT_FALSE(showsFastScroll());
    eraseSearch();
    ASSERT_NE(genlist(), nullptr);
    EXPECT_FALSE(stage().shows("No results found."));
    EXPECT_GT(items().size(), 3500U);
}

TEST_F(CityPickerSearchTest, StillNothingFoundStaysReadable) {
    openPicker();
    search("qqxx");
    search("x");
    EXPECT_EQ(genlist(), nullptr);
    EXPECT_TRUE(stage().shows("No results found."));
}

TEST_F(CityPickerSearchTest, TheTwentyFirstCharacterIsRefusedWithAToast) {
    openPicker();
    search("abcdefghijklmnopqrst");
    EXPECT_THAT(device().toasts(), IsEmpty());
    search("u");
    EXPECT_THAT(device().toasts(), ElementsAre("You can't enter more than 20 characters."));
    EXPECT_STREQ(elm_entry_entry_get(entry()), "abcdefghijklmnopqrst");
}

TEST_F(CityPickerSearchTest, ALongerTextThatGotInLeavesTheListAlone) {
    openPicker();
    search("berlin");
    const auto before = cities();
    elm_entry_entry_set(entry(), "abcdefghijklmnopqrstuvw");
    fill();
    expectLog("length is exceeded max");
    while (!takeErrors().empty())
        ;
    EXPECT_EQ(cities(), before);
}

TEST_F(CityPickerSearchTest, TextThatIsSetWhileTheFieldIsNotFocusedIsIgnored) {
    openPicker();
    search("berlin");
    elm_object_focus_set(entry(), EINA_FALSE);
    const auto before = cities();
    elm_entry_entry_set(entry(), "kathm");
    fill();
    expectLog("do not work changed callback :: this changed signal is come from "
              "locatio button "
              "clicked event");
    EXPECT_EQ(cities(), before);
}

TEST_F(CityPickerSearchTest, MarkupInTheSearchTextIsOnlyText) {
    openPicker();
    search("<b>&");
    EXPECT_EQ(genlist(), nullptr);
}

TEST_F(CityPickerSearchTest, ReturnTakesTheFocusFromTheField) {
    openPicker();
    search("berlin");
    EXPECT_TRUE(elm_object_focus_get(entry()));
    stage().key("Return");
    stage().settle();
    EXPECT_FALSE(elm_object_focus_get(entry()));
    EXPECT_THAT(cities(), Contains(BERLIN));
}

TEST_F(CityPickerSearchTest, ATapOnTheIndexScrollsToTheHour) {
    openPicker();
    const Area area = Stage::area(index());
    stage().tap(area.x + area.width - RIM, area.y + area.height / 2);
    stage().settle();
    ASSERT_TRUE(isOpen());
    const Elm_Object_Item* first = firstOnTheFace();
    EXPECT_NE(first, items().front());
    EXPECT_NE(elm_index_item_find(index(), first), nullptr) << "not the first city of an hour";
    EXPECT_EQ(elm_index_selected_item_get(index(), 0), nullptr);
}

TEST_F(CityPickerSearchTest, TheIndexWorksWhileRowsAreStillComing) {
    openPicker();
    stage().tap(entry());
    stage().type("a");
    Stage::frames(1);
    const Area area = Stage::area(index());
    const unsigned before = elm_genlist_items_count(genlist());
    stage().tap(area.x + area.width - RIM, area.y + area.height / 2);
    const Elm_Object_Item* first = firstOnTheFace();
    EXPECT_NE(first, items().front());
    EXPECT_NE(elm_index_item_find(index(), first), nullptr) << "not the first city of an hour";
    fill();
    EXPECT_GT(items().size(), before) << "all rows were there already";
}

TEST_F(CityPickerSearchTest, ManySearchesOneAfterTheOtherEndInTheLast) {
    openPicker();
    stage().tap(entry());
    for (const char* text : {"a", "n", "d"})
        stage().type(text);
    fill();
    const auto found = cities();
    EXPECT_FALSE(found.empty());
    for (Elm_Object_Item* item : items())
        EXPECT_TRUE(WorldClockAddCityViewController::_isIncludeSearchText(cityOf(item), "and"))
            << cityOf(item).city;
}

TEST_F(CityPickerSearchTest, RowsWithoutACitySayWhy) {
    openPicker();
    WorldClockAddCityItem item;
    Elm_Genlist_Item_Class* itemClass = item.getItemClassNew();
    EXPECT_STREQ(itemClass->item_style, "2line.top");
    EXPECT_EQ(itemClass->func.content_get, nullptr);
    EXPECT_EQ(itemClass->func.del, nullptr);
    EXPECT_EQ(itemClass->func.text_get(nullptr, genlist(), "elm.text.main.left.top"), nullptr);
    elm_genlist_item_class_free(itemClass);
    expectLog("passed user data is nullptr");
}

TEST_F(CityPickerSearchTest, HighlightingWithoutATextSaysSo) {
    EXPECT_EQ(WorldClockAddCityItem::_addTextHighLight(nullptr, "a"), nullptr);
    expectLog("input text is nullptr");
}

TEST_F(CityPickerSearchTest, AnEmptySearchTextColoursNothingAtTheStart) {
    openPicker();
    EXPECT_THAT(markupOf(rowOf(BAKER_CITY), "elm.text.main.left.top"),
                testing::MatchesRegex("<color=#[0-9a-f]{8}></color>Baker City.*"));
}

} // namespace

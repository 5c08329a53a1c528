// The city picker as a page: what is on it, how it is left, and its log lines.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <clock/ClockEventListener.h>
#include <device/i18n.h>

#include "screens/CityPickerFixture.h"
#include "screens/TestCatalogue.h"

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;

namespace {

class CityPickerPageTest : public CityPickerFixture {};

TEST_F(CityPickerPageTest, ShowsItsTitleSearchFieldAndCities) {
    openPicker();
    EXPECT_TRUE(stage().shows("Add city"));
    EXPECT_TRUE(stage().canBeSeen(entry()));
    EXPECT_TRUE(stage().canBeSeen(locationButton()));
    EXPECT_GT(items().size(), 3500U);
    EXPECT_TRUE(showsFastScroll());
}

TEST_F(CityPickerPageTest, TheGuideIsTheMagnifierAndAWord) {
    openPicker();
    EXPECT_STREQ(elm_object_part_text_get(entry(), "elm.guide"), "\xEF\xA2\x97 Search");
}

TEST_F(CityPickerPageTest, TheBackButtonLeavesWithoutChoosing) {
    openPicker();
    const auto replies = device().callsTo("app_control_reply_to_launch_request");
    stage().tapText("Cancel");
    stage().settle();
    EXPECT_FALSE(isOpen());
    EXPECT_THAT(returned, IsEmpty());
    EXPECT_THAT(replies, IsEmpty());
    EXPECT_EQ(stored("IDS_CITY_NP_KATHMANDU").selected, 0);
}

TEST_F(CityPickerPageTest, TheBackKeyLeavesWithoutChoosing) {
    openPicker();
    stage().backKey();
    stage().settle();
    EXPECT_FALSE(isOpen());
    EXPECT_THAT(returned, IsEmpty());
}

TEST_F(CityPickerPageTest, AsksForTheLocaleThenTheCollatorThenHaptics) {
    openPicker();
    std::vector<std::string> asked;
    for (const std::string& call : device().calls())
        if (call.starts_with("i18n_ulocale") || call.starts_with("i18n_ucollator_create") ||
            call.starts_with("feedback_initialize"))
            asked.push_back(call.substr(0, call.find('(')));
    ASSERT_GE(asked.size(), 3U);
    asked.resize(3);
    EXPECT_THAT(asked, ElementsAre("i18n_ulocale_get_default", "i18n_ucollator_create",
                                   "feedback_initialize"));
}

TEST_F(CityPickerPageTest, WithoutALocaleItSortsAsInEnglish) {
    device().failOnce("i18n_ulocale_get_default", I18N_ERROR_INTERNAL);
    openPicker();
    EXPECT_THAT(device().callsTo("i18n_ucollator_create"),
                ElementsAre(HasSubstr("\"en_GB.UTF-8\"")));
}

TEST_F(CityPickerPageTest, WithoutACollatorItSaysSoAndStillOrdersByOffset) {
    worldOf(
        {"IDS_CITY_NP_KATHMANDU", "IDS_CITY_DE_BERLIN_BERLIN", "IDS_CITY_US_OREGON_BAKER_CITY"});
    device().failOnce("i18n_ucollator_create", I18N_ERROR_INTERNAL);
    openPicker();
    expectLog("ucollator create failed, do not sort");
    EXPECT_THAT(cities(), ElementsAre("IDS_CITY_US_OREGON_BAKER_CITY", "IDS_CITY_DE_BERLIN_BERLIN",
                                      "IDS_CITY_NP_KATHMANDU"));
}

TEST_F(CityPickerPageTest, LeavingFreesTheCollator) {
    openPicker();
    device().clearCalls();
    stage().backKey();
    stage().settle();
    EXPECT_THAT(device().callsTo("i18n_ucollator_destroy"), SizeIs(1));
}

TEST_F(CityPickerPageTest, WithoutItsThemeItSaysSoAndGoesOn) {
    device().failOnce("app_resource_manager_get");
    openPicker();
    expectLog("path is NULL !!");
    EXPECT_GT(items().size(), 3500U);
}

TEST_F(CityPickerPageTest, WithoutADatabaseItSaysSoAndShowsThatNothingIsThere) {
    loseWorld();
    openPicker();
    expectLog("the city database data/world-clock.db is missing, there are no cities");
    EXPECT_EQ(genlist(), nullptr);
    EXPECT_TRUE(stage().shows("No results found."));
}

TEST_F(CityPickerPageTest, ALanguageChangeRenewsGuideAndTitle) {
    openPicker();
    {
        const TestCatalogue catalogue({{"IDS_COM_BODY_SEARCH", "Suchen"},
                                       {"IDS_WCL_OPT_ADDCITY", "Stadt"},
                                       {"IDS_TPLATFORM_ACBUTTON_CANCEL_ABB", "Abbrechen"}});
        ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
        stage().settle();
        EXPECT_STREQ(elm_object_part_text_get(entry(), "elm.guide"), "\xEF\xA2\x97 Suchen");
        EXPECT_TRUE(stage().shows("Stadt"));
        EXPECT_TRUE(stage().shows("Abbrechen"));
    }
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
}

TEST_F(CityPickerPageTest, AfterALanguageChangeCitiesAreFoundByTheirNewNames) {
    worldOf({"IDS_CITY_NP_KATHMANDU", "IDS_CITY_DE_BERLIN_BERLIN"});
    openPicker();
    // Both have the same locale: only the event tells that names have changed.
    for (const std::string name : {"hauptstadt", "metropole"}) {
        const TestCatalogue catalogue({{"IDS_CITY_DE_BERLIN_BERLIN", name}});
        ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
        search(name.substr(0, 4));
        EXPECT_THAT(cities(), ElementsAre("IDS_CITY_DE_BERLIN_BERLIN"));
        eraseSearch();
    }
}

TEST_F(CityPickerPageTest, OtherEventsChangeNothing) {
    openPicker();
    device().clearCalls();
    const auto before = cities();
    for (const auto event : {ClockEventListener::SETTINGS_CHANGED, ClockEventListener::TIME_CHANGED,
                             ClockEventListener::PAUSED, ClockEventListener::RESUMED})
        ClockEventListener::raise(event);
    stage().settle();
    EXPECT_EQ(cities(), before);
    EXPECT_THAT(device().calls(), IsEmpty());
}

TEST_F(CityPickerPageTest, LeavingWhileRowsAreStillComingIsSafe) {
    openPicker();
    stage().tap(entry());
    stage().type("a");
    stage().backKey();
    stage().settle();
    EXPECT_FALSE(isOpen());
}

TEST_F(CityPickerPageTest, TheWindowMayDieUnderIt) {
    openPicker();
    stage().tap(entry());
    stage().type("a");
    takeStageDown();
}

TEST_F(CityPickerPageTest, ASecondPickerTakesTheCollatorOver) {
    worldOf({"IDS_CITY_NP_KATHMANDU", "IDS_CITY_DE_BERLIN_BERLIN"});
    openPicker();
    openPicker();
    stage().backKey();
    stage().settle();
    // The one below has lost its collator, not its memory.
    stage().backKey();
    stage().settle();
    EXPECT_THAT(device().callsTo("i18n_ucollator_create"), SizeIs(2));
}

TEST_F(CityPickerPageTest, CallbacksWithoutAPickerSaySo) {
    openPicker();
    WorldClockAddCityViewController::_searchEntryChangedCb(nullptr, entry(), nullptr);
    WorldClockAddCityViewController::_searchIconActivatedCb(nullptr, entry(), nullptr);
    WorldClockAddCityViewController::_locationBtnClickedCb(nullptr, locationButton(), nullptr);
    WorldClockAddCityViewController::_indexSelectedCb(nullptr, index(), nullptr);
    WorldClockAddCityViewController::_indexChangedCb(nullptr, index(), nullptr);
    WorldClockAddCityViewController::_genlistSelectedCb(nullptr, genlist(), nullptr);
    WorldClockAddCityViewController::_genlistScrolledCb(nullptr, genlist(), nullptr);
    for (int callback = 0; callback < 7; ++callback)
        expectLog("Data is NULL !!");
}

} // namespace

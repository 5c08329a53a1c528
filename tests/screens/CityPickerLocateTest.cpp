// Narrowing the city picker to the country of the mobile network.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "screens/CityPickerFixture.h"
#include "support/CityDeviceFake.h"

using testing::Contains;
using testing::Each;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

namespace {

constexpr const char* READY = "memory/telephony/telephony_ready";
constexpr const char* NOT_AVAILABLE = "Location services are not available.";

class CityPickerLocateTest : public CityPickerFixture {
protected:
    void SetUp() override {
        CityPickerFixture::SetUp();
        cityDevice().reset();
        device().setSetting(READY, true);
    }

    void openAt(std::vector<FakeModem> modems) {
        cityDevice().setModems(std::move(modems));
        openPicker();
        device().clearCalls();
        locate();
        fill();
    }

    std::vector<std::string> mobileCodes() {
        std::vector<std::string> codes;
        for (Elm_Object_Item* item : items())
            codes.push_back(cityOf(item).mcc);
        return codes;
    }

    std::vector<std::string> networkCalls() {
        std::vector<std::string> calls;
        for (const std::string& call : device().calls())
            if (call.starts_with("tel_") || call.starts_with("feedback_play"))
                calls.push_back(call);
        return calls;
    }
};

TEST_F(CityPickerLocateTest, TheListIsNarrowedToTheCountryOfTheNetwork) {
    openAt({{"modem1", "26201"}});
    EXPECT_GT(items().size(), 10U);
    EXPECT_THAT(mobileCodes(), Each("262"));
    EXPECT_THAT(device().toasts(), IsEmpty());
    expectLog("MCC from networ PLMN = 262, length = 3");
}

TEST_F(CityPickerLocateTest, OneOfSeveralCodesOfACountryIsEnough) {
    openAt({{"modem1", "311480"}});
    EXPECT_THAT(cities(), Contains("IDS_CITY_US_OREGON_BAKER_CITY"));
    EXPECT_THAT(mobileCodes(), Each(HasSubstr("311")));
}

TEST_F(CityPickerLocateTest, ReadsThroughTheNamedModemThenFeelsATap) {
    openAt({{"modem1", "26201"}});
    EXPECT_THAT(networkCalls(),
                ElementsAre(HasSubstr("tel_get_cp_name_list"), HasSubstr("tel_init(\"modem1\")"),
                            HasSubstr("org.nimbo.telephony.Network:plmn"), HasSubstr("tel_deinit"),
                            HasSubstr("tel_deinit"), HasSubstr("feedback_play")));
    expectLog("tapi handler2 is null");
    EXPECT_EQ(cityDevice().openConnections(), 0U);
}

TEST_F(CityPickerLocateTest, WithTwoModemsTheFirstNetworkCounts) {
    openAt({{"modem1", "26201"}, {"modem2", "52501"}});
    EXPECT_THAT(mobileCodes(), Each("262"));
    EXPECT_EQ(cityDevice().openConnections(), 0U);
}

TEST_F(CityPickerLocateTest, WithoutANetworkTheSecondModemHelps) {
    openAt({{"modem1", ""}, {"modem2", "52501"}});
    EXPECT_THAT(cities(), ElementsAre("IDS_CITY_SG_SINGAPORE"));
}

TEST_F(CityPickerLocateTest, AModemThatDoesNotAnswerIsHelpedByTheSecond) {
    openAt({{"modem1", std::nullopt}, {"modem2", "52501"}});
    EXPECT_THAT(cities(), ElementsAre("IDS_CITY_SG_SINGAPORE"));
}

TEST_F(CityPickerLocateTest, ATelephonyThatIsNotReadyIsAskedWithoutAName) {
    device().setSetting(READY, false);
    openAt({{"modem1", "26201"}});
    expectLog("tapi state is not ready. just init tapi with NULL parameter");
    EXPECT_THAT(networkCalls(), Contains(HasSubstr("tel_init(null)")));
    EXPECT_THAT(mobileCodes(), Each("262"));
}

TEST_F(CityPickerLocateTest, AReadinessThatCannotBeReadCountsAsNotReady) {
    device().removeSetting(READY);
    openAt({{"modem1", "26201"}});
    expectLog("return value is not 0");
    expectLog("tapi state is not ready. just init tapi with NULL parameter");
    EXPECT_THAT(mobileCodes(), Each("262"));
}

TEST_F(CityPickerLocateTest, WithoutAnyAnswerAToastSaysSoAndTheListStays) {
    openAt({{"modem1", std::nullopt}});
    expectLog("Failed to get network PLMN. Show error popup!");
    EXPECT_THAT(device().toasts(), ElementsAre(NOT_AVAILABLE));
    EXPECT_GT(items().size(), 3500U);
    EXPECT_THAT(networkCalls(), Contains(HasSubstr("feedback_play")));
}

TEST_F(CityPickerLocateTest, WithoutAConnectionAToastSaysSo) {
    device().fail("tel_init");
    openAt({{"modem1", "26201"}});
    expectLog("tapi handler1 is null");
    expectLog("Failed to get network PLMN. Show error popup!");
    EXPECT_THAT(device().toasts(), ElementsAre(NOT_AVAILABLE));
}

TEST_F(CityPickerLocateTest, WithoutModemsAToastSaysSo) {
    device().fail("tel_get_cp_name_list");
    openAt({{"modem1", "26201"}});
    expectLog("tapi handler1 is null");
    expectLog("Failed to get network PLMN. Show error popup!");
    EXPECT_THAT(device().toasts(), ElementsAre(NOT_AVAILABLE));
}

TEST_F(CityPickerLocateTest, AnEmptyCodeGivesTheToastAndTheListStays) {
    openAt({{"modem1", ""}});
    expectLog("MCC from networ PLMN = , length = 0");
    expectLog("MCC from Network PLMN is not correct. Show error popup!");
    EXPECT_THAT(device().toasts(), ElementsAre(NOT_AVAILABLE));
    EXPECT_GT(items().size(), 3500U);
}

TEST_F(CityPickerLocateTest, ACountryWithoutCitiesHasNoResults) {
    openAt({{"modem1", "99901"}});
    EXPECT_EQ(genlist(), nullptr);
    EXPECT_TRUE(stage().shows("No results found."));
}

TEST_F(CityPickerLocateTest, AShortCodeMatchesOnlyItself) {
    openAt({{"modem1", "26"}});
    EXPECT_EQ(genlist(), nullptr);
}

TEST_F(CityPickerLocateTest, TheSearchTextIsEmptiedAndTheCountryStays) {
    cityDevice().setModems({{"modem1", "26201"}});
    openPicker();
    search("kathm");
    locate();
    fill();
    EXPECT_STREQ(elm_entry_entry_get(entry()), "");
    EXPECT_THAT(mobileCodes(), Each("262"));
    EXPECT_GT(items().size(), 10U);
}

TEST_F(CityPickerLocateTest, TypingEndsTheCountryFilter) {
    openAt({{"modem1", "26201"}});
    search("kathm");
    EXPECT_THAT(cities(), ElementsAre("IDS_CITY_NP_KATHMANDU"));
    eraseSearch();
    EXPECT_GT(items().size(), 3500U);
}

} // namespace

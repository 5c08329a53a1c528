// Whatever was typed, erased and located before, the list shows what the last step asks for.

#include <random>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "screens/CityPickerFixture.h"
#include "support/CityDeviceFake.h"

namespace {

constexpr const char* READY = "memory/telephony/telephony_ready";

class CityPickerHabitsTest : public CityPickerFixture,
                             public testing::WithParamInterface<unsigned> {
protected:
    void SetUp() override {
        CityPickerFixture::SetUp();
        cityDevice().reset();
        device().setSetting(READY, true);
        cityDevice().setModems({{"modem", "26201"}});
        openPicker();
        for (Elm_Object_Item* item : items())
            _world.push_back(cityOf(item));
    }

    std::string text() { return elm_entry_entry_get(entry()); }

    void pressKey() {
        static const std::string letters = "aeinst";
        const std::string before = text();
        if (!elm_object_focus_get(entry()))
            stage().tap(entry());
        stage().key("End");
        if (_chance() % 3 == 0)
            stage().key("BackSpace");
        else
            stage().type(std::string(1, letters[_chance() % letters.size()]));
        if (text() != before)
            _country = false;
    }

    void doSomething() {
        const unsigned action = _chance() % 10;
        if (action == 0) {
            locate();
            _country = true;
        } else if (action < 4) {
            Stage::frames(static_cast<int>(_chance() % 60));
        } else {
            pressKey();
        }
    }

    std::vector<std::string> expected() {
        std::vector<std::string> ids;
        for (const auto& city : _world)
            if (_country
                    ? WorldClockAddCityViewController::_isMccValueMatched("262", city.mcc.c_str())
                    : WorldClockAddCityViewController::_isIncludeSearchText(city, text()))
                ids.push_back(city.city);
        return ids;
    }

    std::mt19937 _chance{GetParam()};
    bool _country = false;
    std::vector<ClockWorldClockDbData> _world;
};

TEST_P(CityPickerHabitsTest, TheListShowsWhatTheLastStepAsksFor) {
    for (int step = 1; step <= 60; ++step) {
        doSomething();
        if (step % 10 != 0)
            continue;
        fill();
        EXPECT_EQ(cities(), expected()) << "step " << step << ", text \"" << text() << "\"";
    }
}

INSTANTIATE_TEST_SUITE_P(Seeds, CityPickerHabitsTest, testing::Values(1U, 2U, 3U));

class CityPickerSameTextTest : public CityPickerFixture {};

TEST_F(CityPickerSameTextTest, ATextThatIsReportedAgainLeavesTheRowsAlone) {
    openPicker();
    search("san");
    const auto before = items();
    evas_object_smart_callback_call(entry(), "preedit,changed", nullptr);
    EXPECT_EQ(items(), before);
}

TEST_F(CityPickerSameTextTest, TheSameTextEndsTheCountryFilter) {
    cityDevice().reset();
    device().setSetting(READY, true);
    cityDevice().setModems({{"modem", "26201"}});
    openPicker();
    search("n");
    const auto found = cities();
    locate();
    fill();
    EXPECT_NE(cities(), found);
    search("n");
    EXPECT_EQ(cities(), found);
}

} // namespace

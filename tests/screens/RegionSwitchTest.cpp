// Another form of the hours, and another region, are chosen while a screen is open.

#include <optional>
#include <string>
#include <vector>

#include <Elementary.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "screens/DatePopupFixture.h"
#include "screens/EditorFixture.h"
#include "support/LiveLanguage.h"
#include "support/TextFaults.h"

using testing::Contains;
using testing::ElementsAreArray;
using testing::IsEmpty;
using testing::Not;

namespace {

constexpr const char* HOURS_KEY = "db/menu_widget/regionformat_time1224";
constexpr const char* REGION_KEY = "db/menu_widget/regionformat";
constexpr int TWELVE = 1;
constexpr int TWENTY_FOUR = 2;

struct Form {
    const char* region;
    int hours;
};

class RegionSwitchTest : public EditorFixture {
protected:
    void SetUp() override {
        EditorFixture::SetUp();
        _language.emplace();
    }
    void TearDown() override {
        EditorFixture::TearDown();
        _language.reset();
    }
    void choose(const Form& form) {
        device().setSetting(REGION_KEY, form.region);
        device().setSetting(HOURS_KEY, form.hours);
        const bool stands = !isStaged || stage().settle();
        EXPECT_TRUE(stands);
    }
    void speak(const std::string& language) { _language->choose(language); }
    void open() {
        createAlarm();
        pick(18, 25);
        stage().settle();
        isStaged = true;
    }
    void close() {
        isStaged = false;
        takeStageDown();
    }
    std::vector<std::string> look() {
        std::vector<std::string> lines;
        for (const FoundText& found : stage().texts())
            lines.push_back(found.text + " at " + std::to_string(found.area.x) + "," +
                            std::to_string(found.area.y));
        return lines;
    }
    std::vector<std::string> words() {
        std::vector<std::string> all;
        for (const FoundText& found : stage().texts())
            all.push_back(found.text);
        return all;
    }
    std::string time() {
        std::tm value{};
        elm_datetime_value_get(picker(), &value);
        return std::to_string(value.tm_hour) + ":" + std::to_string(value.tm_min);
    }
    bool isStaged = false;

private:
    std::optional<LiveLanguage> _language;
};

TEST_F(RegionSwitchTest, AnOpenEditorLooksAsIfItHadBeenOpenedSo) {
    const std::vector<Form> forms = {{"en_US", TWELVE},      {"ko_KR", TWELVE},
                                     {"de_DE", TWENTY_FOUR}, {"hi_IN", TWELVE},
                                     {"ar_EG", TWENTY_FOUR}, {"ja_JP", TWELVE}};
    for (const Form& wanted : forms) {
        for (const Form& before : forms) {
            choose(wanted);
            open();
            const auto expected = look();
            close();
            choose(before);
            open();
            choose(wanted);
            EXPECT_THAT(look(), ElementsAreArray(expected))
                << before.region << " to " << wanted.region;
            EXPECT_EQ(time(), "18:25");
            EXPECT_THAT(faultsOf(stage().texts()), IsEmpty()) << wanted.region;
            close();
        }
    }
}

TEST_F(RegionSwitchTest, TheRegionAndTheLanguageAreApart) {
    choose({"ko_KR", TWELVE});
    open();
    speak("de");
    stage().settle();
    EXPECT_THAT(words(), Contains("오후"));
    EXPECT_THAT(words(), Contains("Erstellen"));
    choose({"en_US", TWELVE});
    EXPECT_THAT(words(), Contains("PM"));
    EXPECT_THAT(words(), Contains("Erstellen"));
}

TEST_F(RegionSwitchTest, AnOpenDatePopupKeepsItsDayAndTheEditorBelowFollows) {
    choose({"en_US", TWELVE});
    open();
    stage().tap(timePickerRow().getCalendarObj());
    stage().settle();
    DatePopupOnFace(stage()).tapDay(24);
    choose({"ko_KR", TWENTY_FOUR});
    EXPECT_EQ(DatePopupOnFace(stage()).selectedDay(), "2026-11-24");
    stage().backKey();
    stage().settle();
    EXPECT_THAT(words(), Contains("18"));
    EXPECT_THAT(words(), Not(Contains("PM")));
    EXPECT_EQ(time(), "18:25");
}

} // namespace

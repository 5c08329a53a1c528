// Another language is chosen while a screen is open: it then looks as if it had been opened so.

#include <algorithm>
#include <cmath>
#include <functional>
#include <memory>
#include <optional>
#include <ostream>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include <Elementary.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <clock/ClockText.h>
#include <clock/ClockWorldClockDbModel.h>

#include "screens/CityPickerFixture.h"
#include "screens/DatePopupFixture.h"
#include "screens/EditorFixture.h"
#include "support/FaceInk.h"
#include "support/LiveLanguage.h"

using testing::ElementsAreArray;
using testing::IsEmpty;
using testing::Not;

namespace {

constexpr const char* HOURS_KEY = "db/menu_widget/regionformat_time1224";

struct Change {
    const char* from;
    const char* to;
};

void PrintTo(const Change& change, std::ostream* out) {
    *out << change.from << " to " << change.to;
}

const std::vector<Change> CHANGES = {{"en", "de"}, {"en", "ar"}, {"ar", "hi"}};

std::string nameOf(const testing::TestParamInfo<Change>& change) {
    return std::string(change.param.from) + "_" + change.param.to;
}

/** Every visible text and picture with its place. */
std::vector<std::string> look(const Stage& stage) {
    std::vector<std::string> lines;
    for (const FoundText& found : stage.texts()) {
        const Area& area = found.area;
        lines.push_back(found.text + " at " + std::to_string(area.x) + "," +
                        std::to_string(area.y) + " " + std::to_string(area.width) + "x" +
                        std::to_string(area.height));
    }
    for (const Ink& ink : inkOf(stage.canvas()))
        // The toolkit's own pictures are pointers.
        if (!ink.isText && ink.what.find("elementary/themes") == std::string::npos)
            lines.push_back(ink.what + " at " + std::to_string(std::lround(ink.area.x)) + "," +
                            std::to_string(std::lround(ink.area.y)) + " " +
                            std::to_string(std::lround(ink.area.width)));
    // Rows that were built anew are drawn in another order.
    std::ranges::sort(lines);
    return lines;
}

template <class Fixture>
class Switching : public Fixture, public testing::WithParamInterface<Change> {
protected:
    void SetUp() override {
        Fixture::SetUp();
        _language.emplace();
    }
    void TearDown() override {
        Fixture::TearDown();
        _language.reset();
    }

    /**
     * Opens a screen in the new language, and once more in the old one, from which it changes.
     * @return What is seen of the two.
     */
    template <typename See>
    auto openedAndChanged(const std::function<void()>& open, See&& see) {
        _language->choose(GetParam().to);
        open();
        this->stage().settle();
        auto wanted = see();
        this->takeStageDown();
        _language->choose(GetParam().from);
        open();
        this->stage().settle();
        EXPECT_NE(see(), wanted);
        _language->choose(GetParam().to);
        EXPECT_TRUE(this->stage().settle());
        return std::pair(wanted, see());
    }
    /** Nothing tells the two apart. */
    void expectTheSame(const std::string& name, const std::function<void()>& open,
                       bool withPointer = false) {
        std::vector<std::vector<unsigned>> pictures;
        const auto [wanted, found] = openedAndChanged(open, [&] {
            pictures.push_back(this->stage().pixels(0, 0, Stage::SIZE, Stage::SIZE));
            return look(this->stage());
        });
        // The toolkit draws its pointer over a field wherever that was touched last.
        EXPECT_TRUE(withPointer || pictures.front() == pictures.back())
            << "something looks otherwise";
        this->stage().screenshot("switch-" + name + "-" + GetParam().from + "-" + GetParam().to);
        EXPECT_THAT(found, ElementsAreArray(wanted));
    }

    const Change& GetParam() const { return testing::WithParamInterface<Change>::GetParam(); }

    std::optional<LiveLanguage> _language;
};

class EditorSwitchTest : public Switching<EditorFixture> {
protected:
    /** What can be read of a row; empty when it is out of sight. */
    std::vector<std::string> textsOfRow(int place) {
        const auto rows = Stage::rows(genlist());
        return static_cast<std::size_t>(place) < rows.size()
                   ? rows.at(static_cast<std::size_t>(place)).texts
                   : std::vector<std::string>();
    }
    void tapRow(int place) {
        stage().tapRow(elm_genlist_nth_item_get(genlist(), static_cast<unsigned>(place)));
        stage().settle();
    }
    std::string typed() {
        const char* text = elm_entry_entry_get(nameRow().getNameEntryObj());
        return text ? text : "";
    }
    std::string time() {
        std::tm value{};
        elm_datetime_value_get(picker(), &value);
        return std::to_string(value.tm_hour) + ":" + std::to_string(value.tm_min);
    }
};

TEST_P(EditorSwitchTest, TheWheelsKeepTheirTime) {
    device().setSetting(HOURS_KEY, 1);
    expectTheSame("time", [this] {
        createAlarm();
        pick(18, 25);
    });
    EXPECT_EQ(time(), "18:25");
}

TEST_P(EditorSwitchTest, AStoredAlarmKeepsItsDays) {
    auto alarm = storedAlarm(7, 30);
    expectTheSame("days", [&] { editAlarm(alarm); });
}

TEST_P(EditorSwitchTest, AStoredAlarmKeepsItsDate) {
    auto alarm = storedAlarm(7, 30);
    alarm.repeatWeekly = 0;
    alarm.autoDate = alarm.manualDate = static_cast<std::int32_t>(at("2026-11-19 00:00:00"));
    expectTheSame("date", [&] { editAlarm(alarm); });
}

TEST_P(EditorSwitchTest, EveryRowIsTranslatedWhereItIs) {
    // The volume has no words.
    for (const int row : {1, 2, 4, 5, 6}) {
        const auto open = [&, row] {
            createAlarm();
            stage().showRow(elm_genlist_nth_item_get(genlist(), static_cast<unsigned>(row)));
            stage().settle();
        };
        const auto change = [&] {
            return textsOfRow(row);
        };
        // The rows above may have become higher.
        const auto [wanted, found] = openedAndChanged(open, change);
        EXPECT_EQ(found, wanted) << row;
        takeStageDown();
    }
}

TEST_P(EditorSwitchTest, ANameThatIsBeingTypedStays) {
    const auto open = [this] {
        createAlarm();
        typeName("Bins ou");
    };
    const auto [wanted, found] = openedAndChanged(open, [this] { return textsOfRow(7); });
    EXPECT_EQ(found, wanted);
    EXPECT_EQ(typed(), "Bins ou");
    // A face that is turned round is built anew, and the field has to be tapped again.
    const bool turned = std::string(GetParam().from) == "ar" || std::string(GetParam().to) == "ar";
    EXPECT_EQ(elm_object_focus_get(nameRow().getNameEntryObj()) != EINA_FALSE, !turned);
    if (turned) {
        // What was tapped may lie before the name.
        typeName("");
        stage().key("End");
    }
    stage().type("t");
    stage().settle();
    EXPECT_EQ(typed(), "Bins out");
}

TEST_P(EditorSwitchTest, TheRepeatScreenKeepsItsMarks) {
    expectTheSame("repeat", [this] {
        createAlarm();
        tapRow(1);
        const auto lists = stage().widgets("Elm_Genlist");
        ASSERT_THAT(lists, Not(IsEmpty()));
        stage().tapRow(elm_genlist_nth_item_get(lists.back(), 3));
        stage().settle();
    });
}

TEST_P(EditorSwitchTest, TheTypePopupFollows) {
    expectTheSame("type", [this] {
        createAlarm();
        tapRow(2);
    });
}

TEST_P(EditorSwitchTest, TheQuestionBeforeDiscardingFollows) {
    expectTheSame("discard", [this] {
        createAlarm();
        pick(7, 30);
        stage().backKey();
        stage().settle();
    });
}

TEST_P(EditorSwitchTest, TheDatePopupKeepsItsMonthAndDay) {
    const auto open = [this] {
        createAlarm();
        pick(7, 30);
        stage().tap(timePickerRow().getCalendarObj());
        stage().settle();
        DatePopupOnFace face(stage());
        face.turnMonths(1);
        face.tapDay(24);
    };
    // The week goes on beginning where it began when the popup opened.
    const auto words = [this] {
        std::set<std::string> texts;
        for (const FoundText& found : stage().texts())
            if (found.text.find_first_of("0123456789") != 0)
                texts.insert(found.text);
        return texts;
    };
    const auto [wanted, found] = openedAndChanged(open, words);
    EXPECT_EQ(found, wanted);
    EXPECT_EQ(DatePopupOnFace(stage()).selectedDay(), "2026-12-24");
}

INSTANTIATE_TEST_SUITE_P(Languages, EditorSwitchTest, testing::ValuesIn(CHANGES), nameOf);

class CitySwitchTest : public Switching<CityPickerFixture> {
protected:
    void SetUp() override {
        Switching::SetUp();
        worldOf({"IDS_CITY_DE_BERLIN_BERLIN", "IDS_CITY_JP_TOKYO", "IDS_CITY_IN_NEW_DELHI",
                 "IDS_CITY_NP_KATHMANDU", "IDS_CITY_SG_SINGAPORE"});
    }
};

TEST_P(CitySwitchTest, ThePickerFollows) {
    expectTheSame("cities", [this] { openPicker(); });
}

TEST_P(CitySwitchTest, ASearchThatFindsNothingStays) {
    expectTheSame(
        "nothing",
        [this] {
            openPicker();
            search("qqxx");
            stage().key("Return");
        },
        true);
    EXPECT_STREQ(elm_entry_entry_get(entry()), "qqxx");
}

TEST_P(CitySwitchTest, AHalfTypedSearchStays) {
    const auto open = [this] {
        openPicker();
        search("i");
    };
    const auto title = [this] {
        return stage().texts().front().text;
    };
    const auto [wanted, found] = openedAndChanged(open, title);
    EXPECT_EQ(found, wanted);
    EXPECT_STREQ(elm_entry_entry_get(entry()), "i");
    EXPECT_TRUE(elm_object_focus_get(entry()));
    // The next key finds by the names that cities have now.
    stage().type("n");
    stage().settle();
    EXPECT_STREQ(elm_entry_entry_get(entry()), "in");
}

INSTANTIATE_TEST_SUITE_P(Languages, CitySwitchTest, testing::ValuesIn(CHANGES), nameOf);

class CityOrderSwitchTest : public Switching<CityPickerFixture> {};

TEST_P(CityOrderSwitchTest, TheOrderStaysThatOfTheLanguageInWhichThePickerOpened) {
    std::vector<ClockWorldClockDbData> all;
    ClockWorldClockDbModel().getWorldClockAllCityList(all);
    std::vector<std::string> ids;
    for (std::size_t place = 0; place < all.size() && ids.size() < 150; ++place)
        if (all[place].timezone == "GMT+01:00")
            ids.push_back(all[place].city);
    worldOf(ids);
    _language->choose(GetParam().to);
    openPicker();
    const auto other = cities();
    takeStageDown();
    _language->choose(GetParam().from);
    openPicker();
    const auto order = cities();
    ASSERT_NE(order, other);
    const auto labels = hours();
    _language->choose(GetParam().to);
    EXPECT_TRUE(stage().settle());
    EXPECT_EQ(cities(), order);
    EXPECT_EQ(hours(), labels);
    // Each key lists the cities anew.
    search(clockText(order.front().c_str()));
    eraseSearch();
    EXPECT_EQ(cities(), order);
}

INSTANTIATE_TEST_SUITE_P(Languages, CityOrderSwitchTest, testing::ValuesIn(CHANGES), nameOf);

} // namespace

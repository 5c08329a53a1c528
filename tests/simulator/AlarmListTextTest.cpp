// What the alarm list says about an alarm.

#include "AlarmListText.h"

#include <string>
#include <utility>
#include <vector>

#include "screens/TestCatalogue.h"
#include "support/ScreenTest.h"
#include "support/StoredData.h"

using simulator::alarmDaysText;
using simulator::alarmTimeText;
using simulator::nextRingText;

// Keeps a time in one piece.
#define NARROW_SPACE "\u202f"

namespace {

class AlarmListTextTest : public ScreenTest {
protected:
    static ClockAlarmDbData alarmOn(int weekdays) { return alarmAt(6, 0, weekdays); }
};

} // namespace

TEST_F(AlarmListTextTest, twentyFourHoursHaveTwoDigits) {
    EXPECT_EQ(alarmTimeText(alarmAt(0, 0), false), "00:00");
    EXPECT_EQ(alarmTimeText(alarmAt(7, 5), false), "07:05");
    EXPECT_EQ(alarmTimeText(alarmAt(12, 0), false), "12:00");
    EXPECT_EQ(alarmTimeText(alarmAt(23, 59), false), "23:59");
}

TEST_F(AlarmListTextTest, twelveHoursHaveHalves) {
    EXPECT_EQ(alarmTimeText(alarmAt(0, 0), true), "12:00" NARROW_SPACE "AM");
    EXPECT_EQ(alarmTimeText(alarmAt(7, 5), true), "7:05" NARROW_SPACE "AM");
    EXPECT_EQ(alarmTimeText(alarmAt(12, 0), true), "12:00" NARROW_SPACE "PM");
    EXPECT_EQ(alarmTimeText(alarmAt(23, 59), true), "11:59" NARROW_SPACE "PM");
}

TEST_F(AlarmListTextTest, aTimeThatSummerTimeSkipsTodayIsShownAsItIs) {
    VirtualClock::setNow("Europe/Berlin", "2026-03-29 12:00:00");
    EXPECT_EQ(alarmTimeText(alarmAt(2, 30), false), "02:30");
}

TEST_F(AlarmListTextTest, weekdaysAreNamedFromMonday) {
    EXPECT_EQ(alarmDaysText(alarmOn(1 | 2 | 64), VirtualClock::now()), "Mon Sat Sun");
    EXPECT_EQ(alarmDaysText(alarmOn(CLOCK_ALARM_EVERY_DAY), VirtualClock::now()), "Every day");
}

TEST_F(AlarmListTextTest, aOneTimeAlarmHasItsDay) {
    const auto on = [](const char* day) {
        ClockAlarmDbData alarm = alarmAt(10, 0);
        const auto now = VirtualClock::now();
        VirtualClock::setNow("Europe/Berlin", std::string(day) + " 00:00:00");
        alarm.autoDate = static_cast<std::int32_t>(VirtualClock::now());
        VirtualClock::setNow(now);
        return alarmDaysText(alarm, VirtualClock::now());
    };
    EXPECT_EQ(on("2026-11-18"), "Today");
    EXPECT_EQ(on("2026-11-19"), "Tomorrow");
    EXPECT_EQ(on("2026-11-21"), "Sat, Nov 21");
    EXPECT_EQ(on("2027-01-01"), "Fri, Jan 1, 2027");
    EXPECT_EQ(on("2026-11-17"), "Off") << "its day is over";
    EXPECT_EQ(alarmDaysText(alarmAt(9, 42), VirtualClock::now()), "Today");
    EXPECT_EQ(alarmDaysText(alarmAt(9, 41), VirtualClock::now()), "Tomorrow");
}

TEST_F(AlarmListTextTest, anAlarmThatIsSwitchedOffSaysWhatStays) {
    ClockAlarmDbData alarm = alarmOn(2);
    alarm.enable = 0;
    EXPECT_EQ(alarmDaysText(alarm, VirtualClock::now()), "Mon");
    alarm.repeatWeekly = 0;
    EXPECT_EQ(alarmDaysText(alarm, VirtualClock::now()), "Off");
    const auto now = VirtualClock::now();
    VirtualClock::setNow("Europe/Berlin", "2026-11-21 00:00:00");
    alarm.autoDate = static_cast<std::int32_t>(VirtualClock::now());
    VirtualClock::setNow(now);
    EXPECT_EQ(alarmDaysText(alarm, now), "Off") << "the day follows when it is switched on";
    alarm.manualDate = alarm.autoDate;
    EXPECT_EQ(alarmDaysText(alarm, now), "Sat, Nov 21");
}

TEST_F(AlarmListTextTest, theNextRingIsSoFarAway) {
    constexpr int MINUTE = 60;
    constexpr int HOUR = 60 * MINUTE;
    const auto now = VirtualClock::now();
    const auto in = [now](int seconds) {
        return nextRingText(now + seconds, now);
    };
    EXPECT_EQ(in(1), "in 1 min");
    EXPECT_EQ(in(MINUTE), "in 1 min");
    EXPECT_EQ(in(MINUTE + 1), "in 2 min");
    EXPECT_EQ(in(HOUR), "in 1 hr");
    EXPECT_EQ(in(7 * HOUR + 25 * MINUTE), "in 7 hr, 25 min");
    EXPECT_EQ(in(24 * HOUR), "in 24 hr");
    EXPECT_EQ(in(24 * HOUR + 1), "Tomorrow");
    EXPECT_EQ(in(48 * HOUR), "Fri, Nov 20");
    EXPECT_EQ(in(80 * 24 * HOUR), "Sat, Feb 6, 2027");
    EXPECT_EQ(in(0), "Today");
}

TEST_F(AlarmListTextTest, theNextRingIsWrittenInTheLanguage) {
    const auto now = VirtualClock::now();
    const std::vector<std::pair<const char*, std::string>> texts{{"de", "in 7 Std., 25 Min."},
                                                                 {"ru", "через 7 ч 25 мин"},
                                                                 {"tr", "7 sa. 25 dk. sonra"},
                                                                 {"ja", "7 時間 25 分後"},
                                                                 {"ar", "بعد 7 س و25 د"}};
    for (const auto& [language, text] : texts) {
        const CatalogueLanguage catalogue(language);
        EXPECT_EQ(nextRingText(now + 26700, now), text);
    }
}

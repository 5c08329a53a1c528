#include "rules/SaveTime.h"

#include <cstdlib>
#include <optional>

#include "rules/DateLine.h"
#include "rules/RingDay.h"

namespace rules {

namespace {

// Gives the process another time zone for a while. There is one thread, so nobody else looks.
class TimeZoneScope {
public:
    explicit TimeZoneScope(const std::string& timeZone) {
        if (const char* before = std::getenv("TZ"))
            _before = before;
        set(timeZone);
    }
    ~TimeZoneScope() { set(_before); }
    TimeZoneScope(const TimeZoneScope&) = delete;
    TimeZoneScope& operator=(const TimeZoneScope&) = delete;

private:
    static void set(const std::optional<std::string>& timeZone) {
        if (timeZone)
            setenv("TZ", timeZone->c_str(), 1);
        else
            unsetenv("TZ");
        tzset();
    }

    std::optional<std::string> _before;
};

std::tm timeOfDay(std::tm day, int hour, int minute, int daylightSaving) {
    day.tm_hour = hour;
    day.tm_min = minute;
    day.tm_sec = 0;
    day.tm_isdst = daylightSaving;
    return day;
}

} // namespace

RingDate settleRingDate(ClockAlarmDbData& alarm, std::time_t now) {
    dropDatesOfWeekly(alarm);
    if (alarm.repeatWeekly != 0) {
        alarm.repeatOnce = 0;
        return RingDate::NotChosen;
    }
    alarm.repeatOnce = 1;
    if (alarm.autoDate == 0) {
        alarm.autoDate = static_cast<std::int32_t>(ringDay(alarm.hour, alarm.min, now).midnight);
        alarm.manualDate = 0;
    }
    return alarm.manualDate != 0 ? RingDate::Chosen : RingDate::NotChosen;
}

std::time_t alarmTime(int hour, int minute, const std::string& timeZone, std::time_t now) {
    const TimeZoneScope scope(timeZone);
    const std::tm today = localTime(now);
    std::tm ring = timeOfDay(today, hour, minute, -1);
    const std::time_t instant = std::mktime(&ring);
    if (ring.tm_isdst <= 0)
        return instant;
    std::tm standard = timeOfDay(today, hour, minute, 0);
    const std::time_t later = std::mktime(&standard);
    return standard.tm_hour == hour && standard.tm_min == minute ? later : instant;
}

} // namespace rules

#include "rules/RingDay.h"

#include <algorithm>

namespace rules {

namespace {
constexpr std::time_t SECONDS_PER_DAY = 86400;
}

std::tm localTime(std::time_t instant) {
    std::tm broken{};
    localtime_r(&instant, &broken);
    return broken;
}

std::time_t toMidnight(std::tm& day) {
    day.tm_hour = 0;
    day.tm_min = 0;
    day.tm_sec = 0;
    day.tm_isdst = -1;
    return std::mktime(&day);
}

std::tm oneDayLater(std::time_t now) {
    return localTime(now + SECONDS_PER_DAY);
}

bool isStillToCome(int hour, int minute, const std::tm& now) {
    return hour > now.tm_hour || (hour == now.tm_hour && minute > now.tm_min);
}

RingDay ringDay(int hour, int minute, std::time_t now) {
    const std::tm today = localTime(now);
    RingDay result{};
    result.today = isStillToCome(hour, minute, today);
    result.day = result.today ? today : oneDayLater(now);
    result.midnight = toMidnight(result.day);
    return result;
}

int secondsToNextMinute(std::time_t now) {
    // A leap second would give 0.
    return std::max(1, 60 - localTime(now).tm_sec);
}

} // namespace rules

#include "rules/DateLine.h"

#include <array>
#include <cstdlib>
#include <memory>
#include <tuple>

#include <base/Text.h>
#include <clock/ClockIcuDataModel.h>
#include <clock/ClockText.h>

#include "rules/RingDay.h"

namespace rules {

DateLine dateLine(const std::tm& ringDay, int hour, int minute, const std::tm& now) {
    if (ringDay.tm_year != now.tm_year)
        return ringDay.tm_year > now.tm_year ? DateLine::DateWithYear : DateLine::Past;
    if (ringDay.tm_mon != now.tm_mon)
        return ringDay.tm_mon > now.tm_mon ? DateLine::Date : DateLine::Past;
    const int days = ringDay.tm_mday - now.tm_mday;
    if (days < 0)
        return DateLine::Past;
    if (days > 0)
        return days == 1 ? DateLine::TomorrowAndDate : DateLine::Date;
    return isStillToCome(hour, minute, now) ? DateLine::TodayAndDate : DateLine::Past;
}

void clearPastDate(ClockAlarmDbData& alarm) {
    alarm.repeatOnce = 1;
    alarm.autoDate = 0;
    alarm.manualDate = 0;
    alarm.repeatWeekly = 0;
}

void setPickedDate(ClockAlarmDbData& alarm, std::time_t midnight) {
    alarm.autoDate = static_cast<std::int32_t>(midnight);
    alarm.manualDate = static_cast<std::int32_t>(midnight);
    alarm.repeatOnce = 1;
    alarm.repeatWeekly = 0;
}

bool isUndated(const ClockAlarmDbData& alarm) {
    return alarm.repeatWeekly == 0 && alarm.autoDate == 0;
}

void dropDatesOfWeekly(ClockAlarmDbData& alarm) {
    if (alarm.repeatWeekly == 0)
        return;
    alarm.autoDate = 0;
    alarm.manualDate = 0;
}

bool isBeforeDay(const std::tm& day, const std::tm& today) {
    return std::tie(day.tm_year, day.tm_mon, day.tm_mday) <
           std::tie(today.tm_year, today.tm_mon, today.tm_mday);
}

std::string currentTimeZone() {
    const std::unique_ptr<char, decltype(&std::free)> zone(ClockIcuDataModel::getCurrentTimeZone(),
                                                           &std::free);
    return zone ? zone.get() : "";
}

std::string dateText(std::time_t day, const char* skeleton) {
    std::array<char, 512> buffer{};
    ClockIcuDataModel::getFormattedDateString(day, buffer.data(), static_cast<int>(buffer.size()),
                                              nullptr, skeleton, currentTimeZone().c_str());
    return buffer.data();
}

std::string wordAndDate(const std::string& word, const std::string& date, std::size_t maxBytes) {
    return std::string(base::cutUtf8(word + " - " + date, maxBytes));
}

std::string dateLineText(DateLine line, std::time_t midnight, std::size_t maxBytes) {
    switch (line) {
    case DateLine::TodayAndDate:
        return wordAndDate(clockText("IDS_CLOCK_BODY_TODAY"), dateText(midnight), maxBytes);
    case DateLine::TomorrowAndDate:
        return wordAndDate(clockText("IDS_CLOCK_BODY_TOMORROW"), dateText(midnight), maxBytes);
    case DateLine::Date:
        return dateText(midnight);
    case DateLine::DateWithYear:
        return dateText(midnight, DAY_AND_YEAR_SKELETON);
    case DateLine::Past:
        break;
    }
    return {};
}

} // namespace rules

#include "AlarmListText.h"

#include <vector>

#include <unicode/measfmt.h>
#include <unicode/measunit.h>
#include <unicode/measure.h>

#include "TimeText.h"
#include "base/CivilTime.h"
#include "base/ScreenLocale.h"
#include "base/Text.h"
#include "clock/AlarmRing.h"
#include "clock/ClockIcuDataModel.h"
#include "clock/ClockText.h"
#include "rules/DateLine.h"
#include "rules/WeekdaySet.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {
namespace {

constexpr std::int64_t MINUTE = 60;
constexpr std::int64_t MINUTES_PER_HOUR = 60;
constexpr std::int64_t MINUTES_PER_DAY = 24 * MINUTES_PER_HOUR;

std::string weekdaysText(int weekdays) {
    std::string text = rules::weekdaySummary(weekdays);
    text.erase(text.find_last_not_of(' ') + 1);
    return text;
}

std::string dayText(std::int64_t ring, std::int64_t now) {
    const std::string zone = base::currentTimeZone();
    const base::CivilDate day = base::toCivil(ring, zone).date;
    const base::CivilDate today = base::toCivil(now, zone).date;
    if (day == today)
        return clockText("IDS_CLOCK_BODY_TODAY");
    if (day == base::addDays(today, 1))
        return clockText("IDS_CLOCK_BODY_TOMORROW");
    return rules::dateText(ring, day.year == today.year ? rules::DAY_SKELETON
                                                        : rules::DAY_AND_YEAR_SKELETON);
}

/** "7 hr, 25 min" in the current language; empty on failure. */
std::string spanText(std::int64_t minutes) {
    UErrorCode status = U_ZERO_ERROR;
    std::vector<icu::Measure> measures;
    const auto add = [&](std::int64_t count, icu::MeasureUnit* unit) {
        // The unit belongs to the measure in any case.
        icu::Measure measure(icu::Formattable(count), unit, status);
        if (count > 0)
            measures.push_back(measure);
    };
    add(minutes / MINUTES_PER_HOUR, icu::MeasureUnit::createHour(status));
    add(minutes % MINUTES_PER_HOUR, icu::MeasureUnit::createMinute(status));
    const icu::MeasureFormat format(
        base::screenLocale(icu::Locale(ClockIcuDataModel::getCurrentLocale())),
        UMEASFMT_WIDTH_SHORT, status);
    icu::UnicodeString text;
    icu::FieldPosition position;
    format.formatMeasures(measures.data(), static_cast<std::int32_t>(measures.size()), text,
                          position, status);
    std::string utf8;
    if (U_FAILURE(status))
        LOG_ERROR("A span of time cannot be written: %s", u_errorName(status));
    else
        text.toUTF8String(utf8);
    return utf8;
}

} // namespace

std::string alarmTimeText(const ClockAlarmDbData& alarm, bool twelveHour) {
    return timeOfDayText(alarm.hour, alarm.min, twelveHour);
}

std::string alarmDaysText(const ClockAlarmDbData& alarm, std::int64_t now) {
    if (alarm.repeatWeekly != 0)
        return weekdaysText(alarm.repeatWeekly);
    const bool hasDay = alarm.enable == 1 || alarm.manualDate != 0;
    const auto ring = hasDay ? clock_common::nextRing(alarm, now) : std::nullopt;
    return ring ? dayText(*ring, now) : clockText("IDS_ALM_BODY_OFF");
}

std::string nextRingText(std::int64_t ring, std::int64_t now) {
    const std::int64_t minutes = (ring - now + MINUTE - 1) / MINUTE;
    if (minutes <= 0 || minutes > MINUTES_PER_DAY)
        return dayText(ring, now);
    const std::string span = spanText(minutes);
    return span.empty() ? dayText(ring, now)
                        : base::formatTranslation(clockText("IDS_ALM_BODY_IN_PS"), {span});
}

} // namespace simulator

#define LOG_TAG "clock-common"
#include "clock/ClockStringUtil.h"

#include <array>
#include <ctime>
#include <unicode/measfmt.h>
#include <unicode/measunit.h>
#include <unicode/measure.h>
#include <utility>
#include <vector>

#include <base/Log.h>
#include <base/ScreenLocale.h>
#include <base/Text.h>

#include "clock/AlarmRing.h"
#include "clock/ClockIcuDataModel.h"
#include "clock/ClockText.h"

namespace {

constexpr std::int64_t MINUTES_PER_HOUR = 60;
constexpr std::int64_t MINUTES_PER_DAY = 24 * MINUTES_PER_HOUR;

/** "2 hours, 5 minutes" in the current language; empty on failure or without counts. */
std::string spanText(int days, int hours, int minutes) {
    UErrorCode status = U_ZERO_ERROR;
    std::vector<icu::Measure> measures;
    const auto add = [&](int count, icu::MeasureUnit* unit) {
        // The unit belongs to the measure in any case.
        icu::Measure measure(icu::Formattable(count), unit, status);
        if (count > 0)
            measures.push_back(measure);
    };
    add(days, icu::MeasureUnit::createDay(status));
    add(hours, icu::MeasureUnit::createHour(status));
    add(minutes, icu::MeasureUnit::createMinute(status));
    if (measures.empty())
        return {};
    const icu::MeasureFormat format(
        base::screenLocale(icu::Locale(ClockIcuDataModel::getCurrentLocale())), UMEASFMT_WIDTH_WIDE,
        status);
    icu::UnicodeString text;
    icu::FieldPosition position;
    format.formatMeasures(measures.data(), static_cast<std::int32_t>(measures.size()), text,
                          position, status);
    if (U_FAILURE(status)) {
        LOG_ERROR("a span of time cannot be written: %s", u_errorName(status));
        return {};
    }
    std::string utf8;
    text.toUTF8String(utf8);
    return utf8;
}

} // namespace

void ClockStringUtil::getAlertTimeOffset(const ClockAlarmDbData& alarm, int* days, int* hours,
                                         int* minutes) {
    for (const auto& [count, name] :
         {std::pair(days, "days"), {hours, "hours"}, {minutes, "minutes"}}) {
        if (!count) {
            LOG_ERROR("%s is NULL !!", name);
            return;
        }
        *count = 0;
    }
    const std::int64_t now = std::time(nullptr);
    const auto ring = alarm.enable == 1 ? clock_common::nextRing(alarm, now) : std::nullopt;
    if (!ring)
        return;
    const auto distance = (*ring - now + 59) / 60;
    *days = static_cast<int>(distance / MINUTES_PER_DAY);
    *hours = static_cast<int>(distance % MINUTES_PER_DAY / MINUTES_PER_HOUR);
    *minutes = static_cast<int>(distance % MINUTES_PER_HOUR);
}

void ClockStringUtil::generateAlertOffsetToastPopupText(int days, int hours, int minutes,
                                                        std::string& text) {
    if (days < 0 || hours < 0 || minutes < 0)
        LOG_ERROR("negative span: %d days, %d hours, %d minutes", days, hours, minutes);
    const auto span = spanText(days, hours, minutes);
    text = span.empty() ? clockText("IDS_CLOCK_TPOP_ALARM_SET")
                        : base::formatTranslation(
                              clockText("IDS_CLOCK_TPOP_ALARM_SET_FOR_PS_FROM_NOW"), {span});
}

std::string ClockStringUtil::changeStringToUpper(const std::string& text) {
    auto converted = icu::UnicodeString::fromUTF8(text);
    converted.toUpper(icu::Locale(ClockIcuDataModel::getCurrentLocale()));
    std::string upper;
    converted.toUTF8String(upper);
    return upper;
}

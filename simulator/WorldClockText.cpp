#include "WorldClockText.h"

#include <array>
#include <cstdio>
#include <cstdlib>

#include "TimeText.h"
#include "base/CivilTime.h"
#include "clock/ClockText.h"

namespace simulator {
namespace {

std::string gmtText(int offsetSeconds) {
    constexpr int MINUTE = 60;
    constexpr int MINUTES_PER_HOUR = 60;
    const int minutes = std::abs(offsetSeconds) / MINUTE;
    std::array<char, 32> text{};
    std::snprintf(text.data(), text.size(), "GMT%c%02d:%02d", offsetSeconds < 0 ? '-' : '+',
                  minutes / MINUTES_PER_HOUR, minutes % MINUTES_PER_HOUR);
    return text.data();
}

/** "Tomorrow", "Yesterday", or nothing when it is the same day here. */
std::string dayText(const base::CivilDate& there, const base::CivilDate& here) {
    if (there == base::addDays(here, 1))
        return clockText("IDS_CLOCK_BODY_TOMORROW");
    if (there == base::addDays(here, -1))
        return clockText("IDS_CLOCK_BODY_YESTERDAY");
    return "";
}

} // namespace

std::string cityTimeText(std::int64_t now, const std::string& tzPath, bool twelveHour) {
    const base::CivilTime reading = base::toCivil(now, tzPath);
    return timeOfDayText(reading.hour, reading.minute, twelveHour);
}

std::string cityOffsetText(std::int64_t now, const std::string& tzPath) {
    const std::string day =
        dayText(base::toCivil(now, tzPath).date, base::toCivil(now, base::currentTimeZone()).date);
    const std::string offset = gmtText(base::utcOffset(now, tzPath));
    return day.empty() ? offset : day + ", " + offset;
}

} // namespace simulator

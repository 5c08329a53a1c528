#include "base/CivilTime.h"

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <memory>

#include "base/Days.h"
#include "base/TimeZoneRules.h"

namespace base {

namespace {

constexpr std::int64_t SECONDS_PER_DAY = 86400;
// Days after which a weekly alarm has come at least once, even if a zone skipped a day.
constexpr int LONGEST_WAIT = 15;

/** The id within a path such as "/usr/share/zoneinfo/Europe/Berlin". */
std::string idOfPath(const std::string& path) {
    static const std::string folder = "zoneinfo/";
    const auto place = path.rfind(folder);
    std::string id = place == std::string::npos ? "" : path.substr(place + folder.size());
    for (const std::string variant : {"posix/", "right/"})
        if (id.starts_with(variant))
            id.erase(0, variant.size());
    return id;
}

std::string systemTimeZone() {
    std::error_code error;
    const auto target = std::filesystem::read_symlink("/etc/localtime", error);
    if (!error) {
        auto id = idOfPath(target.string());
        if (TimeZoneRules::find(id))
            return id;
    }
    std::string id;
    if (std::ifstream file("/etc/timezone"); std::getline(file, id) && TimeZoneRules::find(id))
        return id;
    return "UTC";
}

std::shared_ptr<const TimeZoneRules> rulesOf(const std::string& timeZone) {
    if (auto zone = TimeZoneRules::find(timeZone))
        return zone;
    if (auto zone = TimeZoneRules::find(currentTimeZone()))
        return zone;
    return TimeZoneRules::fromRule("UTC0");
}

std::int64_t secondsOf(const CivilTime& civil) {
    return daysFromCivil(civil.date) * SECONDS_PER_DAY + std::int64_t(civil.hour) * 3600 +
           std::int64_t(civil.minute) * 60 + civil.second;
}

std::int64_t instantIn(const TimeZoneRules& zone, const CivilTime& civil) {
    const auto reading = secondsOf(civil);
    auto period = zone.periodAt(reading - 2 * SECONDS_PER_DAY);
    // The first period whose clock shows the reading, or that begins after it was skipped.
    while (reading - period.offset >= period.end)
        period = zone.periodAt(period.end);
    return std::max(reading - period.offset, period.begin);
}

} // namespace

std::int64_t daysFromCivil(const CivilDate& date) {
    // Years begin in March, so that the leap day is the last day of its year.
    const std::int64_t months = std::int64_t(date.year) * 12 + date.month - 3;
    const auto year = floorDivide(months, 12);
    const auto month = months - year * 12;
    const auto era = floorDivide(year, 400);
    const auto yearOfEra = year - era * 400;
    const auto dayOfYear = (153 * month + 2) / 5 + date.day - 1;
    return era * 146097 + yearOfEra * 365 + yearOfEra / 4 - yearOfEra / 100 + dayOfYear - 719468;
}

CivilDate civilFromDays(std::int64_t days) {
    days += 719468;
    const auto era = floorDivide(days, 146097);
    const auto dayOfEra = days - era * 146097;
    const auto yearOfEra =
        (dayOfEra - dayOfEra / 1460 + dayOfEra / 36524 - dayOfEra / 146096) / 365;
    const auto dayOfYear = dayOfEra - (365 * yearOfEra + yearOfEra / 4 - yearOfEra / 100);
    const auto month = (5 * dayOfYear + 2) / 153;
    CivilDate date;
    date.day = static_cast<int>(dayOfYear - (153 * month + 2) / 5 + 1);
    date.month = static_cast<int>(month < 10 ? month + 3 : month - 9);
    date.year = static_cast<int>(yearOfEra + era * 400 + (date.month <= 2 ? 1 : 0));
    return date;
}

std::string currentTimeZone() {
    const char* variable = std::getenv("TZ");
    if (!variable)
        return systemTimeZone();
    std::string id = variable;
    if (id.starts_with(':'))
        id.erase(0, 1);
    if (id == "/etc/localtime")
        return systemTimeZone();
    if (id.starts_with('/') || id.starts_with("posix/") || id.starts_with("right/"))
        id = idOfPath("zoneinfo/" + id);
    return TimeZoneRules::find(id) ? id : "UTC";
}

bool isTimeZone(const std::string& timeZone) {
    return TimeZoneRules::find(timeZone) != nullptr;
}

int utcOffset(std::int64_t instant, const std::string& timeZone) {
    return rulesOf(timeZone)->periodAt(instant).offset;
}

CivilTime toCivil(std::int64_t instant, const std::string& timeZone) {
    const auto offset = utcOffset(instant, timeZone);
    // Keeps instants at the ends of the range from running over.
    constexpr auto range = std::int64_t(1) << 61;
    const auto reading = std::clamp(instant, -range, range) + offset;
    const auto days = floorDivide(reading, SECONDS_PER_DAY);
    const auto second = static_cast<int>(reading - days * SECONDS_PER_DAY);
    return {civilFromDays(days), second / 3600, second / 60 % 60, second % 60};
}

std::int64_t toInstant(const CivilTime& civil, const std::string& timeZone) {
    return instantIn(*rulesOf(timeZone), civil);
}

CivilDate addDays(const CivilDate& date, int days) {
    return civilFromDays(daysFromCivil(date) + days);
}

int weekdayOf(const CivilDate& date) {
    // Day 0 was a Thursday.
    const auto day = daysFromCivil(date) + 4;
    return static_cast<int>(day - floorDivide(day, 7) * 7);
}

std::optional<std::int64_t> nextRing(const RingRule& rule, std::int64_t now,
                                     const std::string& timeZone) {
    const auto zone = rulesOf(timeZone);
    const auto ringOn = [&](const CivilDate& date) {
        return instantIn(*zone, {date, rule.hour, rule.minute, 0});
    };
    if (rule.weekdays == 0 && rule.date) {
        const auto ring = ringOn(*rule.date);
        return ring > now ? std::optional(ring) : std::nullopt;
    }
    const auto today = toCivil(now, timeZone).date;
    for (int day = 0; day <= LONGEST_WAIT; ++day) {
        const auto date = addDays(today, day);
        if (rule.weekdays != 0 && (rule.weekdays >> weekdayOf(date) & 1) == 0)
            continue;
        if (const auto ring = ringOn(date); ring > now)
            return ring;
    }
    return std::nullopt;
}

} // namespace base

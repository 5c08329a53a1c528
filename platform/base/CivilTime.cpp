#include "base/CivilTime.h"

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <date/date.h>
#include <date/tz.h>
#include <filesystem>
#include <fstream>
#include <stdexcept>
#include <string_view>

namespace base {

namespace {

using Instant = date::sys_seconds;
using std::chrono::seconds;

// Days after which a weekly alarm has come at least once, even if a zone skipped a day.
constexpr int LONGEST_WAIT = 15;
// The library's calendar has 16 bits for a year.
constexpr Instant EARLIEST = date::sys_days{date::year{-9999} / 1 / 1};
constexpr Instant LATEST = date::sys_days{date::year{9999} / 12 / 31};

/**
 * A zone of the system's time-zone files; null when there is none. Not ICU's: its copy of the data
 * is only as new as ICU itself, and an alarm must ring when the C library's clock shows its time.
 */
const date::time_zone* findZone(const std::string& id) {
    try {
        return date::locate_zone(id);
    } catch (const std::runtime_error&) {
        return nullptr;
    }
}

/** The id within a path such as "/usr/share/zoneinfo/Europe/Berlin". */
std::string idOfPath(const std::string& path) {
    static const std::string folder = "zoneinfo/";
    const auto place = path.rfind(folder);
    std::string id = place == std::string::npos ? "" : path.substr(place + folder.size());
    for (const std::string_view variant : {"posix/", "right/"})
        if (id.starts_with(variant))
            id.erase(0, variant.size());
    return id;
}

std::string systemTimeZone() {
    std::error_code error;
    const auto target = std::filesystem::read_symlink("/etc/localtime", error);
    if (!error) {
        auto id = idOfPath(target.string());
        if (isTimeZone(id))
            return id;
    }
    std::string id;
    if (std::ifstream file("/etc/timezone"); std::getline(file, id) && isTimeZone(id))
        return id;
    return "UTC";
}

/** The zone; the current one when it is unknown; null, for UTC, when that is unknown too. */
const date::time_zone* zoneOf(const std::string& timeZone) {
    const auto* zone = findZone(timeZone);
    return zone ? zone : findZone(currentTimeZone());
}

Instant toLibrary(std::int64_t instant) {
    const auto limit = [](Instant end) {
        return std::int64_t{end.time_since_epoch().count()};
    };
    return Instant(seconds(std::clamp(instant, limit(EARLIEST), limit(LATEST))));
}

date::sys_days toLibrary(const CivilDate& date) {
    return date::year{std::clamp(date.year, -9999, 9999)} / date.month / date.day;
}

CivilDate fromLibrary(date::sys_days days) {
    const date::year_month_day date(days);
    return {static_cast<int>(date.year()), static_cast<int>(static_cast<unsigned>(date.month())),
            static_cast<int>(static_cast<unsigned>(date.day()))};
}

std::int64_t instantIn(const date::time_zone* zone, const CivilTime& civil) {
    const date::local_seconds reading{toLibrary(civil.date).time_since_epoch() +
                                      std::chrono::hours(civil.hour) +
                                      std::chrono::minutes(civil.minute) + seconds(civil.second)};
    if (!zone)
        return reading.time_since_epoch().count();
    const auto info = zone->get_info(reading);
    const auto instant = info.result == date::local_info::nonexistent
                             ? info.second.begin.time_since_epoch()
                             : reading.time_since_epoch() - info.first.offset;
    return instant.count();
}

} // namespace

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
    return isTimeZone(id) ? id : "UTC";
}

bool isTimeZone(const std::string& timeZone) {
    return findZone(timeZone) != nullptr;
}

int utcOffset(std::int64_t instant, const std::string& timeZone) {
    const auto* zone = zoneOf(timeZone);
    return zone ? static_cast<int>(zone->get_info(toLibrary(instant)).offset.count()) : 0;
}

std::optional<std::int64_t> nextOffsetChange(std::int64_t after, const std::string& timeZone) {
    const auto* zone = zoneOf(timeZone);
    if (!zone)
        return std::nullopt;
    auto info = zone->get_info(toLibrary(after));
    const auto offset = info.offset;
    // A zone may also change its name alone.
    while (info.offset == offset) {
        if (info.end >= LATEST || info.end <= info.begin)
            return std::nullopt;
        const auto next = zone->get_info(info.end);
        if (next.begin < info.end)
            return std::nullopt;
        info = next;
    }
    return info.begin.time_since_epoch().count();
}

CivilTime toCivil(std::int64_t instant, const std::string& timeZone) {
    const auto reading = toLibrary(instant) + seconds(utcOffset(instant, timeZone));
    const auto days = date::floor<date::days>(reading);
    const auto second = static_cast<int>((reading - days).count());
    return {fromLibrary(days), second / 3600, second / 60 % 60, second % 60};
}

std::int64_t toInstant(const CivilTime& civil, const std::string& timeZone) {
    return instantIn(zoneOf(timeZone), civil);
}

CivilDate addDays(const CivilDate& date, int days) {
    return fromLibrary(toLibrary(date) + date::days(days));
}

int weekdayOf(const CivilDate& date) {
    return static_cast<int>(date::weekday(toLibrary(date)).c_encoding());
}

std::optional<std::int64_t> nextRing(const RingRule& rule, std::int64_t now,
                                     const std::string& timeZone) {
    const auto* zone = zoneOf(timeZone);
    const auto ringOn = [&](const CivilDate& date) {
        return instantIn(zone, {date, rule.hour, rule.minute, 0});
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

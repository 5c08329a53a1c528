#define LOG_TAG "clock-common"
#include "clock/ClockIcuDataModel.h"

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <unicode/calendar.h>
#include <unicode/dtptngen.h>
#include <unicode/simpletz.h>
#include <unicode/smpdtfmt.h>

#include <base/CivilTime.h>
#include <base/Log.h>
#include <base/MessageLocale.h>
#include <base/ScreenLocale.h>
#include <base/Text.h>

namespace {

// Enough for every language and skeleton of a session; a limit for those who count up skeletons.
constexpr std::size_t MOST_FORMATS = 64;

using FormatKey = std::pair<std::string, std::string>;

/** The format of a skeleton in a locale; null when ICU refuses. */
icu::SimpleDateFormat* findFormat(const std::string& locale, const std::string& skeleton) {
    static std::map<FormatKey, std::unique_ptr<icu::SimpleDateFormat>> formats;
    const FormatKey key(locale, skeleton);
    if (const auto known = formats.find(key); known != formats.end())
        return known->second.get();

    UErrorCode status = U_ZERO_ERROR;
    const icu::Locale icuLocale = base::screenLocale(icu::Locale(locale.c_str()));
    const std::unique_ptr<icu::DateTimePatternGenerator> generator(
        icu::DateTimePatternGenerator::createInstance(icuLocale, status));
    if (U_FAILURE(status) || !generator)
        return nullptr;
    const auto pattern = generator->getBestPattern(icu::UnicodeString::fromUTF8(skeleton), status);
    if (U_FAILURE(status) || pattern.isEmpty())
        return nullptr;
    auto format = std::make_unique<icu::SimpleDateFormat>(pattern, icuLocale, status);
    if (U_FAILURE(status))
        return nullptr;
    if (formats.size() >= MOST_FORMATS)
        formats.clear();
    return (formats[key] = std::move(format)).get();
}

/**
 * The zone as ICU knows it, or with the offset of the C library's newer data where they disagree:
 * the text must show what the clock shows.
 */
std::unique_ptr<icu::TimeZone> icuZone(std::time_t instant, const std::string& timeZone) {
    const auto offset = base::utcOffset(instant, timeZone) * 1000;
    std::unique_ptr<icu::TimeZone> zone(
        icu::TimeZone::createTimeZone(icu::UnicodeString::fromUTF8(timeZone)));
    UErrorCode status = U_ZERO_ERROR;
    std::int32_t standard = 0;
    std::int32_t summer = 0;
    zone->getOffset(static_cast<UDate>(instant) * 1000, false, standard, summer, status);
    if (U_SUCCESS(status) && standard + summer == offset)
        return zone;
    return std::make_unique<icu::SimpleTimeZone>(offset, icu::UnicodeString::fromUTF8(timeZone));
}

bool isUsable(const void* value, const char* name) {
    if (!value)
        LOG_ERROR("%s is NULL !!", name);
    return value != nullptr;
}

} // namespace

char* ClockIcuDataModel::getCurrentTimeZone() {
    char* copy = strdup(base::currentTimeZone().c_str());
    if (!copy)
        std::abort(); // The contract knows no failure, and the callers pass the text on unseen.
    return copy;
}

std::time_t ClockIcuDataModel::verifyExistingTimeForDst(const ClockAlarmDbData& alarm) {
    const auto zone = base::currentTimeZone();
    const auto today = base::toCivil(std::time(nullptr), zone).date;
    return base::toInstant({today, alarm.hour, alarm.min, 0}, zone);
}

bool ClockIcuDataModel::getFormattedDateString(std::time_t instant, char* buffer, int size,
                                               const char* locale, const char* skeleton,
                                               const char* timeZone) {
    if (!isUsable(buffer, "buffer"))
        return false;
    if (size <= 0) {
        LOG_ERROR("size is %d", size);
        return false;
    }
    buffer[0] = '\0';
    if (!isUsable(skeleton, "skeleton"))
        return false;
    const std::string zone = timeZone ? timeZone : base::currentTimeZone();
    if (!base::isTimeZone(zone)) {
        LOG_ERROR("there is no time zone %s", zone.c_str());
        return false;
    }
    const std::string usedLocale = locale ? locale : getCurrentLocale();
    auto* format = findFormat(usedLocale, skeleton);
    if (!format) {
        LOG_ERROR("no date format %s in %s", skeleton, usedLocale.c_str());
        return false;
    }
    format->adoptTimeZone(icuZone(instant, zone).release());
    icu::UnicodeString text;
    format->format(static_cast<UDate>(instant) * 1000, text);
    std::string utf8;
    text.toUTF8String(utf8);
    base::copyUtf8(buffer, static_cast<std::size_t>(size), utf8);
    return true;
}

int ClockIcuDataModel::getFirstDayOfWeek() {
    UErrorCode status = U_ZERO_ERROR;
    const std::unique_ptr<icu::Calendar> calendar(
        icu::Calendar::createInstance(icu::Locale(getCurrentLocale()), status));
    const int day = calendar && U_SUCCESS(status) ? calendar->getFirstDayOfWeek(status) : -1;
    if (U_SUCCESS(status) && day > 0)
        return day;
    LOG_ERROR("no calendar in %s: %s", getCurrentLocale(), u_errorName(status));
    return -1;
}

const char* ClockIcuDataModel::getCurrentLocale() {
    // Every name stays valid: callers keep the pointer across a change of language.
    static std::set<std::string> names;
    return names.insert(base::messageLocale()).first->c_str();
}

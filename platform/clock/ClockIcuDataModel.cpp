#define LOG_TAG "clock-common"
#include "clock/ClockIcuDataModel.h"

#include <algorithm>
#include <clocale>
#include <cstdlib>
#include <cstring>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <string_view>
#include <unicode/calendar.h>
#include <unicode/dtptngen.h>
#include <unicode/simpletz.h>
#include <unicode/smpdtfmt.h>

#include <base/CivilTime.h>
#include <base/Log.h>
#include <base/Text.h>

namespace {

// Enough for every language and skeleton of a session; a limit for those who count up skeletons.
constexpr std::size_t MOST_FORMATS = 64;

using FormatKey = std::pair<std::string, std::string>;

bool isUntranslated(std::string_view locale) {
    return locale.empty() || locale == "C" || locale == "POSIX" || locale.starts_with("C.");
}

/** The entry of LANGUAGE that is asked first; empty when it names none. */
std::string preferredLanguage() {
    const char* list = std::getenv("LANGUAGE");
    std::string_view rest = list ? list : "";
    while (rest.starts_with(':'))
        rest.remove_prefix(1);
    return std::string(rest.substr(0, rest.find(':')));
}

std::string_view languageOf(std::string_view locale) {
    return locale.substr(0, locale.find_first_of("_.@"));
}

/** The name of the locale in which gettext looks for texts. */
std::string messageLocale() {
    const char* name = std::setlocale(LC_MESSAGES, nullptr);
    std::string locale = name ? name : "C";
    // As gettext does: the plain "C" locale turns translation off altogether.
    if (locale == "C" || locale == "POSIX")
        return locale;
    auto preferred = preferredLanguage();
    // "en" asks for the texts; the locale then still knows the country.
    if (preferred.empty() ||
        (preferred == languageOf(preferred) && preferred == languageOf(locale)))
        return locale;
    return preferred;
}

/** "sr_RS.UTF-8@latin" becomes "sr_Latn_RS". */
std::string icuLocale(std::string_view name) {
    if (isUntranslated(name))
        return "en";
    const auto at = name.find('@');
    const auto modifier = at == std::string_view::npos ? std::string_view() : name.substr(at + 1);
    const auto plain = name.substr(0, name.find_first_of(".@"));
    std::string locale(languageOf(plain));
    if (modifier == "latin")
        locale += "_Latn";
    else if (modifier == "cyrillic")
        locale += "_Cyrl";
    return locale + std::string(plain.substr(languageOf(plain).size()));
}

/** The format of a skeleton in a locale; null when ICU refuses. */
icu::SimpleDateFormat* findFormat(const std::string& locale, const std::string& skeleton) {
    static std::map<FormatKey, std::unique_ptr<icu::SimpleDateFormat>> formats;
    const FormatKey key(locale, skeleton);
    if (const auto known = formats.find(key); known != formats.end())
        return known->second.get();

    UErrorCode status = U_ZERO_ERROR;
    const icu::Locale icuLocale(locale.c_str());
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
    return names.insert(icuLocale(messageLocale())).first->c_str();
}

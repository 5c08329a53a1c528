#include "CalendarTexts.h"

#include <algorithm>
#include <array>
#include <cstring>
#include <ctime>
#include <memory>
#include <string>

#include <Elementary.h>
#include <unicode/dtfmtsym.h>
#include <unicode/dtptngen.h>
#include <unicode/gregocal.h>
#include <unicode/smpdtfmt.h>

#include "base/MessageLocale.h"
#include "base/ScreenLocale.h"

namespace host {

namespace {

constexpr int DAYS = 7;
// More letters do not fit above a column of days.
constexpr int MOST_LETTERS = 4;

icu::Locale language() {
    icu::Locale locale = base::screenLocale(icu::Locale(base::messageLocale().c_str()));
    UErrorCode status = U_ZERO_ERROR;
    locale.setKeywordValue("calendar", "gregorian", status);
    return locale;
}

std::string utf8(const icu::UnicodeString& text) {
    std::string result;
    text.toUTF8String(result);
    return result;
}

/** Signs that stand above, below or around a letter are none. */
int letters(const icu::UnicodeString& text) {
    int count = 0;
    for (int32_t at = 0; at < text.length(); at = text.moveIndex32(at, 1))
        count += (U_GET_GC_MASK(text.char32At(at)) & U_GC_M_MASK) == 0;
    return count;
}

using DayNames = std::array<icu::UnicodeString, DAYS>;

DayNames dayNames(icu::DateFormatSymbols::DtWidthType width) {
    UErrorCode status = U_ZERO_ERROR;
    const icu::DateFormatSymbols symbols(language(), status);
    int32_t count = 0;
    // The first place of the list belongs to no day.
    const icu::UnicodeString* names =
        symbols.getWeekdays(count, icu::DateFormatSymbols::STANDALONE, width);
    DayNames result;
    for (int day = 0; day < DAYS && day + 1 < count; ++day) {
        result.at(static_cast<std::size_t>(day)) = names[day + 1];
        if (names[day + 1].endsWith(u'.'))
            result.at(static_cast<std::size_t>(day)).truncate(names[day + 1].length() - 1);
    }
    return result;
}

/** The longest names that fit. */
DayNames fittingDayNames() {
    for (const auto width : {icu::DateFormatSymbols::ABBREVIATED, icu::DateFormatSymbols::SHORT}) {
        DayNames names = dayNames(width);
        if (std::ranges::all_of(names,
                                [](const auto& name) { return letters(name) <= MOST_LETTERS; }))
            return names;
    }
    return dayNames(icu::DateFormatSymbols::NARROW);
}

/** A day, or what a skeleton asks of it, as the language writes it; empty on failure. */
std::string written(const std::tm& day, const char16_t* skeleton) {
    UErrorCode status = U_ZERO_ERROR;
    const icu::Locale locale = language();
    const std::unique_ptr<icu::DateTimePatternGenerator> generator(
        icu::DateTimePatternGenerator::createInstance(locale, status));
    if (U_FAILURE(status))
        return "";
    const icu::UnicodeString pattern = generator->getBestPattern(skeleton, status);
    icu::SimpleDateFormat format(pattern, locale, status);
    icu::GregorianCalendar calendar(*icu::TimeZone::getGMT(), status);
    calendar.set(day.tm_year + 1900, day.tm_mon, day.tm_mday, 12, 0);
    format.setTimeZone(*icu::TimeZone::getGMT());
    icu::UnicodeString text;
    format.format(calendar.getTime(status), text);
    return U_SUCCESS(status) ? utf8(text) : "";
}

/** @return Text for the toolkit to free; null on failure. */
char* monthText(std::tm* month) {
    std::tm first = *month;
    first.tm_mday = 1;
    const std::string text = written(first, u"yMMMM");
    return text.empty() ? nullptr : strdup(text.c_str());
}

void writeTexts(void*, Evas_Object* calendar, void*) {
    std::array<std::string, DAYS> names;
    std::array<const char*, DAYS> pointers{};
    const DayNames days = fittingDayNames();
    for (std::size_t day = 0; day < DAYS; ++day) {
        names.at(day) = utf8(days.at(day));
        pointers.at(day) = names.at(day).c_str();
    }
    elm_calendar_weekdays_names_set(calendar, pointers.data());
    elm_calendar_format_function_set(calendar, monthText);
}

} // namespace

std::string dayText(const std::tm& day) {
    return written(day, u"yMMMMEEEEd");
}

void followLanguageInCalendar(Evas_Object* calendar) {
    writeTexts(nullptr, calendar, nullptr);
    evas_object_smart_callback_add(calendar, "language,changed", writeTexts, nullptr);
}

} // namespace host

#include "TimeTexts.h"

#include <map>
#include <memory>

#include <unicode/dtfmtsym.h>
#include <unicode/dtptngen.h>
#include <unicode/locid.h>
#include <unicode/numsys.h>

#include "base/ScreenLocale.h"

namespace host {

namespace {

std::string utf8(const icu::UnicodeString& text) {
    std::string result;
    text.toUTF8String(result);
    return result;
}

void setDigits(TimeTexts& texts, const icu::Locale& locale) {
    UErrorCode status = U_ZERO_ERROR;
    const std::unique_ptr<icu::NumberingSystem> system(
        icu::NumberingSystem::createInstance(locale, status));
    icu::UnicodeString digits = UNICODE_STRING_SIMPLE("0123456789");
    if (U_SUCCESS(status) && !system->isAlgorithmic() && system->getRadix() == 10 &&
        system->getDescription().countChar32() == 10)
        digits = system->getDescription();
    for (int digit = 0; digit < 10; ++digit) {
        const int start = digits.moveIndex32(0, digit);
        texts.digits[static_cast<std::size_t>(digit)] =
            utf8(icu::UnicodeString(digits.char32At(start)));
    }
}

void setHalves(TimeTexts& texts, const icu::Locale& locale) {
    texts.am = "AM";
    texts.pm = "PM";
    UErrorCode status = U_ZERO_ERROR;
    const icu::DateFormatSymbols symbols(locale, status);
    int32_t count = 0;
    const icu::UnicodeString* names = U_SUCCESS(status) ? symbols.getAmPmStrings(count) : nullptr;
    if (count < 2)
        return;
    texts.am = utf8(names[0]);
    texts.pm = utf8(names[1]);
}

void setPattern(TimeTexts& texts, const icu::Locale& locale) {
    UErrorCode status = U_ZERO_ERROR;
    const std::unique_ptr<icu::DateTimePatternGenerator> generator(
        icu::DateTimePatternGenerator::createInstance(locale, status));
    if (U_FAILURE(status))
        return;
    const icu::UnicodeString pattern =
        generator->getBestPattern(UNICODE_STRING_SIMPLE("hmma"), status);
    const int half = std::max(pattern.indexOf(u'a'), pattern.indexOf(u'B'));
    const int hour = std::max(pattern.indexOf(u'h'), pattern.indexOf(u'K'));
    const bool writtenFirst = half >= 0 && hour >= 0 && half < hour;
    // Where text runs to the left, what is written first is on the right.
    texts.halfFirst = writtenFirst != static_cast<bool>(locale.isRightToLeft());
    texts.hour = utf8(generator->getFieldDisplayName(UDATPG_HOUR_FIELD, UDATPG_WIDE));
    texts.minute = utf8(generator->getFieldDisplayName(UDATPG_MINUTE_FIELD, UDATPG_WIDE));
    texts.half = utf8(generator->getFieldDisplayName(UDATPG_DAYPERIOD_FIELD, UDATPG_WIDE));
}

} // namespace

std::string TimeTexts::number(int value, int width) const {
    std::string plain = std::to_string(value);
    if (static_cast<int>(plain.size()) < width)
        plain.insert(0, static_cast<std::size_t>(width) - plain.size(), '0');
    std::string result;
    for (const char digit : plain)
        result += digits[static_cast<std::size_t>(digit - '0')];
    return result;
}

std::vector<std::string> TimeTexts::hours(bool is24Hours) const {
    const int count = is24Hours ? 24 : 12;
    std::vector<std::string> result;
    result.reserve(static_cast<std::size_t>(count));
    for (int hour = 0; hour < count; ++hour)
        result.push_back(is24Hours ? number(hour, 2) : number(hour == 0 ? 12 : hour, 1));
    return result;
}

std::vector<std::string> TimeTexts::minutes() const {
    std::vector<std::string> result;
    result.reserve(60);
    for (int minute = 0; minute < 60; ++minute)
        result.push_back(number(minute, 2));
    return result;
}

const TimeTexts& timeTextsOf(const char* locale) {
    const icu::Locale icuLocale = base::screenLocale(
        locale && *locale ? icu::Locale::createCanonical(locale) : icu::Locale::getDefault());
    // A device speaks few languages, and a picker is made many times over.
    static std::map<std::string, TimeTexts> known;
    const auto [entry, isNew] = known.try_emplace(icuLocale.getName());
    TimeTexts& texts = entry->second;
    if (!isNew)
        return texts;
    setDigits(texts, icuLocale);
    setHalves(texts, icuLocale);
    setPattern(texts, icuLocale);
    return texts;
}

} // namespace host

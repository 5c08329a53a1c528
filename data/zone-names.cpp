/**
 * @file
 * @brief Tells what time zones are called after their best-known city.
 *
 * usage: zone-names ZONE... < LANGUAGES
 *
 * Reads names of languages, one per line, as catalogues are named ("sr@latin"), and prints a line
 * "language TAB zone TAB name" for each zone whose name the language knows.
 */
#include <iostream>
#include <memory>
#include <string>

#include <unicode/locid.h>
#include <unicode/tznames.h>
#include <unicode/uloc.h>

namespace {

/** The library's name of a catalogue's language; empty for a variant that it does not know. */
std::string localeOf(const std::string& language) {
    const auto at = language.find('@');
    if (at == std::string::npos)
        return language;
    if (language.substr(at) == "@latin")
        return language.substr(0, at) + "_Latn";
    return "";
}

/** For languages that it lacks the library would answer in another one. */
bool isKnown(const icu::Locale& locale) {
    const auto hasTexts = [](const std::string& name) {
        for (int32_t i = 0; i < uloc_countAvailable(); ++i) {
            if (name == uloc_getAvailable(i))
                return true;
        }
        return false;
    };
    const std::string script = locale.getScript();
    return hasTexts(script.empty() ? locale.getLanguage() : locale.getLanguage() + ("_" + script));
}

void printNames(const std::string& language, int count, char** zones) {
    const icu::Locale locale(localeOf(language).c_str());
    if (localeOf(language).empty() || !isKnown(locale))
        return;
    UErrorCode status = U_ZERO_ERROR;
    const std::unique_ptr<icu::TimeZoneNames> names(
        icu::TimeZoneNames::createInstance(locale, status));
    if (U_FAILURE(status))
        return;
    for (int i = 0; i < count; ++i) {
        icu::UnicodeString name;
        names->getExemplarLocationName(icu::UnicodeString::fromUTF8(zones[i]), name);
        std::string text;
        if (!name.isBogus() && !name.isEmpty())
            std::cout << language << '\t' << zones[i] << '\t' << name.toUTF8String(text) << '\n';
    }
}

} // namespace

int main(int argc, char** argv) {
    for (std::string language; std::getline(std::cin, language);)
        printNames(language, argc - 1, argv + 1);
    return std::cout.flush() ? 0 : 1;
}

#include "Language.h"

#include <algorithm>
#include <cctype>
#include <clocale>
#include <cstdlib>
#include <memory>
#include <string_view>

#include <Elementary.h>
#include <libintl.h>
#include <unicode/uloc.h>

#include "base/MessageLocale.h"
#include "device/vconf.h"
#include "device_settings.h"
#include "widgets/Faces.h"
#include "widgets/FontLanguage.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace host {

namespace {

constexpr const char* textDomain = "clock";
constexpr const char* anyText = "IDS_COM_BODY_ALARM";
constexpr const char* neutralLocale = "C.UTF-8";
constexpr const char* languageKey = DEVICE_SETTING_LANGUAGE;
constexpr const char* languageVariable = "CLOCK_LANGUAGE";

/** What the device has made of LANGUAGE, and from what. */
struct Spoken {
    std::string environment; ///< LANGUAGE as the device found it.
    std::string languages;   ///< LANGUAGE as the device has set it.
    std::string setting;
};

Spoken& spoken() {
    static Spoken instance;
    return instance;
}

std::string variable(const char* name) {
    const char* value = std::getenv(name);
    return value ? value : "";
}

/** In the plain C locale texts are not translated at all, not even into English. */
bool isPlainC(const char* locale) {
    const std::string_view name = locale ? locale : "C";
    return name == "C" || name == "POSIX";
}

bool names(std::string_view languages, std::string_view wanted) {
    for (std::size_t start = 0; start <= languages.size();) {
        const std::size_t end = std::min(languages.find(':', start), languages.size());
        if (languages.substr(start, end - start) == wanted)
            return true;
        start = end + 1;
    }
    return false;
}

std::string withEnglish(std::string languages) {
    if (languages.empty() && !isPlainC(setlocale(LC_MESSAGES, nullptr)))
        languages = setlocale(LC_MESSAGES, nullptr);
    if (languages == neutralLocale)
        languages.clear();
    if (!names(languages, "en"))
        languages += languages.empty() ? "en" : ":en";
    return languages;
}

/** Nothing that could lead out of the folder of catalogues. */
bool isCode(std::string_view text) {
    return !text.empty() && std::ranges::all_of(text, [](unsigned char letter) {
        return std::isalnum(letter) || letter == '_' || letter == '@' || letter == '.' ||
               letter == '-';
    });
}

/** Asks gettext alone: of many languages there are names of cities, but no texts. */
bool hasTexts(const std::string& code) {
    if (!isCode(code))
        return false;
    const std::string languages = variable("LANGUAGE");
    setenv("LANGUAGE", code.c_str(), 1);
    // Naming the domain again makes gettext forget what it has found so far.
    textdomain(textDomain);
    const bool found = std::string_view(dgettext(textDomain, anyText)) != anyText;
    setenv("LANGUAGE", languages.c_str(), 1);
    textdomain(textDomain);
    return found;
}

std::string languageSetting() {
    const std::unique_ptr<char, decltype(&std::free)> text(vconf_get_str(languageKey), &std::free);
    return text ? text.get() : "";
}

std::string wantedLanguages() {
    std::string code = variable(languageVariable);
    if (code.empty())
        code = spoken().setting;
    if (code.empty())
        return withEnglish(spoken().environment);
    if (hasTexts(code))
        return withEnglish(code);
    LOG_WARNING("There are no texts in the language \"%s\", they stay English", code.c_str());
    return "en";
}

void speak() {
    spoken().languages = wantedLanguages();
    setenv("LANGUAGE", spoken().languages.c_str(), 1);
    textdomain(textDomain);
    UErrorCode status = U_ZERO_ERROR;
    uloc_setDefault(base::messageLocale().c_str(), &status);
}

/** A language without texts is written as those that stand in for it: from the left. */
bool runsToTheLeft() {
    const std::string locale = base::messageLocale();
    return hasTexts(locale) && uloc_isRightToLeft(locale.c_str());
}

void tellToolkit() {
    turnFaces(runsToTheLeft());
    setFontLanguage(base::messageLocale());
    elm_language_set(setlocale(LC_MESSAGES, nullptr));
    // The toolkit has taken that for every kind of locale.
    applyLocale();
    readFacesAgain();
}

void languageChangedCb(keynode_t*, void*) {
    const std::string setting = languageSetting();
    // A choice ends what this run was started in, also when it is that of the setting.
    if (setting == spoken().setting && variable(languageVariable).empty())
        return;
    spoken().setting = setting;
    setenv(languageVariable, "", 1);
    speak();
    tellToolkit();
}

} // namespace

void applyLocale() {
    if (isPlainC(setlocale(LC_ALL, "")))
        setlocale(LC_ALL, neutralLocale);
    for (const int category : {LC_CTYPE, LC_MESSAGES}) {
        if (isPlainC(setlocale(category, nullptr)) && !setlocale(category, neutralLocale))
            LOG_WARNING("The locale %s is missing, texts stay untranslated", neutralLocale);
    }
}

void bindTexts(const std::string& catalogues) {
    bindtextdomain(textDomain, catalogues.c_str());
    bind_textdomain_codeset(textDomain, "UTF-8");
    spoken().environment = environmentLanguages();
    spoken().setting = languageSetting();
    speak();
}

void followLanguage() {
    elm_config_mirrored_set(runsToTheLeft());
    setFontLanguage(base::messageLocale());
    if (vconf_notify_key_changed(languageKey, languageChangedCb, nullptr) != VCONF_OK)
        LOG_WARNING("A change of the language will not be seen");
}

std::string environmentLanguages() {
    const std::string languages = variable("LANGUAGE");
    return languages == spoken().languages ? spoken().environment : languages;
}

void forgetLanguage() {
    setenv("LANGUAGE", environmentLanguages().c_str(), 1);
    spoken() = {};
}

} // namespace host

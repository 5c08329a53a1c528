#include "Language.h"

#include <clocale>
#include <cstdlib>
#include <string_view>

#include <libintl.h>

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace host {

namespace {

constexpr const char* textDomain = "clock";
constexpr const char* neutralLocale = "C.UTF-8";

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

void addEnglish() {
    const char* chosen = std::getenv("LANGUAGE");
    std::string languages = chosen ? chosen : "";
    if (languages.empty() && !isPlainC(setlocale(LC_MESSAGES, nullptr)))
        languages = setlocale(LC_MESSAGES, nullptr);
    if (languages == neutralLocale)
        languages.clear();
    if (!names(languages, "en"))
        languages += languages.empty() ? "en" : ":en";
    setenv("LANGUAGE", languages.c_str(), 1);
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
    addEnglish();
    bindtextdomain(textDomain, catalogues.c_str());
    bind_textdomain_codeset(textDomain, "UTF-8");
    textdomain(textDomain);
}

} // namespace host

#include "base/MessageLocale.h"

#include <clocale>
#include <cstdlib>
#include <string_view>

namespace base {

namespace {

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
std::string systemName() {
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

} // namespace

std::string messageLocale() {
    const std::string name = systemName();
    if (isUntranslated(name))
        return "en";
    const auto at = name.find('@');
    const auto modifier = at == std::string::npos ? std::string() : name.substr(at + 1);
    // "sr_RS.UTF-8@latin" becomes "sr_Latn_RS".
    const auto plain = name.substr(0, name.find_first_of(".@"));
    std::string locale(languageOf(plain));
    if (modifier == "latin")
        locale += "_Latn";
    else if (modifier == "cyrillic")
        locale += "_Cyrl";
    return locale + plain.substr(languageOf(plain).size());
}

} // namespace base

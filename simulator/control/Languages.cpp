#include "Languages.h"

#include <algorithm>

namespace simulator {
namespace {

const Language* findCode(const std::string& code) {
    const auto* row = std::find_if(LANGUAGES.begin(), LANGUAGES.end(),
                                   [&code](const Language& row) { return code == row.code; });
    return row == LANGUAGES.end() ? nullptr : row;
}

} // namespace

const Language* languageOf(const std::string& locale) {
    if (const Language* exact = findCode(locale.substr(0, locale.find_first_of(".@"))))
        return exact;
    return findCode(locale.substr(0, locale.find_first_of("_.@")));
}

} // namespace simulator

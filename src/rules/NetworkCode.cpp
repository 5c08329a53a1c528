#include "rules/NetworkCode.h"

#include <algorithm>
#include <string_view>

namespace rules {

namespace {

constexpr std::size_t CODE_LENGTH = 3;

} // namespace

bool isMccValueMatched(const char* code, const char* list) {
    const std::string_view wanted = code ? code : "";
    std::string_view rest = list ? list : "";
    if (rest.size() == CODE_LENGTH && rest != wanted)
        return false;
    // Between two spaces there is no code, not even an empty one.
    while (!rest.empty()) {
        const auto end = std::min(rest.find(' '), rest.size());
        if (end > 0 && rest.substr(0, end) == wanted)
            return true;
        rest.remove_prefix(std::min(end + 1, rest.size()));
    }
    return false;
}

} // namespace rules

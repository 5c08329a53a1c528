#include "rules/ToneName.h"

#include <algorithm>
#include <cstdlib>
#include <limits>
#include <optional>

#include <base/Text.h>

namespace rules {

namespace {

constexpr std::size_t MAX_FILE_NAME_BYTES = 511;
constexpr int DECIMAL = 10;

std::optional<std::size_t> lastAfterFirst(std::string_view text, char wanted) {
    const auto place = text.rfind(wanted);
    return place == std::string_view::npos || place == 0 ? std::nullopt : std::optional(place);
}

} // namespace

std::string toneFileName(std::string_view path) {
    const auto slash = lastAfterFirst(path, '/');
    const auto file = base::cutUtf8(slash ? path.substr(*slash + 1) : path, MAX_FILE_NAME_BYTES);
    const auto dot = lastAfterFirst(file, '.');
    return std::string(dot ? file.substr(0, *dot) : file);
}

std::int32_t tonePosition(const std::string& text) {
    using Range = std::numeric_limits<std::int32_t>;
    const long position = std::strtol(text.c_str(), nullptr, DECIMAL);
    return static_cast<std::int32_t>(std::clamp<long>(position, Range::min(), Range::max()));
}

} // namespace rules

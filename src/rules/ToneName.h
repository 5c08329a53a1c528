// The name under which a tone is shown, and its place in the tone picker's list.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace rules {

// A tone file's name without folder and extension, in at most 511 bytes. A slash or a dot at the
// very beginning is part of the name.
std::string toneFileName(std::string_view path);

// The tone's place from the picker's text: its leading digits, brought into range; 0 for a text
// that is not a number.
std::int32_t tonePosition(const std::string& text);

} // namespace rules

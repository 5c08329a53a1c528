#include "ReaderKeyRules.h"

#include <Ecore_Input.h>

namespace host {

namespace {

struct ModifierBit {
    unsigned toolkit;
    unsigned reader;
};

constexpr ModifierBit MODIFIER_BITS[] = {
    {ECORE_EVENT_MODIFIER_SHIFT, 0}, {ECORE_EVENT_MODIFIER_CAPS, 1},
    {ECORE_EVENT_MODIFIER_CTRL, 2},  {ECORE_EVENT_MODIFIER_ALT, 3},
    {ECORE_EVENT_MODIFIER_WIN, 5},   {ECORE_EVENT_MODIFIER_ALTGR, 6},
    {ECORE_EVENT_MODIFIER_NUM, 14},
};

} // namespace

std::int16_t readerModifiers(unsigned modifiers) {
    unsigned bits = 0;
    for (const ModifierBit& bit : MODIFIER_BITS)
        if (modifiers & bit.toolkit)
            bits |= 1U << bit.reader;
    return static_cast<std::int16_t>(bits);
}

bool isReadable(const char* text) {
    constexpr unsigned char FIRST_PRINTABLE = 0x20;
    constexpr unsigned char DELETE = 0x7f;
    const unsigned char first = text ? static_cast<unsigned char>(*text) : 0;
    return first >= FIRST_PRINTABLE && first != DELETE;
}

} // namespace host

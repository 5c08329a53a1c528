#include "base/Text.h"

#include <algorithm>
#include <cstring>
#include <optional>

namespace base {

namespace {

// Wider than any display; a catalogue that asks for more is not to be trusted.
constexpr std::size_t WIDEST_FIELD = 99;

bool isContinuation(char byte) {
    return (static_cast<unsigned char>(byte) & 0xc0U) == 0x80U;
}

std::size_t sequenceLength(char lead) {
    const auto byte = static_cast<unsigned char>(lead);
    if (byte >= 0xf0U)
        return 4;
    if (byte >= 0xe0U)
        return 3;
    return byte >= 0xc0U ? 2 : 1;
}

std::size_t countCharacters(std::string_view text) {
    return text.size() -
           static_cast<std::size_t>(std::count_if(text.begin(), text.end(), isContinuation));
}

/** One conversion of a format, after its percent sign. */
struct Conversion {
    std::size_t position = 0; ///< From 1; 0 = the next argument.
    bool left = false;
    bool zeros = false;
    bool plus = false;
    bool space = false;
    std::size_t width = 0;
    char type = '\0';
};

std::optional<std::size_t> readNumber(std::string_view& rest) {
    std::size_t value = 0;
    std::size_t digits = 0;
    while (digits < rest.size() && rest[digits] >= '0' && rest[digits] <= '9') {
        value =
            std::min(value * 10 + static_cast<std::size_t>(rest[digits] - '0'), WIDEST_FIELD + 1);
        ++digits;
    }
    rest.remove_prefix(digits);
    return digits == 0 ? std::nullopt : std::optional(value);
}

bool readPosition(std::string_view& rest, Conversion& conversion) {
    auto ahead = rest;
    const auto number = readNumber(ahead);
    if (!number || ahead.empty() || ahead.front() != '$')
        return true;
    conversion.position = *number;
    ahead.remove_prefix(1);
    rest = ahead;
    return conversion.position > 0;
}

void readFlags(std::string_view& rest, Conversion& conversion) {
    for (; !rest.empty(); rest.remove_prefix(1)) {
        switch (rest.front()) {
        case '-':
            conversion.left = true;
            break;
        case '0':
            conversion.zeros = true;
            break;
        case '+':
            conversion.plus = true;
            break;
        case ' ':
            conversion.space = true;
            break;
        default:
            return;
        }
    }
}

std::optional<Conversion> readConversion(std::string_view& rest) {
    Conversion conversion;
    if (!readPosition(rest, conversion))
        return std::nullopt;
    readFlags(rest, conversion);
    conversion.width = readNumber(rest).value_or(0);
    if (conversion.width > WIDEST_FIELD || rest.empty())
        return std::nullopt;
    conversion.type = rest.front();
    rest.remove_prefix(1);
    return conversion;
}

std::string formatInteger(const Conversion& conversion, int value) {
    std::string digits = std::to_string(value);
    std::string sign;
    if (value < 0) {
        sign = "-";
        digits.erase(0, 1);
    } else if (conversion.plus) {
        sign = "+";
    } else if (conversion.space) {
        sign = " ";
    }
    const auto length = sign.size() + digits.size();
    if (conversion.zeros && !conversion.left && length < conversion.width)
        digits.insert(0, conversion.width - length, '0');
    return sign + digits;
}

/** Builds the text of a translation; gives up where the translation disagrees. */
class Formatter {
public:
    explicit Formatter(const std::vector<FormatArgument>& arguments)
        : _arguments(arguments), _used(arguments.size(), false) {}

    std::optional<std::string> format(std::string_view rest) {
        while (!rest.empty()) {
            const auto percent = std::min(rest.find('%'), rest.size());
            _result.append(rest.substr(0, percent));
            rest.remove_prefix(percent);
            if (!rest.empty() && !appendConversion(rest))
                return std::nullopt;
        }
        const bool allUsed = std::find(_used.begin(), _used.end(), false) == _used.end();
        return allUsed ? std::optional(_result) : std::nullopt;
    }

private:
    bool appendConversion(std::string_view& rest) {
        rest.remove_prefix(1);
        if (rest.starts_with('%')) {
            _result += '%';
            rest.remove_prefix(1);
            return true;
        }
        const auto conversion = readConversion(rest);
        if (!conversion)
            return false;
        const auto* argument = argumentOf(*conversion);
        return argument && appendArgument(*conversion, *argument);
    }

    const FormatArgument* argumentOf(const Conversion& conversion) {
        const bool positional = conversion.position > 0;
        if (_positional && *_positional != positional)
            return nullptr;
        _positional = positional;
        const auto index = positional ? conversion.position - 1 : _next++;
        if (index >= _arguments.size())
            return nullptr;
        _used[index] = true;
        return &_arguments[index];
    }

    bool appendArgument(const Conversion& conversion, const FormatArgument& argument) {
        const auto* number = std::get_if<int>(&argument);
        const auto* text = std::get_if<std::string>(&argument);
        if (number && (conversion.type == 'd' || conversion.type == 'i')) {
            appendPadded(conversion, formatInteger(conversion, *number));
            return true;
        }
        const bool numeric = conversion.zeros || conversion.plus || conversion.space;
        if (!text || conversion.type != 's' || numeric)
            return false;
        appendPadded(conversion, *text);
        return true;
    }

    void appendPadded(const Conversion& conversion, const std::string& text) {
        const auto length = countCharacters(text);
        const std::string blanks(conversion.width > length ? conversion.width - length : 0, ' ');
        _result += conversion.left ? text + blanks : blanks + text;
    }

    const std::vector<FormatArgument>& _arguments;
    std::vector<bool> _used;
    std::optional<bool> _positional;
    std::size_t _next = 0;
    std::string _result;
};

} // namespace

std::string_view cutUtf8(std::string_view text, std::size_t maxBytes) {
    if (text.size() <= maxBytes)
        return text;
    auto end = maxBytes;
    while (end > 0 && maxBytes - end < 3 && isContinuation(text[end]))
        --end;
    // Stray bytes belong to no sequence that could be spared.
    const bool insideSequence = end < maxBytes && sequenceLength(text[end]) > maxBytes - end;
    return text.substr(0, insideSequence ? end : maxBytes);
}

void copyUtf8(char* buffer, std::size_t size, std::string_view text) {
    if (!buffer || size == 0)
        return;
    const auto head = cutUtf8(text, size - 1);
    if (!head.empty())
        std::memcpy(buffer, head.data(), head.size());
    buffer[head.size()] = '\0';
}

std::string formatTranslation(std::string_view translation,
                              const std::vector<FormatArgument>& arguments, std::size_t maxBytes) {
    const auto formatted = Formatter(arguments).format(translation);
    return std::string(cutUtf8(formatted ? std::string_view(*formatted) : translation, maxBytes));
}

} // namespace base

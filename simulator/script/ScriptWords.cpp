#include "ScriptWords.h"

#include <cstdint>
#include <optional>

#include <unicode/utf8.h>

namespace simulator {

namespace {

bool isBlank(char c) {
    return c == ' ' || c == '\t' || c == '\r';
}

std::optional<char> escaped(char c) {
    switch (c) {
    case '"':
    case '\\':
        return c;
    case 'n':
        return '\n';
    case 't':
        return '\t';
    default:
        return std::nullopt;
    }
}

/** Takes one word off the front of a line. @return What is wrong, or an empty text. */
std::string takeQuoted(std::string_view& line, std::string& word) {
    line.remove_prefix(1);
    while (!line.empty()) {
        char c = line.front();
        line.remove_prefix(1);
        if (c == '"') {
            if (!line.empty() && !isBlank(line.front()))
                return "a blank is missing after a quoted text";
            return "";
        }
        if (c == '\\') {
            const auto meant = line.empty() ? std::nullopt : escaped(line.front());
            if (!meant)
                return R"(a \ in a quoted text needs one of " \ n t behind it)";
            c = *meant;
            line.remove_prefix(1);
        }
        word += c;
    }
    return "a quoted text has no end";
}

/** Where a text in single quotes ends; npos where the first one is but an apostrophe. */
std::size_t endOfSingleQuoted(std::string_view line) {
    std::size_t end = line.find('\'', 1);
    while (end != std::string_view::npos && end + 1 < line.size() && !isBlank(line[end + 1]))
        end = line.find('\'', end + 1);
    return end;
}

bool beginsSingleQuoted(std::string_view line) {
    return line.front() == '\'' && endOfSingleQuoted(line) != std::string_view::npos;
}

/** All in it stands for itself. */
std::string takeSingleQuoted(std::string_view& line, std::string& word) {
    const std::size_t end = endOfSingleQuoted(line);
    word = line.substr(1, end - 1);
    line.remove_prefix(end + 1);
    return "";
}

std::string takePlain(std::string_view& line, std::string& word) {
    while (!line.empty() && !isBlank(line.front())) {
        if (line.front() == '"')
            return "a quote in the middle of a word; put all of it in quotes";
        word += line.front();
        line.remove_prefix(1);
    }
    return "";
}

bool isUtf8(std::string_view text) {
    const auto size = static_cast<std::int32_t>(text.size());
    for (std::int32_t at = 0; at < size;) {
        UChar32 character = 0;
        U8_NEXT(text.data(), at, size, character);
        if (character < 0)
            return false;
    }
    return true;
}

std::string checkBytes(std::string_view line) {
    if (line.size() > SCRIPT_LINE_LIMIT)
        return "the line is longer than " + std::to_string(SCRIPT_LINE_LIMIT) + " bytes";
    if (line.find('\0') != std::string_view::npos)
        return "the line has a zero byte in it";
    return isUtf8(line) ? "" : "the line is not in UTF-8";
}

} // namespace

ScriptWords scriptWords(std::string_view line) {
    ScriptWords result;
    result.error = checkBytes(line);
    while (result.error.empty()) {
        while (!line.empty() && isBlank(line.front()))
            line.remove_prefix(1);
        if (line.empty() || line.front() == '#')
            break;
        std::string word;
        if (line.front() == '"')
            result.error = takeQuoted(line, word);
        else
            result.error =
                beginsSingleQuoted(line) ? takeSingleQuoted(line, word) : takePlain(line, word);
        result.words.push_back(std::move(word));
    }
    if (!result.error.empty())
        result.words.clear();
    return result;
}

} // namespace simulator

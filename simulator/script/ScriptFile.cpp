#include "ScriptFile.h"

#include <algorithm>

#include "Commands.h"
#include "ScriptWords.h"

namespace simulator {

namespace {

/** Of a script that is none, so many messages are enough. */
constexpr std::size_t MOST_ERRORS = 20;

bool isControl(char c) {
    return static_cast<unsigned char>(c) < ' ' || c == '\x7F';
}

void addLine(Script& script, int number, std::string_view line) {
    const ScriptWords parsed = scriptWords(line);
    const std::string command = parsed.words.empty() ? "" : parsed.words.front();
    std::string why = parsed.error;
    if (why.empty() && !parsed.words.empty())
        why = checkCommand(parsed.words);
    if (!why.empty())
        script.errors.push_back(scriptMessage(script.name, number, command, why));
    else if (!parsed.words.empty())
        script.lines.push_back({number, parsed.words});
}

} // namespace

std::string scriptMessage(const std::string& name, int line, const std::string& command,
                          const std::string& why) {
    std::string message = name + ":" + std::to_string(line) + ": ";
    if (!command.empty())
        message += command + ": ";
    message += why;
    std::replace_if(message.begin(), message.end(), isControl, ' ');
    return message;
}

Script parseScript(const std::string& name, std::string_view text) {
    constexpr std::string_view BYTE_ORDER_MARK = "\xEF\xBB\xBF";
    if (text.starts_with(BYTE_ORDER_MARK))
        text.remove_prefix(BYTE_ORDER_MARK.size());
    Script script;
    script.name = name;
    for (int number = 1; !text.empty() && script.errors.size() < MOST_ERRORS; ++number) {
        const std::size_t end = std::min(text.find('\n'), text.size());
        addLine(script, number, text.substr(0, end));
        text.remove_prefix(std::min(end + 1, text.size()));
    }
    return script;
}

} // namespace simulator

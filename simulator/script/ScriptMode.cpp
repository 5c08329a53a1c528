#include "ScriptMode.h"

#include <algorithm>
#include <cerrno>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <iterator>
#include <memory>
#include <optional>

#include "Commands.h"
#include "Recorder.h"
#include "RunningWatch.h"
#include "ScriptFile.h"
#include "ScriptRun.h"
#include "ScriptWords.h"
#include "WatchProcess.h"
#include "device_host.h"
#include "device_remote.h"

namespace fs = std::filesystem;

namespace simulator {

namespace {

/** Longest script in bytes. */
constexpr std::size_t SCRIPT_LIMIT = 1024UL * 1024;

int fail(const std::string& why) {
    std::fprintf(stderr, "clock-sim: %s\n", why.c_str());
    return EXIT_FAILURE;
}

std::optional<std::string> contentsOf(const std::string& file, std::string& why) {
    std::error_code ignored;
    errno = 0;
    std::ifstream stream(file, std::ios::binary);
    if (!stream || fs::is_directory(file, ignored)) {
        why =
            "the script " + file + " cannot be read: " + std::strerror(errno != 0 ? errno : EISDIR);
        return std::nullopt;
    }
    std::string text(SCRIPT_LIMIT + 1, '\0');
    stream.read(text.data(), static_cast<std::streamsize>(text.size()));
    text.resize(static_cast<std::size_t>(stream.gcount()));
    if (text.size() > SCRIPT_LIMIT) {
        why = "the script " + file + " is longer than 1 MB";
        return std::nullopt;
    }
    return text;
}

/** @return The exit status. */
int runLines(const Script& script, RunningWatch& watch) {
    ScriptRun run(watch);
    for (const ScriptLine& line : script.lines) {
        const Command* command = findCommand(line.words.front());
        const std::string why = command->act(run, {line.words.begin() + 1, line.words.end()});
        if (why.empty())
            continue;
        std::fprintf(stderr, "%s\n",
                     scriptMessage(script.name, line.number, command->name, why).c_str());
        return EXIT_FAILURE;
    }
    return EXIT_SUCCESS;
}

bool reportErrors(const Script& script) {
    for (const std::string& error : script.errors)
        std::fprintf(stderr, "%s\n", error.c_str());
    return !script.errors.empty();
}

/** A display is not needed: without one the watch draws into memory. */
void chooseEngine() {
    const char* display = std::getenv("DISPLAY");
    if (display == nullptr || *display == '\0')
        setenv("ELM_ENGINE", "buffer", 0);
}

/** The folder of the only watch that runs; empty with the reason when there is not just one. */
std::string findWatch(std::string& why) {
    const std::unique_ptr<char, decltype(&std::free)> all(device_remote_folder(), std::free);
    std::vector<std::string> running;
    std::error_code ignored;
    for (const auto& entry : fs::directory_iterator(all.get(), ignored)) {
        RunningWatch watch(entry.path());
        if (watch.askWatch({"launches"}).problem.empty())
            running.push_back(entry.path().filename());
    }
    if (running.size() == 1)
        return std::string(all.get()) + "/" + running.front();
    std::sort(running.begin(), running.end());
    std::string processes;
    for (const std::string& process : running)
        processes += (processes.empty() ? "" : ", ") + process;
    why = running.empty() ? "no simulator runs that could do it"
                          : "several simulators run (processes " + processes +
                                "); give each a CLOCK_RUNTIME_DIR of its own";
    return "";
}

/** Commands of the command line and of the standard input, in their order. */
bool doCommand(RunningWatch& watch, const std::string& line) {
    const Script script = parseScript("--command", line);
    return !reportErrors(script) && runLines(script, watch) == EXIT_SUCCESS;
}

bool doInput(RunningWatch& watch) {
    std::string line;
    int number = 0;
    while (std::getline(std::cin, line)) {
        ++number;
        Script script = parseScript("-", line);
        for (ScriptLine& each : script.lines)
            each.number = number;
        for (std::string& error : script.errors)
            error.replace(0, std::strlen("-:1"), "-:" + std::to_string(number));
        if (reportErrors(script) || runLines(script, watch) != EXIT_SUCCESS)
            return false;
    }
    return true;
}

} // namespace

int runScript(const Options& options, int (*runWatch)(const Options& options)) {
    std::string why;
    const auto text = contentsOf(options.script, why);
    if (!text)
        return fail(why);
    const Script script = parseScript(options.script, *text);
    if (reportErrors(script))
        return EXIT_FAILURE;
    chooseEngine();
    WatchProcess process(options, runWatch);
    const std::string folder = process.waitForFolder();
    if (folder.empty()) {
        const int status = process.end();
        return status != EXIT_SUCCESS ? status : fail("the watch ended before the script began");
    }
    RunningWatch watch(folder);
    const int status = runLines(script, watch);
    // A recording that nobody has stopped ends with the script.
    stopRecording(folder);
    const int ended = process.end();
    return status != EXIT_SUCCESS ? status : ended;
}

int sendCommands(const Options& options) {
    std::string why;
    const std::string folder = findWatch(why);
    if (folder.empty())
        return fail(why);
    RunningWatch watch(folder);
    const bool done =
        std::all_of(options.commands.begin(), options.commands.end(), [&](const std::string& line) {
            return line == "-" ? doInput(watch) : doCommand(watch, line);
        });
    return done ? EXIT_SUCCESS : EXIT_FAILURE;
}

} // namespace simulator

// How long the city picker takes from a key press to the first frame with the cities found, beside
// what the toolkit's list takes for the same rows; what it needs of the memory; and whether it
// comes to rest.

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <functional>
#include <map>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include <Efreet.h>
#include <Elementary.h>
#include <benchmark/benchmark.h>
#include <sys/wait.h>
#include <unistd.h>

#include "PickerFace.h"
#include "PickerWorld.h"
#include "SkippedTime.h"
#include "device/dlog.h"
#include "device_host.h"

// Writing the log is not what is measured.
DEVICE_API int __dlog_print(log_id_t, int, const char*, const char*, ...) {
    return 0;
}

namespace {

/** A key press: the search text before it, the key, the text after it. */
struct Step {
    const char* before;
    const char* key;
    const char* after;
};

constexpr Step STEPS[] = {
    {"", "a", "a"},   {"", "s", "s"},           {"a", "n", "an"},
    {"s", "a", "sa"}, {"an", "BackSpace", "a"}, {"b", "BackSpace", ""},
};

constexpr const char* OPENING = "open";
constexpr const char* IN_BETWEEN = "'n' right after 'a'";
constexpr const char* LIST_OF_A = "list: clear, append the rows of 'a', frame";
constexpr const char* LIST_OF_ALL = "list: clear, append all rows, frame";
constexpr const char* FRAME = "whole frame drawn again";

PickerFace* face = nullptr;
/** The longest turns of the main loop after the first frame, in ms. */
std::map<std::string, double> longestTurns;

std::string nameOf(const Step& step) {
    return std::string("'") + step.before + "' " + step.key + " -> '" + step.after + "'";
}

void note(benchmark::State& state, double milliseconds) {
    if (milliseconds < 0)
        state.SkipWithError("no frame showed the cities");
    else
        state.SetIterationTime(milliseconds / 1000);
}

void noteWork(const std::string& name, const Work& work) {
    double& longest = longestTurns[name];
    longest = std::max(longest, work.longestTurn);
}

void pressKey(benchmark::State& state, const Step& step) {
    face->open();
    face->rest();
    face->tapEntry();
    while (state.KeepRunning()) {
        face->bringTo(step.before);
        face->rest();
        note(state, face->press(step.key, step.after));
        noteWork(nameOf(step), runUntilAsleep());
    }
    face->close();
}

void openPicker(benchmark::State& state) {
    while (state.KeepRunning()) {
        note(state, face->open());
        noteWork(OPENING, runUntilAsleep());
        face->close();
    }
}

void pressInBetween(benchmark::State& state) {
    face->open();
    face->rest();
    face->tapEntry();
    while (state.KeepRunning()) {
        face->bringTo("");
        face->rest();
        face->press("a", "a");
        note(state, face->press("n", "an"));
    }
    face->close();
}

char* rowText(void* data, Evas_Object*, const char* part) {
    const auto& texts = *static_cast<std::pair<std::string, std::string>*>(data);
    return strdup(std::strstr(part, "main") ? texts.first.c_str() : texts.second.c_str());
}

/** A list as the picker's, of rows that only have two texts. */
class PlainList {
public:
    explicit PlainList(std::size_t rows)
        : _texts(rows, {"A city with a name, a country", "GMT+05:45"}),
          _genlist(elm_genlist_add(face->naviframe())), _itemClass(elm_genlist_item_class_new()) {
        _itemClass->item_style = "2line.top";
        _itemClass->func.text_get = rowText;
        elm_genlist_mode_set(_genlist, ELM_LIST_COMPRESS);
        elm_genlist_homogeneous_set(_genlist, EINA_TRUE);
        elm_naviframe_item_simple_push(face->naviframe(), _genlist);
    }
    ~PlainList() {
        elm_genlist_item_class_free(_itemClass);
        elm_naviframe_item_pop(face->naviframe());
        runFor(0.5);
    }
    PlainList(const PlainList&) = delete;
    PlainList& operator=(const PlainList&) = delete;

    void fill() {
        elm_genlist_clear(_genlist);
        for (auto& row : _texts)
            elm_genlist_item_append(_genlist, _itemClass, &row, nullptr, ELM_GENLIST_ITEM_NONE,
                                    nullptr, nullptr);
    }

private:
    std::vector<std::pair<std::string, std::string>> _texts;
    Evas_Object* _genlist;
    Elm_Genlist_Item_Class* _itemClass;
};

void fillPlainList(benchmark::State& state, const std::string& text) {
    face->open();
    face->rest();
    face->tapEntry();
    face->bringTo(text);
    const auto rows = static_cast<std::size_t>(face->rowCount());
    face->close();
    PlainList list(rows);
    list.fill();
    face->rest();
    while (state.KeepRunning()) {
        const double start = millisecondsNow();
        list.fill();
        face->drawFrame();
        note(state, millisecondsNow() - start);
        face->rest();
    }
}

void drawFrame(benchmark::State& state) {
    face->open();
    face->rest();
    while (state.KeepRunning())
        note(state, face->drawFrame());
    face->close();
}

/** Keeps the single results, for the medians. */
class MedianReporter : public benchmark::ConsoleReporter {
public:
    MedianReporter() : ConsoleReporter(OO_Tabular) {}

    void ReportRuns(const std::vector<Run>& runs) override {
        for (const Run& run : runs) {
            failed = failed || run.error_occurred;
            if (run.run_type == Run::RT_Iteration)
                _times[run.run_name.function_name].push_back(run.GetAdjustedRealTime());
        }
    }

    void print(const std::string& name) {
        std::vector<double>& times = _times[name];
        std::sort(times.begin(), times.end());
        if (times.empty())
            return;
        std::printf("%-45s %8.2f %8.2f %8.2f", name.c_str(), times[times.size() / 2], times.front(),
                    times.back());
        if (longestTurns.contains(name))
            std::printf(" %14.2f", longestTurns[name]);
        std::printf("\n");
    }

    bool failed = false;

private:
    std::map<std::string, std::vector<double>> _times;
};

/** @return False when a measurement failed. */
bool measureTimes() {
    std::vector<std::string> names;
    using Function = std::function<void(benchmark::State&)>;
    const auto add = [&names](const std::string& name, const Function& function) {
        names.push_back(name);
        // Each press once a turn.
        benchmark::RegisterBenchmark(name.c_str(),
                                     [function](benchmark::State& state) { function(state); })
            ->Iterations(1)
            ->UseManualTime()
            ->Unit(benchmark::kMillisecond);
    };
    add(OPENING, openPicker);
    for (const Step& step : STEPS)
        add(nameOf(step), [&step](benchmark::State& state) { pressKey(state, step); });
    add(IN_BETWEEN, pressInBetween);
    add(LIST_OF_A, [](benchmark::State& state) { fillPlainList(state, "a"); });
    add(LIST_OF_ALL, [](benchmark::State& state) { fillPlainList(state, ""); });
    add(FRAME, drawFrame);
    longestTurns.clear();
    MedianReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    benchmark::ClearRegisteredBenchmarks();
    std::printf("%-45s %8s %8s %8s %14s\n", "ms to the frame", "median", "least", "most",
                "longest turn");
    for (const std::string& name : names)
        reporter.print(name);
    return !reporter.failed;
}

/** What an open picker does while nobody touches it. */
void measureIdleMinute() {
    face->open();
    face->tapEntry();
    face->bringTo("a");
    runFor(2);
    const int before = face->frames();
    const LoopActivity minute = runLoop(60);
    std::printf("One idle minute of the picker: %d timer wake-ups, %d other wake-ups, %d frames\n",
                minute.timeouts, minute.events, face->frames() - before);
    face->close();
}

long residentBytes() {
    long pages = 0;
    std::ifstream("/proc/self/statm") >> pages >> pages;
    return pages * sysconf(_SC_PAGESIZE);
}

/** What an open page adds to the memory in use. */
void measureMemory(const char* what, const std::function<void()>& open) {
    face->drawFrame();
    const long before = residentBytes();
    open();
    face->rest();
    std::printf("%-55s %8.2f MB\n", what,
                static_cast<double>(residentBytes() - before) / (1024 * 1024));
}

void measurePickerMemory() {
    measureMemory("Memory of the picker", [] { face->open(); });
    std::printf("%-55s %8d\n", "  its rows", face->rowCount());
    measureMemory("  what a first search adds", [] {
        face->tapEntry();
        face->bringTo("a");
        face->bringTo("");
    });
}

void measureListMemory() {
    std::unique_ptr<PlainList> list;
    measureMemory("Memory of a list of 4258 rows with two texts each", [&list] {
        list = std::make_unique<PlainList>(4258);
        list->fill();
    });
}

int measure(PickerWorld& world, int argc, char** argv) {
    std::vector<char*> arguments(argv, argv + argc);
    // Taking turns: what slows the machine down for a while slows all. May be overridden.
    std::string interleaved = "--benchmark_enable_random_interleaving=true";
    std::string repeated = "--benchmark_repetitions=15";
    arguments.insert(arguments.begin() + 1, {interleaved.data(), repeated.data()});
    int count = static_cast<int>(arguments.size());
    benchmark::Initialize(&count, arguments.data());
    std::printf("The application's own cities\n");
    bool measured = measureTimes();
    if (world.useManyCities()) {
        std::printf("\nMany cities\n");
        measured = measureTimes() && measured;
        world.useOwnCities();
    }
    std::printf("\n");
    measureIdleMinute();
    return measured ? EXIT_SUCCESS : EXIT_FAILURE;
}

using Measurement = std::function<int(PickerWorld& world)>;

int runOn(const std::string& folder, char** argv, const Measurement& measurement) {
    setenv("LC_ALL", "C.UTF-8", 1);
    setenv("LANGUAGE", "en", 1);
    setenv("ELM_ENGINE", "buffer", 1);
    setenv("ELM_PROFILE", "mobile", 1);
    PickerWorld world(folder);
    const std::string data = folder + "/data";
    const std::string runtime = folder + "/runtime";
    const device_host_config_s config{data.c_str(), runtime.c_str(), world.resources().c_str()};
    char error[256];
    if (device_host_init(&config, error, sizeof error) != 0) {
        std::fprintf(stderr, "%s\n", error);
        return EXIT_FAILURE;
    }
    efreet_cache_disable();
    elm_init(1, argv);
    int status = EXIT_FAILURE;
    if (device_host_init_toolkit() == 0) {
        PickerFace picker;
        face = &picker;
        status = measurement(world);
    }
    device_host_shutdown();
    elm_shutdown();
    return status;
}

int runInFolder(char** argv, const Measurement& measurement) {
    std::string folder = (std::filesystem::temp_directory_path() / "clock-bench-XXXXXX").string();
    if (mkdtemp(folder.data()) == nullptr)
        return EXIT_FAILURE;
    const int status = runOn(folder, argv, measurement);
    std::error_code ignored;
    std::filesystem::remove_all(folder, ignored);
    return status;
}

/** In a process of its own: memory that was used once is not given back. */
void runAlone(char** argv, void (*measurement)()) {
    const pid_t child = fork();
    if (child == 0) {
        const int status = runInFolder(argv, [measurement](PickerWorld&) {
            measurement();
            return EXIT_SUCCESS;
        });
        std::fflush(stdout);
        std::_Exit(status);
    }
    waitpid(child, nullptr, 0);
}

} // namespace

int main(int argc, char** argv) {
    std::setvbuf(stdout, nullptr, _IOLBF, 0);
    runAlone(argv, measurePickerMemory);
    runAlone(argv, measureListMemory);
    return runInFolder(argv, [=](PickerWorld& world) { return measure(world, argc, argv); });
}

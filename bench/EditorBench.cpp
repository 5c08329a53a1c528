// How long the alarm editor takes to open, beside the plainest page the toolkit can show, and what
// it costs while nobody touches it.

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <memory>
#include <string>
#include <vector>

#include <Ecore_Evas.h>
#include <Efreet.h>
#include <Elementary.h>
#include <benchmark/benchmark.h>

#include "AlarmEditViewController.h"
#include "RatioReporter.h"
#include "SkippedTime.h"
#include "app_assist/WNaviframeController.h"
#include "app_assist/WWindowController.h"
#include "device/dlog.h"
#include "device_host.h"

// Writing the log is not what is measured.
DEVICE_API int __dlog_print(log_id_t, int, const char*, const char*, ...) {
    return 0;
}

namespace {

constexpr int FACE_SIZE = 360;
constexpr const char* EDITOR = "alarm editor";
constexpr const char* BARE_PAGE = "bare page with eight rows";

app_assist::WWindowController* window = nullptr;
int frames = 0;

void renderedCb(void*, Evas*, void*) {
    ++frames;
}

void renderFrame() {
    ecore_evas_manual_render(ecore_evas_ecore_evas_get(evas_object_evas_get(window->getEvasObj())));
}

void settle() {
    for (int turn = 0; turn < 5; ++turn)
        ecore_main_loop_iterate();
}

void openEditor(benchmark::State& state) {
    while (state.KeepRunning()) {
        state.PauseTiming();
        // The first page of a naviframe does not slide in: its first frame shows all of it.
        auto* pages = new app_assist::WNaviframeController();
        window->setBaseController(pages);
        settle();
        const int before = frames;
        state.ResumeTiming();

        pages->push(
            new AlarmEditViewController(ALARM_EDIT_VIEW_CALLER_CLOCK, ClockAlarmDbData(), true));
        renderFrame();

        state.PauseTiming();
        if (frames == before)
            state.SkipWithError("no frame was drawn");
        pages->destroy();
        settle();
        state.ResumeTiming();
    }
}

char* rowText(void*, Evas_Object*, const char* part) {
    return strdup(part);
}

/** Eight rows of the toolkit's own two-line style on a page without buttons. */
void pushBarePage(Evas_Object* naviframe) {
    Evas_Object* list = elm_genlist_add(naviframe);
    elm_genlist_mode_set(list, ELM_LIST_COMPRESS);
    Elm_Genlist_Item_Class* itemClass = elm_genlist_item_class_new();
    itemClass->item_style = "double_label";
    itemClass->func.text_get = rowText;
    for (int row = 0; row < 8; ++row)
        elm_genlist_item_append(list, itemClass, nullptr, nullptr, ELM_GENLIST_ITEM_NONE, nullptr,
                                nullptr);
    elm_genlist_item_class_free(itemClass);
    elm_naviframe_item_push(naviframe, "Page", nullptr, nullptr, list, nullptr);
}

void openBarePage(benchmark::State& state) {
    while (state.KeepRunning()) {
        state.PauseTiming();
        Evas_Object* naviframe = elm_naviframe_add(window->getEvasObj());
        evas_object_resize(naviframe, FACE_SIZE, FACE_SIZE);
        evas_object_show(naviframe);
        settle();
        const int before = frames;
        state.ResumeTiming();

        pushBarePage(naviframe);
        renderFrame();

        state.PauseTiming();
        if (frames == before)
            state.SkipWithError("no frame was drawn");
        evas_object_del(naviframe);
        settle();
        state.ResumeTiming();
    }
}

Eina_Bool quitCb(void*) {
    ecore_main_loop_quit();
    return ECORE_CALLBACK_CANCEL;
}

/** What an open editor does while nobody touches it. */
void measureIdleMinute() {
    auto* pages = new app_assist::WNaviframeController();
    window->setBaseController(pages);
    pages->push(
        new AlarmEditViewController(ALARM_EDIT_VIEW_CALLER_CLOCK, ClockAlarmDbData(), true));
    ecore_timer_add(2.0, quitCb, nullptr); // It comes to rest in real time.
    ecore_main_loop_begin();
    const int before = frames;
    const LoopActivity minute = runLoop(60);
    std::printf("One idle minute of the editor: %d timer wake-ups, %d other wake-ups, %d frames\n",
                minute.timeouts, minute.events, frames - before);
    pages->destroy();
    settle();
}

int measure(int argc, char** argv) {
    std::vector<char*> arguments(argv, argv + argc);
    // Taking turns: what slows the machine down for a while slows both. May be overridden.
    std::string interleaved = "--benchmark_enable_random_interleaving=true";
    std::string repeated = "--benchmark_repetitions=20";
    std::string brief = "--benchmark_report_aggregates_only=false";
    arguments.insert(arguments.begin() + 1, {interleaved.data(), repeated.data(), brief.data()});
    int count = static_cast<int>(arguments.size());
    benchmark::Initialize(&count, arguments.data());
    for (auto* bench : {benchmark::RegisterBenchmark(EDITOR, openEditor),
                        benchmark::RegisterBenchmark(BARE_PAGE, openBarePage)})
        bench->Iterations(5)->UseRealTime()->Unit(benchmark::kMillisecond);
    RatioReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    const bool compared = reporter.printRatio("Opening", EDITOR, BARE_PAGE);
    measureIdleMinute();
    return compared ? EXIT_SUCCESS : EXIT_FAILURE;
}

int runOn(const std::string& folder, int argc, char** argv) {
    const std::string data = folder + "/data";
    const std::string runtime = folder + "/runtime";
    device_host_config_s config{};
    config.data_dir = data.c_str();
    config.runtime_dir = runtime.c_str();
    char error[256];
    if (device_host_init(&config, error, sizeof error) != 0) {
        std::fprintf(stderr, "%s\n", error);
        return EXIT_FAILURE;
    }
    setenv("ELM_ENGINE", "buffer", 1);
    efreet_cache_disable();
    elm_init(1, argv);
    int status = EXIT_FAILURE;
    if (device_host_init_toolkit() == 0) {
        app_assist::WWindowController face("bench", FACE_SIZE, FACE_SIZE);
        face.create(nullptr, nullptr);
        window = &face;
        evas_event_callback_add(evas_object_evas_get(face.getEvasObj()),
                                EVAS_CALLBACK_RENDER_FLUSH_POST, renderedCb, nullptr);
        status = measure(argc, argv);
    }
    device_host_shutdown();
    elm_shutdown();
    return status;
}

} // namespace

int main(int argc, char** argv) {
    std::string folder = (std::filesystem::temp_directory_path() / "clock-bench-XXXXXX").string();
    if (mkdtemp(folder.data()) == nullptr)
        return EXIT_FAILURE;
    const int status = runOn(folder, argc, argv);
    std::error_code ignored;
    std::filesystem::remove_all(folder, ignored);
    return status;
}

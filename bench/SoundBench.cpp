// How long after the first touch of the volume slider the alarm's tone is heard, beside the time
// that GStreamer needs by itself for the same file.

#include <algorithm>
#include <chrono>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <optional>
#include <string>
#include <vector>

#include <benchmark/benchmark.h>
#include <fcntl.h>
#include <gst/gst.h>
#include <poll.h>
#include <unistd.h>

#include "RatioReporter.h"
#include "clock/ClockAlarmDbData.h"
#include "clock/ClockSoundPlayer.h"
#include "device/dlog.h"
#include "device_host.h"

// Writing the log is not what is measured.
DEVICE_API int __dlog_print(log_id_t, int, const char*, const char*, ...) {
    return 0;
}

namespace {

using Clock = std::chrono::steady_clock;

constexpr const char* PREVIEW = "preview of the volume row";
constexpr const char* PLAIN = "plain GStreamer player";
constexpr int LEVEL = 7;
constexpr int MILLISECONDS_TO_WAIT = 5000;

/** A sound card made of a pipe: it takes each buffer when it is due. */
class Loudspeaker {
public:
    Loudspeaker() {
        if (pipe2(_ends, O_CLOEXEC | O_NONBLOCK) != 0)
            std::abort();
        _words = "audioconvert ! audioresample ! audio/x-raw,format=S16LE,channels=1,rate=44100 ! "
                 "fdsink sync=true fd=" +
                 std::to_string(_ends[1]);
    }
    ~Loudspeaker() {
        close(_ends[0]);
        close(_ends[1]);
    }
    Loudspeaker(const Loudspeaker&) = delete;
    Loudspeaker& operator=(const Loudspeaker&) = delete;

    /** The sink in the words of gst-launch. */
    const std::string& words() const { return _words; }

    /** The moment when the first sample comes that is not silent. */
    std::optional<Clock::time_point> waitForSound() const {
        pollfd readable{_ends[0], POLLIN, 0};
        std::int16_t samples[2048];
        while (poll(&readable, 1, MILLISECONDS_TO_WAIT) > 0) {
            const auto now = Clock::now();
            const ssize_t size = read(_ends[0], samples, sizeof samples);
            const auto count = size > 0 ? size / static_cast<ssize_t>(sizeof samples[0]) : 0;
            if (std::any_of(samples, samples + count,
                            [](std::int16_t sample) { return sample != 0; }))
                return now;
        }
        return std::nullopt;
    }

    /** Forgets what came after that. */
    void drain() const {
        char bytes[4096];
        while (read(_ends[0], bytes, sizeof bytes) > 0) {
        }
    }

private:
    int _ends[2] = {-1, -1};
    std::string _words;
};

Loudspeaker* loudspeaker = nullptr;

void note(benchmark::State& state, Clock::time_point begin) {
    const auto heard = loudspeaker->waitForSound();
    if (heard)
        state.SetIterationTime(std::chrono::duration<double>(*heard - begin).count());
    else
        state.SkipWithError("nothing was heard");
}

void preview(benchmark::State& state) {
    while (state.KeepRunning()) {
        const auto begin = Clock::now();
        ClockSoundPlayer player;
        player.initialize(CLOCK_ALARM_DEFAULT_TONE, CLOCK_ALARM_DEFAULT_TONE,
                          CLOCK_SOUND_TYPE_PREVIEW, LEVEL, 0, true, 0);
        note(state, begin);
        player.stop();
        loudspeaker->drain();
    }
}

GstElement* makePlainPlayer() {
    GstElement* player = gst_element_factory_make("playbin", nullptr);
    GstElement* sink = gst_parse_bin_from_description(loudspeaker->words().c_str(), TRUE, nullptr);
    gchar* uri = gst_filename_to_uri(CLOCK_RESOURCE_DIR "/tones/Alarm_Impatient.ogg", nullptr);
    if (player != nullptr)
        g_object_set(player, "uri", uri, "audio-sink", sink, nullptr);
    g_free(uri);
    return player;
}

void plainPlayer(benchmark::State& state) {
    while (state.KeepRunning()) {
        const auto begin = Clock::now();
        GstElement* player = makePlainPlayer();
        if (player == nullptr) {
            state.SkipWithError("GStreamer has no playbin");
            break;
        }
        gst_element_set_state(player, GST_STATE_PLAYING);
        note(state, begin);
        gst_element_set_state(player, GST_STATE_NULL);
        gst_object_unref(player);
        loudspeaker->drain();
    }
}

BENCHMARK(preview)->Name(PREVIEW)->Iterations(5)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(plainPlayer)->Name(PLAIN)->Iterations(5)->UseManualTime()->Unit(benchmark::kMillisecond);

/** GStreamer starts with the first sound of a process. @return False when nothing was heard. */
bool measureFirst() {
    using Milliseconds = std::chrono::duration<double, std::milli>;
    const auto begin = Clock::now();
    ClockSoundPlayer player;
    player.initialize(CLOCK_ALARM_DEFAULT_TONE, CLOCK_ALARM_DEFAULT_TONE, CLOCK_SOUND_TYPE_PREVIEW,
                      LEVEL, 0, true, 0);
    const Milliseconds waited = Clock::now() - begin;
    const auto heard = loudspeaker->waitForSound();
    player.stop();
    loudspeaker->drain();
    if (!heard)
        return false;
    std::printf("First preview of the process, with the start of GStreamer in it: %.2f ms; the "
                "screen waits for %.2f ms of it\n",
                Milliseconds(*heard - begin).count(), waited.count());
    return true;
}

int measure(int argc, char** argv) {
    std::vector<char*> arguments(argv, argv + argc);
    // Taking turns: what slows the machine down for a while slows both. May be overridden.
    std::string interleaved = "--benchmark_enable_random_interleaving=true";
    std::string repeated = "--benchmark_repetitions=20";
    arguments.insert(arguments.begin() + 1, {interleaved.data(), repeated.data()});
    int count = static_cast<int>(arguments.size());
    benchmark::Initialize(&count, arguments.data());

    const bool heard = measureFirst();
    if (!heard || !gst_init_check(nullptr, nullptr, nullptr))
        return EXIT_FAILURE;
    RatioReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    const bool compared = reporter.printRatio("From the touch to the sound", PREVIEW, PLAIN);
    return compared ? EXIT_SUCCESS : EXIT_FAILURE;
}

int runOn(const std::string& folder, int argc, char** argv) {
    const std::string data = folder + "/data";
    const std::string runtime = folder + "/runtime";
    device_host_config_s config{};
    config.data_dir = data.c_str();
    config.runtime_dir = runtime.c_str();
    config.resource_dir = CLOCK_RESOURCE_DIR;
    char error[256];
    if (device_host_init(&config, error, sizeof error) != 0) {
        std::fprintf(stderr, "%s\n", error);
        return EXIT_FAILURE;
    }
    Loudspeaker pipe;
    loudspeaker = &pipe;
    setenv("CLOCK_AUDIO_SINK", pipe.words().c_str(), 1);
    unsetenv("CLOCK_TONE_DIR");
    const int status = measure(argc, argv);
    device_host_shutdown();
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

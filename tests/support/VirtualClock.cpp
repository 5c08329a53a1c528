#include "support/VirtualClock.h"

#include <atomic>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstdlib>

#include <sys/syscall.h>
#include <sys/time.h>
#include <unistd.h>

#include <Ecore.h>

namespace {

constexpr std::int64_t SECOND = 1'000'000'000;

std::atomic<bool> on = false;
std::atomic<std::int64_t> monotonic = 0;
std::atomic<std::int64_t> wall = 0;
std::int64_t startedAt = 0;

std::int64_t nanoseconds(double seconds) {
    return std::llround(seconds * 1e9);
}

int answer(timespec* time, std::int64_t value) {
    time->tv_sec = value / SECOND;
    time->tv_nsec = value % SECOND;
    return 0;
}

} // namespace

#define INTERPOSED extern "C" __attribute__((visibility("default")))

INTERPOSED int clock_gettime(clockid_t id, timespec* time) noexcept {
    if (on) {
        switch (id) {
        case CLOCK_MONOTONIC:
        case CLOCK_MONOTONIC_RAW:
        case CLOCK_MONOTONIC_COARSE:
        case CLOCK_BOOTTIME:
            return answer(time, monotonic);
        case CLOCK_REALTIME:
        case CLOCK_REALTIME_COARSE:
            return answer(time, wall);
        default:
            break;
        }
    }
    return static_cast<int>(syscall(SYS_clock_gettime, id, time));
}

INTERPOSED int gettimeofday(timeval* time, void* /*zone*/) noexcept {
    timespec now{};
    clock_gettime(CLOCK_REALTIME, &now);
    time->tv_sec = now.tv_sec;
    time->tv_usec = now.tv_nsec / 1000;
    return 0;
}

INTERPOSED std::time_t time(std::time_t* result) noexcept {
    timespec now{};
    clock_gettime(CLOCK_REALTIME, &now);
    if (result != nullptr) {
        *result = now.tv_sec;
    }
    return now.tv_sec;
}

void VirtualClock::start() {
    timespec real{};
    clock_gettime(CLOCK_MONOTONIC, &real);
    monotonic = startedAt = real.tv_sec * SECOND + real.tv_nsec;
    clock_gettime(CLOCK_REALTIME, &real);
    wall = real.tv_sec * SECOND + real.tv_nsec;
    on = true;
}

void VirtualClock::setNow(const std::string& zone, const std::string& civilTime) {
    setZone(zone);
    std::tm civil{};
    const char* const end = strptime(civilTime.c_str(), "%Y-%m-%d %H:%M:%S", &civil);
    if (end == nullptr || *end != '\0') {
        std::fprintf(stderr, "\"%s\" is no civil time\n", civilTime.c_str());
        std::abort();
    }
    civil.tm_isdst = -1;
    setNow(std::mktime(&civil));
}

void VirtualClock::setNow(std::time_t now) {
    wall = now * SECOND;
}

void VirtualClock::setZone(const std::string& zone) {
    setenv("TZ", zone.c_str(), 1);
    tzset();
}

std::time_t VirtualClock::now() {
    return time(nullptr);
}

void VirtualClock::jump(double seconds) {
    wall += nanoseconds(seconds);
}

void VirtualClock::advance(double seconds) {
    const std::int64_t end = monotonic + nanoseconds(seconds);
    while (monotonic < end) {
        const double rest = static_cast<double>(end - monotonic) / 1e9;
        frame(rest < FRAME ? rest : FRAME);
    }
}

void VirtualClock::frames(int count) {
    for (int i = 0; i < count; ++i) {
        frame(FRAME);
    }
}

double VirtualClock::elapsed() {
    return static_cast<double>(monotonic - startedAt) / 1e9;
}

void VirtualClock::frame(double seconds) {
    monotonic += nanoseconds(seconds);
    wall += nanoseconds(seconds);
    // Every time anew: a buffer canvas that comes or goes resets the source.
    ecore_animator_source_set(ECORE_ANIMATOR_SOURCE_CUSTOM);
    ecore_animator_custom_tick();
    ecore_main_loop_iterate();
}

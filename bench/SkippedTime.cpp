#include "SkippedTime.h"

#include <atomic>
#include <cstdint>
#include <ctime>

#include <sys/select.h>
#include <sys/syscall.h>
#include <sys/time.h>
#include <unistd.h>

#include <Ecore.h>

namespace {

constexpr std::int64_t SECOND = 1'000'000'000;
constexpr std::int64_t MICROSECOND = 1'000;

std::atomic<std::int64_t> skipped = 0;

/** Of the run under way. */
LoopActivity activity;
std::int64_t runEnd = 0;

std::int64_t monotonic() {
    timespec now{};
    clock_gettime(CLOCK_MONOTONIC, &now);
    return now.tv_sec * SECOND + now.tv_nsec;
}

bool isWallOrMonotonic(clockid_t id) {
    return id == CLOCK_REALTIME || id == CLOCK_MONOTONIC || id == CLOCK_BOOTTIME ||
           id == CLOCK_REALTIME_COARSE || id == CLOCK_MONOTONIC_COARSE || id == CLOCK_MONOTONIC_RAW;
}

/** The toolkit's threads sleep for real, and complain when clocks jump meanwhile. */
bool isMainThread() {
    return syscall(SYS_gettid) == getpid();
}

/** Looks at the files as select() does, but puts the clocks forward in place of waiting. */
int selectWithoutSleep(int count, fd_set* readable, fd_set* writable, fd_set* odd,
                       timeval* timeout) {
    const std::int64_t now = monotonic();
    if (now >= runEnd)
        ecore_main_loop_quit();
    timeval none{};
    const int ready = select(count, readable, writable, odd, &none);
    if (ready != 0) {
        ++activity.events;
        return ready;
    }
    std::int64_t sleep = runEnd - now;
    bool byTimer = false;
    if (timeout != nullptr) {
        const std::int64_t wanted = timeout->tv_sec * SECOND + timeout->tv_usec * MICROSECOND;
        byTimer = wanted > 0 && wanted < sleep;
        sleep = wanted < sleep ? wanted : sleep;
    }
    activity.timeouts += byTimer ? 1 : 0;
    skipped += sleep > 0 ? sleep : 0;
    return 0;
}

} // namespace

#define INTERPOSED extern "C" __attribute__((visibility("default")))

INTERPOSED int clock_gettime(clockid_t id, timespec* time) noexcept {
    const int result = static_cast<int>(syscall(SYS_clock_gettime, id, time));
    if (result == 0 && isWallOrMonotonic(id) && isMainThread()) {
        const std::int64_t shown = time->tv_nsec + skipped;
        time->tv_sec += shown / SECOND;
        time->tv_nsec = shown % SECOND;
    }
    return result;
}

INTERPOSED int gettimeofday(timeval* time, void* /*zone*/) noexcept {
    timespec now{};
    const int result = clock_gettime(CLOCK_REALTIME, &now);
    time->tv_sec = now.tv_sec;
    time->tv_usec = now.tv_nsec / MICROSECOND;
    return result;
}

INTERPOSED std::time_t time(std::time_t* result) noexcept {
    timespec now{};
    clock_gettime(CLOCK_REALTIME, &now);
    if (result != nullptr)
        *result = now.tv_sec;
    return now.tv_sec;
}

LoopActivity runLoop(double seconds) {
    activity = LoopActivity();
    runEnd = monotonic() + static_cast<std::int64_t>(seconds * SECOND);
    ecore_main_loop_select_func_set(selectWithoutSleep);
    ecore_main_loop_begin();
    ecore_main_loop_select_func_set(select);
    return activity;
}

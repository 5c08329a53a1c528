#include <ctime>

#include <dlfcn.h>
#include <sys/syscall.h>
#include <sys/time.h>
#include <unistd.h>

#include "DeviceClock.h"
#include "device/export.h"

// The device's clock for everything in the process: these functions come before the C library's.
// They may be called from any thread, from signal handlers, and by libraries that start before
// this one.

namespace {

using ClockGettime = int (*)(clockid_t, timespec*);

ClockGettime stockClockGettime = nullptr;

__attribute__((constructor)) void findStock() {
    stockClockGettime = reinterpret_cast<ClockGettime>(dlsym(RTLD_NEXT, "clock_gettime"));
}

/** Slow, but there from the first instruction on. */
int askKernel(clockid_t clock, timespec* time) {
    return static_cast<int>(syscall(SYS_clock_gettime, clock, time));
}

bool isWallClock(clockid_t clock) {
    return clock == CLOCK_REALTIME || clock == CLOCK_REALTIME_COARSE || clock == CLOCK_TAI;
}

} // namespace

extern "C" {

DEVICE_API int clock_gettime(clockid_t clock, timespec* time) noexcept {
    const int result = stockClockGettime ? stockClockGettime(clock, time) : askKernel(clock, time);
    if (result == 0 && isWallClock(clock))
        time->tv_sec += host::clockShift();
    return result;
}

DEVICE_API int gettimeofday(timeval* time, void* zone) noexcept {
    // What this has told has meant nothing for decades.
    if (zone)
        *static_cast<struct timezone*>(zone) = {};
    timespec now{};
    const int result = clock_gettime(CLOCK_REALTIME, &now);
    *time = {now.tv_sec, now.tv_nsec / 1000};
    return result;
}

DEVICE_API std::time_t time(std::time_t* result) noexcept {
    timespec now{};
    clock_gettime(CLOCK_REALTIME, &now);
    if (result)
        *result = now.tv_sec;
    return now.tv_sec;
}

DEVICE_API int timespec_get(timespec* time, int base) noexcept {
    return base == TIME_UTC && clock_gettime(CLOCK_REALTIME, time) == 0 ? base : 0;
}

} // extern "C"

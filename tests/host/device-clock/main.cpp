// A program of the device that tells what each of its clocks shows, in seconds ahead of the
// computer's clock. With the argument "follow" it does so again once its clock or zone was set.
#include <chrono>
#include <cinttypes>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <functional>
#include <string>

#include <Elementary.h>
#include <glib.h>
#include <sqlite3.h>
#include <sys/syscall.h>
#include <sys/time.h>
#include <unicode/ucal.h>
#include <unicode/ustring.h>
#include <unistd.h>

#include "device_host.h"

namespace {

double kernelTime(clockid_t clock) {
    timespec now{};
    syscall(SYS_clock_gettime, clock, &now);
    return static_cast<double>(now.tv_sec) + static_cast<double>(now.tv_nsec) / 1e9;
}

double seconds(const timespec& time) {
    return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_nsec) / 1e9;
}

double clockTime(clockid_t clock) {
    timespec now{};
    clock_gettime(clock, &now);
    return seconds(now);
}

double dayTime() {
    timeval now{};
    gettimeofday(&now, nullptr);
    return static_cast<double>(now.tv_sec) + static_cast<double>(now.tv_usec) / 1e6;
}

double specTime() {
    timespec now{};
    timespec_get(&now, TIME_UTC);
    return seconds(now);
}

template <typename Clock>
double chronoTime() {
    return std::chrono::duration<double>(Clock::now().time_since_epoch()).count();
}

double sqliteTime() {
    sqlite3* database = nullptr;
    sqlite3_stmt* query = nullptr;
    sqlite3_open(":memory:", &database);
    sqlite3_prepare_v2(database, "SELECT strftime('%s', 'now')", -1, &query, nullptr);
    sqlite3_step(query);
    const double value = sqlite3_column_double(query, 0);
    sqlite3_finalize(query);
    sqlite3_close(database);
    return value;
}

double storedTime() {
    std::time_t now = 0;
    std::time(&now);
    return static_cast<double>(now);
}

void tell(const char* name, clockid_t real, double shown) {
    // Rounded down to half a minute: some clocks have whole seconds only.
    constexpr double STEP = 30;
    const double ahead = shown - kernelTime(real);
    std::printf("%s %+.0f\n", name, static_cast<double>(std::lround(ahead / STEP)) * STEP);
}

std::string icuZone() {
    UErrorCode status = U_ZERO_ERROR;
    UChar name[128];
    char text[128];
    ucal_getDefaultTimeZone(name, 128, &status);
    u_UCharsToChars(name, text, 128);
    return text;
}

void tellZones() {
    const std::time_t now = 0;
    std::tm local{};
    localtime_r(&now, &local);
    GTimeZone* zone = g_time_zone_new_local();
    const int interval = g_time_zone_find_interval(zone, G_TIME_TYPE_UNIVERSAL, now);
    std::printf("libc-zone %s\nglib-zone %s\nicu-zone %s\n", local.tm_zone,
                g_time_zone_get_abbreviation(zone, interval), icuZone().c_str());
    g_time_zone_unref(zone);
}

/** A wait with an end, as the toolkit's threads do. */
double waitOfThread() {
    Eina_Lock lock;
    Eina_Condition condition;
    eina_lock_new(&lock);
    eina_condition_new(&condition, &lock);
    const double start = kernelTime(CLOCK_MONOTONIC);
    eina_lock_take(&lock);
    eina_condition_timedwait(&condition, 0.1);
    eina_lock_release(&lock);
    eina_condition_free(&condition);
    eina_lock_free(&lock);
    return kernelTime(CLOCK_MONOTONIC) - start;
}

void tellAll() {
    tell("time", CLOCK_REALTIME, static_cast<double>(std::time(nullptr)));
    tell("time-stored", CLOCK_REALTIME, storedTime());
    tell("gettimeofday", CLOCK_REALTIME, dayTime());
    tell("realtime", CLOCK_REALTIME, clockTime(CLOCK_REALTIME));
    tell("realtime-coarse", CLOCK_REALTIME, clockTime(CLOCK_REALTIME_COARSE));
    tell("tai", CLOCK_TAI, clockTime(CLOCK_TAI));
    tell("timespec_get", CLOCK_REALTIME, specTime());
    tell("system_clock", CLOCK_REALTIME, chronoTime<std::chrono::system_clock>());
    tell("icu", CLOCK_REALTIME, ucal_getNow() / 1000);
    tell("glib", CLOCK_REALTIME, static_cast<double>(g_get_real_time()) / 1e6);
    tell("toolkit", CLOCK_REALTIME, ecore_time_unix_get());
    tell("sqlite", CLOCK_REALTIME, sqliteTime());
    tell("real", CLOCK_REALTIME, static_cast<double>(device_host_real_time()));
    tell("monotonic", CLOCK_MONOTONIC, clockTime(CLOCK_MONOTONIC));
    tell("boottime", CLOCK_BOOTTIME, clockTime(CLOCK_BOOTTIME));
    tell("steady_clock", CLOCK_MONOTONIC, chronoTime<std::chrono::steady_clock>());
    tell("glib-monotonic", CLOCK_MONOTONIC, static_cast<double>(g_get_monotonic_time()) / 1e6);
    tell("toolkit-loop", CLOCK_MONOTONIC, ecore_time_get());
    std::printf("wait %s\n", std::abs(waitOfThread() - 0.1) < 0.09 ? "as long as asked" : "wrong");
    tellZones();
    std::printf(".\n");
    std::fflush(stdout);
}

/** Where the clock and the zone stand, to notice that they were set. */
std::string state() {
    const auto ahead = std::time(nullptr) - static_cast<std::time_t>(kernelTime(CLOCK_REALTIME));
    return std::to_string((ahead + 1) / 10) + icuZone();
}

void waitForChange() {
    const std::string before = state();
    const double end = kernelTime(CLOCK_MONOTONIC) + 10;
    while (state() == before && kernelTime(CLOCK_MONOTONIC) < end) {
        ecore_main_loop_iterate();
        usleep(5000);
    }
}

} // namespace

int main(int argc, char** argv) {
    if (device_host_init(nullptr, nullptr, 0) != 0)
        return 1;
    elm_init(0, nullptr);
    if (device_host_init_toolkit() != 0)
        return 1;
    tellAll();
    if (argc > 1 && std::string(argv[1]) == "follow") {
        waitForChange();
        tellAll();
    }
    device_host_shutdown();
    elm_shutdown();
    return 0;
}

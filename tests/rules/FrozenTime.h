// The time of day as the code under test sees it, for the length of a test.
#pragma once

#include <ctime>
#include <optional>

class FrozenTime {
public:
    explicit FrozenTime(std::time_t instant) { current() = instant; }
    ~FrozenTime() { current().reset(); }
    FrozenTime(const FrozenTime&) = delete;
    FrozenTime& operator=(const FrozenTime&) = delete;

    void set(std::time_t instant) { current() = instant; }

    static std::optional<std::time_t>& current() {
        static std::optional<std::time_t> instant;
        return instant;
    }
};

// Comes before the C library's: the program is searched first.
extern "C" inline __attribute__((used, visibility("default"))) time_t time(time_t* out) noexcept {
    timespec now{};
    clock_gettime(CLOCK_REALTIME, &now);
    const time_t instant = FrozenTime::current().value_or(now.tv_sec);
    if (out)
        *out = instant;
    return instant;
}

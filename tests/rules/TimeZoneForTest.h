// A time zone of the process for the length of a test.
#pragma once

#include <cstdlib>
#include <ctime>
#include <optional>
#include <string>

class TimeZoneForTest {
public:
    explicit TimeZoneForTest(const char* zone) {
        if (const char* before = std::getenv("TZ"))
            _before = before;
        set(zone);
    }
    ~TimeZoneForTest() { set(_before ? _before->c_str() : nullptr); }
    TimeZoneForTest(const TimeZoneForTest&) = delete;
    TimeZoneForTest& operator=(const TimeZoneForTest&) = delete;

    // A null zone takes TZ away.
    static void set(const char* zone) {
        if (zone)
            setenv("TZ", zone, 1);
        else
            unsetenv("TZ");
        tzset();
    }

private:
    std::optional<std::string> _before;
};

// The instant of a local time "2026-11-18 09:41:00".
inline std::time_t at(const char* civil) {
    std::tm time{};
    strptime(civil, "%Y-%m-%d %H:%M:%S", &time);
    time.tm_isdst = -1;
    return std::mktime(&time);
}

// The local time of an instant.
inline std::string civil(std::time_t instant) {
    std::tm time{};
    localtime_r(&instant, &time);
    char buffer[32];
    std::strftime(buffer, sizeof buffer, "%Y-%m-%d %H:%M:%S", &time);
    return buffer;
}

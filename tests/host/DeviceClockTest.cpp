// The device's clock and time zone, as every process of the device sees them.

#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <map>
#include <memory>
#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/time.h>

#include "device/alarm_server.h"
#include "device/vconf.h"
#include "device_host.h"
#include "host/Helper.h"
#include "rules/TimeZoneForTest.h"

using testing::Contains;
using testing::Pair;

namespace {

constexpr const char* SHIFT_KEY = "db/setting/clock_shift";
constexpr const char* TIME_ZONE_KEY = "db/setting/time_zone";
constexpr int DAY = 24 * 3600;

using Reading = std::map<std::string, std::string>;

/** The program that tells its clocks, until the object goes. */
class OtherProcess {
public:
    explicit OtherProcess(const std::string& argument = "")
        : _out(popen((CLOCK_DEVICE_CLOCK " " + argument + " 2>/dev/null").c_str(), "re"), pclose) {}

    /** What it tells until its next dot. */
    Reading read() {
        Reading reading;
        char line[256];
        while (_out && std::fgets(line, sizeof line, _out.get())) {
            std::string text = line;
            text.pop_back();
            if (text == ".")
                break;
            const auto space = text.find(' ');
            reading[text.substr(0, space)] = text.substr(std::min(space, text.size() - 1) + 1);
        }
        return reading;
    }

private:
    std::unique_ptr<FILE, int (*)(FILE*)> _out;
};

const std::vector<std::string> WALL_CLOCKS{
    "time", "gettimeofday", "realtime", "timespec_get",    "system_clock", "icu",
    "glib", "toolkit",      "sqlite",   "realtime-coarse", "tai",          "time-stored"};
const std::vector<std::string> OTHER_CLOCKS{"real",         "monotonic",      "boottime",
                                            "steady_clock", "glib-monotonic", "toolkit-loop"};

void expectAhead(const Reading& reading, const std::string& shift) {
    for (const auto& clock : WALL_CLOCKS)
        EXPECT_THAT(reading, Contains(Pair(clock, shift)));
    for (const auto& clock : OTHER_CLOCKS)
        EXPECT_THAT(reading, Contains(Pair(clock, testing::AnyOf("+0", "-0"))));
    EXPECT_THAT(reading, Contains(Pair("wait", "as long as asked")));
}

void expectZone(const Reading& reading, const std::string& name, const std::string& shortName) {
    EXPECT_THAT(reading, Contains(Pair("icu-zone", name)));
    EXPECT_THAT(reading, Contains(Pair("libc-zone", shortName)));
    EXPECT_THAT(reading, Contains(Pair("glib-zone", shortName)));
}

/** Processes find the theme where it was built. */
class DeviceClockTest : public testing::Test {
public:
    ~DeviceClockTest() override {
        vconf_set_int(SHIFT_KEY, 0);
        device_host_shutdown();
    }

protected:
    DeviceClockTest() { setenv("CLOCK_RESOURCE_DIR", CLOCK_RESOURCE_DIR, 1); }
    static int set(const std::string& type, const char* key, const std::string& value) {
        return waitFor(startHelper({"set-" + type, key, value}));
    }

    TimeZoneForTest zone{"Europe/Berlin"};
    DeviceHost host;
};

} // namespace

TEST_F(DeviceClockTest, EveryLibraryOfAProcessSeesTheShift) {
    ASSERT_EQ(vconf_set_int(SHIFT_KEY, 40 * DAY), VCONF_OK);
    expectAhead(OtherProcess().read(), "+3456000");
    ASSERT_EQ(vconf_set_int(SHIFT_KEY, -DAY), VCONF_OK);
    expectAhead(OtherProcess().read(), "-86400");
}

TEST_F(DeviceClockTest, ARunningProcessFollowsTheClockAndTheZone) {
    OtherProcess first("follow");
    const Reading before = first.read();
    expectZone(before, "Europe/Berlin", "CET");
    EXPECT_THAT(before, Contains(Pair("time", testing::AnyOf("+0", "-0"))));
    ASSERT_EQ(set("int", SHIFT_KEY, std::to_string(3 * DAY)), 0);
    expectAhead(first.read(), "+259200");

    OtherProcess second("follow");
    expectAhead(second.read(), "+259200");
    ASSERT_EQ(set("str", TIME_ZONE_KEY, "Asia/Kolkata"), 0);
    const Reading after = second.read();
    expectZone(after, "Asia/Kolkata", "IST");
    expectAhead(after, "+259200");
}

TEST_F(DeviceClockTest, ANewProcessIsInTheDevicesZone) {
    ASSERT_EQ(vconf_set_str(TIME_ZONE_KEY, "Asia/Tokyo"), VCONF_OK);
    expectZone(OtherProcess().read(), "Asia/Tokyo", "JST");
}

TEST_F(DeviceClockTest, AnUnknownZoneLeavesTheLastOne) {
    ASSERT_EQ(vconf_set_str(TIME_ZONE_KEY, "Mars/Olympus"), VCONF_OK);
    const std::string log = standardErrorOf([] { device_host_init(nullptr, nullptr, 0); });
    EXPECT_THAT(log, testing::HasSubstr("There is no time zone Mars/Olympus; the last one stays"));
    EXPECT_STREQ(std::getenv("TZ"), "Europe/Berlin");
}

TEST_F(DeviceClockTest, WithoutAZoneTheDeviceIsWhereTheComputerIs) {
    const std::string log = standardErrorOf([] { device_host_init(nullptr, nullptr, 0); });
    EXPECT_THAT(log, testing::Not(testing::HasSubstr("time zone")));
    EXPECT_STREQ(std::getenv("TZ"), "Europe/Berlin");
}

TEST_F(DeviceClockTest, OlderFunctionsFillAllThatTheyAreGiven) {
    timeval time{};
    struct timezone zone {
        7, 7
    };
    EXPECT_EQ(gettimeofday(&time, &zone), 0);
    EXPECT_EQ(zone.tz_minuteswest, 0);
    EXPECT_EQ(zone.tz_dsttime, 0);
    timespec precise{};
    EXPECT_EQ(timespec_get(&precise, TIME_UTC), TIME_UTC);
    EXPECT_EQ(timespec_get(&precise, TIME_UTC + 1), 0) << "there is no such base";
}

TEST_F(DeviceClockTest, ADamagedShiftIsNone) {
    ASSERT_EQ(vconf_set_int(SHIFT_KEY, DAY), VCONF_OK);
    device_host_init(nullptr, nullptr, 0);
    ASSERT_NE(device_host_real_time(), std::time(nullptr));
    ASSERT_EQ(vconf_set_str(SHIFT_KEY, "much"), VCONF_OK);
    device_host_init(nullptr, nullptr, 0);
    EXPECT_EQ(device_host_real_time(), std::time(nullptr));
}

TEST_F(DeviceClockTest, TheEndOfTheDeviceEndsTheShift) {
    const std::time_t real = std::time(nullptr);
    ASSERT_EQ(vconf_set_int(SHIFT_KEY, DAY), VCONF_OK);
    device_host_init(nullptr, nullptr, 0);
    EXPECT_GE(std::time(nullptr), real + DAY);
    EXPECT_LE(device_host_real_time(), real + 60);
    device_host_shutdown();
    EXPECT_LE(std::time(nullptr), real + 60);
}

TEST_F(DeviceClockTest, AlarmsRingWhenTheDevicesClockShowsTheirTime) {
    alarm_schedule_s schedule{};
    schedule.alarm_id = 1;
    schedule.enabled = 1;
    schedule.hour = 7;
    int32_t id = 0;
    ASSERT_EQ(alarm_server_register(&schedule, &id), ALARM_SERVER_ERROR_NONE);
    const auto nextRing = [id] {
        int64_t ring = 0;
        alarm_server_get(id, nullptr, &ring);
        return ring;
    };
    const auto before = nextRing();
    ASSERT_EQ(vconf_set_int(SHIFT_KEY, 10 * DAY), VCONF_OK);
    device_host_init(nullptr, nullptr, 0);
    EXPECT_NEAR(static_cast<double>(nextRing() - before), 10.0 * DAY, 3600);
    const auto berlin = nextRing();
    ASSERT_EQ(vconf_set_str(TIME_ZONE_KEY, "Asia/Tokyo"), VCONF_OK);
    device_host_init(nullptr, nullptr, 0);
    EXPECT_NE(nextRing(), berlin);
    const std::time_t ring = nextRing();
    std::tm shown{};
    localtime_r(&ring, &shown);
    EXPECT_EQ(shown.tm_hour, 7);
    EXPECT_STREQ(shown.tm_zone, "JST");
}

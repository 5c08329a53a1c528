#include "support/StoredData.h"

#include <algorithm>
#include <vector>

#include <clock/ClockAlarmDbModel.h>
#include <clock/ClockWorldClockDbModel.h>
#include <gtest/gtest.h>

ClockAlarmDbData alarmAt(int hour, int minute, int weekdays) {
    ClockAlarmDbData alarm;
    alarm.leading = 0;
    alarm.hour = hour;
    alarm.min = minute;
    alarm.enable = 1;
    alarm.repeatWeekly = weekdays;
    alarm.repeatOnce = weekdays == 0 ? 1 : 0;
    alarm.timeZone = "Europe/Berlin";
    return alarm;
}

ClockAlarmDbData storeAlarm(ClockAlarmDbData alarm) {
    ClockAlarmDbModel model;
    alarm.id = model.reserveAlarmId();
    EXPECT_TRUE(model.insertAlarmData(alarm));
    return alarm;
}

ClockWorldClockDbData cityOf(const std::string& id) {
    std::vector<ClockWorldClockDbData> cities;
    ClockWorldClockDbModel().getWorldClockAllCityList(cities);
    const auto found = std::find_if(cities.begin(), cities.end(),
                                    [&](const auto& city) { return city.city == id; });
    EXPECT_NE(found, cities.end()) << id;
    return found == cities.end() ? ClockWorldClockDbData() : *found;
}

void storeCity(const std::string& id, int position) {
    ClockWorldClockDbData city = cityOf(id);
    city.selected = 1;
    city.position = position;
    EXPECT_TRUE(ClockWorldClockDbModel().updateWorldClockDbRecord(city));
}

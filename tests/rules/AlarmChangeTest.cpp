#include "rules/AlarmChange.h"

#include <functional>
#include <string>

#include <gtest/gtest.h>

namespace {

struct ChangeCase {
    std::string field;
    std::function<void(ClockAlarmDbData&)> change;
};

void PrintTo(const ChangeCase& change, std::ostream* out) {
    *out << change.field;
}

ClockAlarmDbData anAlarm() {
    ClockAlarmDbData alarm{};
    alarm.id = 3;
    alarm.name = "Gym";
    alarm.timeZone = "Europe/Berlin";
    return alarm;
}

class ChangedFieldTest : public testing::TestWithParam<ChangeCase> {};
class CarriedFieldTest : public testing::TestWithParam<ChangeCase> {};

TEST(AlarmChangeTest, ACopyIsUnchanged) {
    EXPECT_FALSE(rules::isChanged(anAlarm(), anAlarm()));
}

TEST_P(ChangedFieldTest, CountsAsAChange) {
    ClockAlarmDbData alarm = anAlarm();
    GetParam().change(alarm);
    EXPECT_TRUE(rules::isChanged(alarm, anAlarm()));
    EXPECT_TRUE(rules::isChanged(anAlarm(), alarm));
}

TEST_P(CarriedFieldTest, DoesNotCountAsAChange) {
    ClockAlarmDbData alarm = anAlarm();
    GetParam().change(alarm);
    EXPECT_FALSE(rules::isChanged(alarm, anAlarm()));
}

INSTANTIATE_TEST_SUITE_P(Fields, ChangedFieldTest,
                         testing::Values(ChangeCase{"hour",
                                                    [](auto& a) {
                                                        a.hour = 7;
                                                    }},
                                         ChangeCase{"min",
                                                    [](auto& a) {
                                                        a.min = 1;
                                                    }},
                                         ChangeCase{"repeatOnce",
                                                    [](auto& a) {
                                                        a.repeatOnce = 0;
                                                    }},
                                         ChangeCase{"repeatWeekly",
                                                    [](auto& a) {
                                                        a.repeatWeekly = 2;
                                                    }},
                                         ChangeCase{"snooze",
                                                    [](auto& a) {
                                                        a.snooze = 0;
                                                    }},
                                         ChangeCase{"snoozeDuration",
                                                    [](auto& a) {
                                                        a.snoozeDuration = 10;
                                                    }},
                                         ChangeCase{"snoozeRepeat",
                                                    [](auto& a) {
                                                        a.snoozeRepeat = 5;
                                                    }},
                                         ChangeCase{"type",
                                                    [](auto& a) {
                                                        a.type = 2;
                                                    }},
                                         ChangeCase{"volume",
                                                    [](auto& a) {
                                                        a.volume = 8;
                                                    }},
                                         ChangeCase{"increaseVolume",
                                                    [](auto& a) {
                                                        a.increaseVolume = 1;
                                                    }},
                                         ChangeCase{"name",
                                                    [](auto& a) {
                                                        a.name = "gym";
                                                    }},
                                         ChangeCase{"timeZone",
                                                    [](auto& a) {
                                                        a.timeZone = "UTC";
                                                    }},
                                         ChangeCase{"soundPath", [](auto& a) {
                                                        a.soundPath += "x";
                                                    }}));

INSTANTIATE_TEST_SUITE_P(Fields, CarriedFieldTest,
                         testing::Values(ChangeCase{"leading",
                                                    [](auto& a) {
                                                        a.leading = 9;
                                                    }},
                                         ChangeCase{"id",
                                                    [](auto& a) {
                                                        a.id = 9;
                                                    }},
                                         ChangeCase{"alarmMgrId",
                                                    [](auto& a) {
                                                        a.alarmMgrId = 9;
                                                    }},
                                         ChangeCase{"enable",
                                                    [](auto& a) {
                                                        a.enable = 1;
                                                    }},
                                         ChangeCase{"alarmTime",
                                                    [](auto& a) {
                                                        a.alarmTime = 9;
                                                    }},
                                         ChangeCase{"alarmTimeBase",
                                                    [](auto& a) {
                                                        a.alarmTimeBase = 9;
                                                    }},
                                         ChangeCase{"createTime",
                                                    [](auto& a) {
                                                        a.createTime = 9;
                                                    }},
                                         ChangeCase{"updateTime",
                                                    [](auto& a) {
                                                        a.updateTime = 9;
                                                    }},
                                         ChangeCase{"autoDate",
                                                    [](auto& a) {
                                                        a.autoDate = 9;
                                                    }},
                                         ChangeCase{"manualDate",
                                                    [](auto& a) {
                                                        a.manualDate = 9;
                                                    }},
                                         ChangeCase{"snoozeCount",
                                                    [](auto& a) {
                                                        a.snoozeCount = 9;
                                                    }},
                                         ChangeCase{"trailing",
                                                    [](auto& a) {
                                                        a.trailing = 9;
                                                    }},
                                         ChangeCase{"tonePosition", [](auto& a) {
                                                        a.tonePosition = 9;
                                                    }}));

} // namespace

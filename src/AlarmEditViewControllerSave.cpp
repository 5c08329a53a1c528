// What the editor does with its working copy: preparing, saving, scheduling, telling the user.
#define LOG_TAG "alarm-ui-common"
#include "AlarmEditViewController.h"

#include <array>
#include <ctime>
#include <string>

#include <base/Text.h>
#include <clock/ClockAlarmDbModel.h>
#include <clock/ClockAlarmManagerModel.h>
#include <clock/ClockAlarmToast.h>
#include <clock/ClockIcuDataModel.h>
#include <clock/ClockNotificationModel.h>
#include <clock/ClockText.h>
#include <clock/LoggingModel.h>
#include <device/notification.h>
#include <device/sound_manager.h>
#include <device/vconf.h>

#include "AlarmNameItem.h"
#include "AlarmTimePickerItem.h"
#include "NullData.h"
#include "rules/AlarmName.h"
#include "rules/DateLine.h"
#include "rules/SaveTime.h"

namespace {

constexpr int NEW_ALARM_HOUR = 6;
constexpr int NEW_ALARM_VOLUME = 7;
constexpr std::size_t MAX_TOAST_BYTES = 511;
constexpr const char* ENABLED_ALARMS_KEY = "memory/private/com.vendra.indicator/alarm";

void logUsage(const char* feature, const char* detail) {
    LoggingModel::getInstance().insertLog(CLOCK_APPLICATION_ID, feature, detail, nullptr);
}

// Logs the name of a choice; a value without a name logs nothing.
template <std::size_t N>
void logChoice(const char* feature, int value, const std::array<const char*, N>& names) {
    if (value >= 0 && value < static_cast<int>(N))
        logUsage(feature, names.at(static_cast<std::size_t>(value)));
}

void removeNotification(int alarmId) {
    ClockNotificationModel::removeAlarmNotificationByTag(std::to_string(alarmId));
}

} // namespace

void AlarmEditViewController::_initialzeAlarmData() {
    if (_isCreate) {
        _alarm.alarmTime = 0;
        _alarm.alarmTimeBase = 0;
        _alarm.createTime = 0;
        _alarm.updateTime = 0;
        _alarm.autoDate = 0;
        _alarm.manualDate = 0;
        _alarm.min = 0;
        _alarm.hour = NEW_ALARM_HOUR;
        _alarm.timeZone = rules::currentTimeZone();
        _alarm.volume = NEW_ALARM_VOLUME;
        _alarm.enable = 1;
        _alarm.soundPath = CLOCK_ALARM_DEFAULT_TONE;
    }
    _snapshot = _alarm;
    if (sound_manager_set_volume(SOUND_TYPE_ALARM, _alarm.volume) != SOUND_MANAGER_ERROR_NONE)
        LOG_ERROR("Failed to set alarm session volume(volume = %d)", _alarm.volume);
}

void AlarmEditViewController::_saveAlarmName(void* data) {
    RETURN_IF_NULL(data);
    auto* self = static_cast<AlarmEditViewController*>(data);
    const AlarmNameItem* row = self->nameRow();
    self->_alarm.name = rules::withoutLeadingBlanks(row ? row->getTypedName() : self->_alarm.name);
    logUsage("CK08", self->_alarm.name.empty() ? "No name" : "Name entered");
}

void AlarmEditViewController::_saveAlarmTime(void* data) {
    RETURN_IF_NULL(data);
    auto* self = static_cast<AlarmEditViewController*>(data);
    ClockAlarmDbData& alarm = self->_alarm;
    const std::time_t now = std::time(nullptr);
    alarm.enable = 1;
    alarm.createTime = alarm.updateTime = static_cast<std::int32_t>(now);
    alarm.timeZone = rules::currentTimeZone();
    const AlarmTimePickerItem* row = self->timePickerRow();
    std::tm picked{};
    // Wheels that have scrolled out of view left their time in the record.
    const Evas_Object* picker = row ? row->getDateTimeObj() : nullptr;
    if (picker && elm_datetime_value_get(picker, &picked)) {
        alarm.hour = picked.tm_hour;
        alarm.min = picked.tm_min;
    }
    const rules::RingDate date = rules::settleRingDate(alarm, now);
    logUsage("CK12", date == rules::RingDate::Chosen ? "Set date" : "Not set date");
    alarm.alarmTime = alarm.alarmTimeBase =
        static_cast<std::int32_t>(rules::alarmTime(alarm.hour, alarm.min, alarm.timeZone, now));
}

void AlarmEditViewController::_saveAlarmData(void* data) {
    RETURN_IF_NULL(data);
    ClockAlarmDbData& alarm = static_cast<AlarmEditViewController*>(data)->_alarm;
    alarm.snoozeCount = 0;
    logChoice<3>("CK11", alarm.type, {"Sound", "Vibrate", "Vibrate and sound"});
    logChoice<2>("CK13", alarm.increaseVolume, {"OFF", "ON"});
    logChoice<2>("CK14", alarm.snooze, {"OFF", "ON"});
}

void AlarmEditViewController::_registerAlarmData(void* data) {
    RETURN_IF_NULL(data);
    auto* self = static_cast<AlarmEditViewController*>(data);
    if (!self->_isCreate)
        removeNotification(self->_alarm.id);
    const int duplicateId = ClockAlarmDbModel().isDuplicatedAlarmData(self->_alarm);
    if (duplicateId < 0) {
        self->storeAlarm();
        _createNotiToastForTimeOffest(self);
    } else {
        self->storeOverDuplicate(duplicateId);
        _createNotiToastForDuplicatedAlarm(self);
    }
    vconf_set_int(ENABLED_ALARMS_KEY, ClockAlarmDbModel().getNumberOfEnabledAlarmList());
}

void AlarmEditViewController::storeAlarm() {
    if (_isCreate) {
        ClockAlarmManagerModel::registerAlarmToServer(_alarm);
        ClockAlarmDbModel().insertAlarmData(_alarm);
    } else {
        updateStoredAlarm();
    }
}

void AlarmEditViewController::storeOverDuplicate(int duplicateId) {
    const int duplicateAlarmMgrId = alarmMgrIdOf(duplicateId);
    if (_isCreate) {
        _alarm.id = duplicateId;
        _alarm.alarmMgrId = duplicateAlarmMgrId;
        updateStoredAlarm();
        removeNotification(duplicateId);
        return;
    }
    if (duplicateId != _alarm.id)
        replaceOtherAlarm(duplicateId, duplicateAlarmMgrId);
    updateStoredAlarm();
}

void AlarmEditViewController::replaceOtherAlarm(int otherId, int otherAlarmMgrId) {
    ClockAlarmDbData other{};
    other.id = otherId;
    other.alarmMgrId = otherAlarmMgrId;
    removeNotification(otherId);
    ClockAlarmManagerModel::unregisterAlarmFromServer(other);
    ClockAlarmDbModel().removeAlarmData(other);
}

void AlarmEditViewController::updateStoredAlarm() {
    ClockAlarmManagerModel::updateAlarmOnServer(_alarm);
    ClockAlarmDbModel().updateAlarmData(_alarm, true, true);
}

int AlarmEditViewController::alarmMgrIdOf(int alarmId) {
    _alarmList.clear();
    ClockAlarmDbModel().getAllAlarmList(_alarmList);
    for (const ClockAlarmDbData& alarm : _alarmList)
        if (alarm.id == alarmId)
            return alarm.alarmMgrId;
    return 0;
}

void AlarmEditViewController::_createNotiToastForTimeOffest(void* data) {
    RETURN_IF_NULL(data);
    postTimeToRing(static_cast<AlarmEditViewController*>(data)->_alarm);
}

void AlarmEditViewController::_createNotiToastForDuplicatedAlarm(void* data) {
    RETURN_IF_NULL(data);
    const ClockAlarmDbData& alarm = static_cast<AlarmEditViewController*>(data)->_alarm;
    constexpr int TWELVE_HOURS = 1;
    int hours = 0;
    vconf_get_int("db/menu_widget/regionformat_time1224", &hours);
    std::array<char, 32> time{};
    ClockIcuDataModel::getFormattedDateString(ClockIcuDataModel::verifyExistingTimeForDst(alarm),
                                              time.data(), static_cast<int>(time.size()), nullptr,
                                              hours == TWELVE_HOURS ? "hhmm" : "HHmm",
                                              rules::currentTimeZone().c_str());
    const char* translation =
        clockText("IDS_CLOCK_TPOP_ALARM_ALREADY_SET_FOR_PS_EXISTING_ALARM_UPDATED");
    const std::string text = base::formatTranslation(base::cutUtf8(translation, MAX_TOAST_BYTES),
                                                     {std::string(time.data())}, MAX_TOAST_BYTES);
    notification_status_message_post(text.c_str());
}

#define LOG_TAG "clock-common"
#include "clock/ClockNotificationModel.h"

#include <base/Log.h>
#include <device/notification.h>

void ClockNotificationModel::removeAlarmNotificationByTag(const std::string& tag) {
    const int result = notification_delete_by_tag(tag.c_str());
    // Most alarms have left no notification.
    if (result != NOTIFICATION_ERROR_NONE && result != NOTIFICATION_ERROR_NOT_EXIST_ID)
        LOG_ERROR("notification_delete_by_tag failed(tag = %s, ret = %d)", tag.c_str(), result);
}

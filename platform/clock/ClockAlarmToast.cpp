#include "clock/ClockAlarmToast.h"

#include <string>

#include "clock/ClockStringUtil.h"
#include "device/notification.h"

void postTimeToRing(const ClockAlarmDbData& alarm) {
    int days = 0;
    int hours = 0;
    int minutes = 0;
    ClockStringUtil::getAlertTimeOffset(alarm, &days, &hours, &minutes);
    std::string text;
    ClockStringUtil::generateAlertOffsetToastPopupText(days, hours, minutes, text);
    notification_status_message_post(text.c_str());
}

#include "rules/AlertType.h"

#include <clock/ClockAlarmDbData.h>

namespace rules {

const char* alertTypeTextId(int type) {
    switch (type) {
    case CLOCK_ALARM_TYPE_SOUND:
        return "IDS_ALM_BODY_SOUND";
    case CLOCK_ALARM_TYPE_VIBRATION:
        return "IDS_ALM_BODY_ALERTTYEP_VIBRATION";
    case CLOCK_ALARM_TYPE_VIBRATION_AND_SOUND:
        return "IDS_ALM_POP_VIBRATION_AND_SOUND";
    default:
        return nullptr;
    }
}

} // namespace rules

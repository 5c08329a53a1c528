/**
 * @file
 * @brief Who opened the alarm editor.
 */
#pragma once

/** Who opened the alarm editor decides how it is left. Any other value is an error. */
enum AlarmEditViewCallerType : int {
    ALARM_EDIT_VIEW_CALLER_CLOCK = 0,             ///< The clock: leaving pops the page.
    ALARM_EDIT_VIEW_CALLER_OTHER_APPLICATION = 1, ///< Another application: leaving ends this one.
};

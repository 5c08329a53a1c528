/**
 * @file
 * @brief The names under which the device keeps its settings, for <device/vconf.h>.
 *
 * Those that begin with "memory/" are gone after a restart. A missing setting has the default that
 * is told here.
 */
#pragma once

/** Text: the language's code, "de" or "pt_BR"; that of the environment by default. */
#define DEVICE_SETTING_LANGUAGE "db/setting/language"
/** Text: the locale of dates and times, "de_DE"; that of the language by default. */
#define DEVICE_SETTING_REGION "db/menu_widget/regionformat"
/** Integer: 1 = 12 hours, 2 = 24 hours. */
#define DEVICE_SETTING_TIME_FORM "db/menu_widget/regionformat_time1224"
/** Text: the time zone's name, "Asia/Tokyo"; the computer's by default. */
#define DEVICE_SETTING_TIME_ZONE "db/setting/time_zone"
/** Integer: seconds that the device's clock is ahead of the computer's; 0 by default. */
#define DEVICE_SETTING_CLOCK_SHIFT "db/setting/clock_shift"
/** Integer: 0 = nothing moves; 1 by default. */
#define DEVICE_SETTING_MOTION "db/setting/motion"
/** Integer: 0 = no power saving, which is the default; 2 = ultra power saving. */
#define DEVICE_SETTING_POWER_SAVING "db/setting/psmode"
/** Text: country and network digits of a mobile network for a computer without a modem, "26201";
 * empty, which is the default, for none. */
#define DEVICE_SETTING_NETWORK "memory/telephony/plmn"

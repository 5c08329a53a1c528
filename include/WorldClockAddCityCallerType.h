/**
 * @file
 * @brief Who opened the city picker.
 */
#pragma once

/** Decides what becomes of the chosen city. Every value but the first means another application. */
enum WorldClockAddCityCallerType {
    ADD_CITY_CALLER_WORLD_CLOCK = 0, /**< The clock application's own list, which gets the city. */
    ADD_CITY_CALLER_APP_CONTROL = 1, /**< Another application, whose request is answered. */
};

/**
 * @file
 * @brief Ends controllers once nobody's callback can be running in them any more.
 */
#pragma once

namespace app_assist {

class WViewController;

/** @brief The controllers that end with this turn of the main loop, in order. */
class WDeferredDeletion {
public:
    /** @brief Ends a controller at the end of the turn. */
    static void add(WViewController* controller);
    /** @brief Ends a controller now, waiting or not. */
    static void finishNow(WViewController* controller);
    /** @brief Drops a controller that dies on its own. */
    static void forget(const WViewController* controller);
    /** @brief Ends all that wait, also those that join meanwhile. */
    static void flush();
};

} // namespace app_assist

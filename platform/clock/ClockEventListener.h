/**
 * @file
 * @brief Application-wide events.
 */
#pragma once

#include <clock/Export.h>

/**
 * @brief Base of everything that follows application-wide events.
 *
 * An object listens from its construction to its destruction. Listeners may come and go while an
 * event is being delivered: one that has gone is not called, a new one gets the next event.
 */
class CLOCK_COMMON_EXPORT ClockEventListener {
public:
    /** Application-wide events; the values are fixed. */
    enum EventType {
        SETTINGS_CHANGED = 0, ///< Texts that depend on settings are stale.
        TIME_CHANGED = 3,     ///< The clock or the time zone was set.
        LANGUAGE_CHANGED = 4, ///< Texts are wanted in another language.
        PAUSED = 6,           ///< The application went to the background.
        RESUMED = 7,          ///< The application came back to the foreground.
    };

    ClockEventListener();
    virtual ~ClockEventListener();
    ClockEventListener(const ClockEventListener&) = delete;
    ClockEventListener& operator=(const ClockEventListener&) = delete;

    /** @brief Receives an event. */
    virtual void onEvent(EventType type) = 0;

    /** @brief Delivers an event to every live listener, in the order of their construction. */
    static void raise(EventType type);
};

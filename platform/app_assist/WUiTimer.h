/**
 * @file
 * @brief Timers of the main loop.
 */
#pragma once

#include <functional>
#include <memory>

#include <Ecore.h>

#include <app_assist/Export.h>
#include <app_assist/WWeakPtr.h>

namespace app_assist {

/** @brief A timer that owns itself and is known by weak pointers only. */
class APP_ASSIST_EXPORT WUiTimer {
public:
    /** Runs when the timer fires. @return True to go on. */
    using Function = std::function<bool(void* data)>;

    /**
     * @brief Starts a timer.
     * @param interval Seconds, more than 0.
     * @param data Passed to the function; not owned.
     * @return Expires when the timer ends; empty, with a log line, on bad arguments.
     */
    static WWeakPtr<WUiTimer> addTimer(double interval, const Function& function, void* data);

    /** @brief Stops a timer that still exists; safe from inside its own function. */
    static void destroy(const WWeakPtr<WUiTimer>& timer);

    WUiTimer(const WUiTimer&) = delete;
    WUiTimer& operator=(const WUiTimer&) = delete;

private:
    WUiTimer(const Function& function, void* data);
    ~WUiTimer();
    static Eina_Bool _timerCb(void* data);

    std::unique_ptr<WLifeToken> _life = std::make_unique<WLifeToken>();
    Function _function;
    void* _data;
    Ecore_Timer* _timer = nullptr;
    bool _firing = false;
};

} // namespace app_assist

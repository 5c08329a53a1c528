/**
 * @file
 * @brief The clock application's second page.
 */
#pragma once

#include <memory>
#include <string>
#include <vector>

#include <Ecore.h>

#include "ListPage.h"
#include "app_assist/WViewController.h"
#include "app_assist/WWeakPtr.h"
#include "clock/ClockWorldClockDbData.h"

namespace simulator {

/** @brief The cities that the user has chosen, with the times there. */
class WorldClockViewController : public ListPage {
public:
    /** @param theme Path of the simulator's theme. */
    explicit WorldClockViewController(std::string theme);
    ~WorldClockViewController() override;

    const char* getClassName() const override;

    /** @brief Opens the city picker; only while this page is on top. */
    void addCity();

protected:
    void onCreated() override;
    void onDestroy() override;
    void onEvent(EventType type) override;
    Elm_Object_Item* appendRows() override;
    void onAddTapped() override { addCity(); }
    void onOtherTapped() override;

private:
    struct TimerDeleter {
        void operator()(Ecore_Timer* timer) const { ecore_timer_del(timer); }
    };
    static Eina_Bool _minuteCb(void* data);
    void waitForNextMinute();
    /** Asks whether a city is to leave the list. */
    void askToRemove(const ClockWorldClockDbData& city);
    void remove(const ClockWorldClockDbData& city);
    /** Writes which city the question is about. */
    void nameCity();

    /** The city below another one, or above it when it is the last. */
    int neighbourOf(const ClockWorldClockDbData& city) const;

    static constexpr int NONE = -1; ///< No city's key.
    std::vector<ClockWorldClockDbData> _cities;
    int _shownKey = NONE; ///< The city that the next refresh brings into view.
    std::unique_ptr<Ecore_Timer, TimerDeleter> _minuteTimer;
    app_assist::WWeakPtr<app_assist::WViewController> _question;
    std::string _questionedCity; ///< Message identifier.
};

} // namespace simulator

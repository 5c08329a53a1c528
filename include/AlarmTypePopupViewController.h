/**
 * @file
 * @brief The popup in which the alert type is chosen.
 */
#pragma once

#include <functional>

#include <app_assist/WPopupController.h>
#include <clock/ClockAlarmDbData.h>

#include "ClockUiExport.h"

/** @brief One radio row for each alert type. A choice is written at once and closes the popup. */
class CLOCK_UI_EXPORT AlarmTypePopupViewController : public app_assist::WPopupController {
public:
    /** @param alarm The editor's working record; must outlive the popup. */
    explicit AlarmTypePopupViewController(ClockAlarmDbData& alarm);
    ~AlarmTypePopupViewController() override;

    const char* getClassName() const override { return "AlarmTypePopupViewController"; }

    /** @brief Sets what runs after a choice. Replaces the earlier function. */
    void setSelectedCb(const std::function<void()>& selected);

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void* param) override;

private:
    Evas_Object* _createContent(Evas_Object* parent);
    void _createTypePopupViewItems(Evas_Object* genlist);
    void _dismiss();
    static void _dismissedCb(void* data, Evas_Object* popup, void* info);

    std::function<void()> _selected;
    ClockAlarmDbData& _alarm;
};

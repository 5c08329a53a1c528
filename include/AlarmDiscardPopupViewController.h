/**
 * @file
 * @brief The question whether to discard changes.
 */
#pragma once

#include <functional>

#include <app_assist/WPopupController.h>

#include "ClockUiExport.h"

/**
 * @brief Asks before unsaved changes are lost.
 *
 * Cancel and the back key close the popup. Discard runs the owner's action, which takes the popup
 * down with the screen.
 */
class CLOCK_UI_EXPORT AlarmDiscardPopupViewController : public app_assist::WPopupController {
public:
    AlarmDiscardPopupViewController();
    ~AlarmDiscardPopupViewController() override;

    const char* getClassName() const override;

    /**
     * @brief Sets what Discard does. Replaces the earlier function.
     *
     * A click on Discard without one throws std::bad_function_call.
     */
    void setDiscardBtnSelectedCb(const std::function<void()>& discard);

    /** @name Smart callbacks; data is the controller.
     *  @{ */
    static void _discardPopupCancelBtnClickedCb(void* data, Evas_Object* button, void* info);
    static void _discardPopupDiscardBtnClickedCb(void* data, Evas_Object* button, void* info);
    /** @} */

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void* param) override;

private:
    static void _backKeyCb(void* data, Evas_Object* popup, void* info);

    std::function<void()> _discard;
};

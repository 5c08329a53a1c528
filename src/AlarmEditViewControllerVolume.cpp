// The editor's volume keys, its preview, and how it follows the system's volume.
#define LOG_TAG "alarm-ui-common"
#include "AlarmEditViewController.h"

#include <cstring>

#include <Ecore_Input.h>
#include <Ecore_X.h>

#include <app_assist/WWindowController.h>
#include <base/Log.h>
#include <device/eext.h>
#include <device/vconf.h>

#include "AlarmVolumeItem.h"
#include "NullData.h"
#include "rules/EditorRows.h"

namespace {

constexpr const char* RAISE_KEY = "XF86AudioRaiseVolume";
constexpr const char* LOWER_KEY = "XF86AudioLowerVolume";
constexpr double REPEAT_SECONDS = 0.2;
constexpr const char* POWER_SAVING_KEY = "db/setting/psmode";
constexpr int ULTRA_POWER_SAVING = 2;

template <typename Handle, typename Delete>
void drop(Handle*& handle, Delete del) {
    if (handle)
        del(handle);
    handle = nullptr;
}

} // namespace

void AlarmEditViewController::stopPreview() {
    if (volumeRow() && rowAt(rules::EditorRow::IncreaseVolume))
        volumeRow()->stopSound();
}

void AlarmEditViewController::_registerVolumeKeyGrab() {
    if (_keyUpHandler || _keyDownHandler) {
        LOG_ERROR("Volume key event handler already registered.");
        return;
    }
    if (app_assist::WWindowController* window = getWindowController()) {
        _keyWindow = window->getWeakPtr();
        eext_window_key_grab(window->getEvasObj(), RAISE_KEY);
        eext_window_key_grab(window->getEvasObj(), LOWER_KEY);
    }
    _keyUpHandler = ecore_event_handler_add(ECORE_EVENT_KEY_UP, _volumeKeyUpCb, this);
    _keyDownHandler = ecore_event_handler_add(ECORE_EVENT_KEY_DOWN, _volumeKeyDownCb, this);
}

void AlarmEditViewController::_unregisterVolumeKeyGrab() {
    // Not asked for again: an editor without its view knows no window any more.
    if (Evas_Object* window = _keyWindow ? _keyWindow->getEvasObj() : nullptr) {
        eext_window_key_ungrab(window, RAISE_KEY);
        eext_window_key_ungrab(window, LOWER_KEY);
    }
    drop(_keyUpHandler, ecore_event_handler_del);
    drop(_keyDownHandler, ecore_event_handler_del);
    stopRepeating();
}

void AlarmEditViewController::stopRepeating() {
    if (_longPressTimer && !_longPressEnded)
        ecore_timer_del(_longPressTimer);
    _longPressTimer = nullptr;
    _longPressEnded = false;
}

Eina_Bool AlarmEditViewController::_volumeKeyDownCb(void* data, int, void* event) {
    if (!data) {
        LOG_ERROR("Data is null");
        return ECORE_CALLBACK_DONE;
    }
    auto* self = static_cast<AlarmEditViewController*>(data);
    if (self->_alarm.type == CLOCK_ALARM_TYPE_VIBRATION)
        return ECORE_CALLBACK_DONE;
    if (!event) {
        LOG_ERROR("Event is null");
        return ECORE_CALLBACK_DONE;
    }
    const char* key = static_cast<Ecore_Event_Key*>(event)->keyname;
    if (!key)
        LOG_ERROR("Key Event is null");
    else if (std::strcmp(key, RAISE_KEY) == 0)
        self->stepAndRepeat(&AlarmEditViewController::_increaseVolume,
                            _volumeIncreaseLongPressTimerCb);
    else if (std::strcmp(key, LOWER_KEY) == 0)
        self->stepAndRepeat(&AlarmEditViewController::_decreaseVolume,
                            _volumeDecreaseLongPressTimerCb);
    return ECORE_CALLBACK_DONE;
}

void AlarmEditViewController::stepAndRepeat(void (AlarmEditViewController::*step)(),
                                            Ecore_Task_Cb repeat) {
    (this->*step)();
    if (!_longPressTimer)
        _longPressTimer = ecore_timer_add(REPEAT_SECONDS, repeat, this);
}

Eina_Bool AlarmEditViewController::_volumeKeyUpCb(void* data, int, void*) {
    if (!data)
        LOG_ERROR("Data is null");
    else
        static_cast<AlarmEditViewController*>(data)->stopRepeating();
    return ECORE_CALLBACK_DONE;
}

void AlarmEditViewController::_increaseVolume() {
    if (_alarm.type != CLOCK_ALARM_TYPE_VIBRATION && volumeRow())
        volumeRow()->increaseVolume();
}

void AlarmEditViewController::_decreaseVolume() {
    if (_alarm.type != CLOCK_ALARM_TYPE_VIBRATION && volumeRow())
        volumeRow()->decreaseVolume();
}

Eina_Bool AlarmEditViewController::_volumeIncreaseLongPressTimerCb(void* data) {
    RETURN_IF_NULL(data, ECORE_CALLBACK_CANCEL);
    return static_cast<AlarmEditViewController*>(data)->repeatStep(
        &AlarmEditViewController::_increaseVolume);
}

Eina_Bool AlarmEditViewController::_volumeDecreaseLongPressTimerCb(void* data) {
    RETURN_IF_NULL(data, ECORE_CALLBACK_CANCEL);
    return static_cast<AlarmEditViewController*>(data)->repeatStep(
        &AlarmEditViewController::_decreaseVolume);
}

Eina_Bool AlarmEditViewController::repeatStep(void (AlarmEditViewController::*step)()) {
    // The handle of a timer that ends here stays until a key is released, so that the key that is
    // still held cannot start another one.
    _longPressEnded = _alarm.type == CLOCK_ALARM_TYPE_VIBRATION;
    if (_longPressEnded)
        return ECORE_CALLBACK_CANCEL;
    (this->*step)();
    return ECORE_CALLBACK_RENEW;
}

void AlarmEditViewController::_registerQuickPanelEvent() {
    _quickPanelHandler =
        ecore_event_handler_add(ECORE_X_EVENT_CLIENT_MESSAGE, _quickPanelStateChangedCb, this);
}

void AlarmEditViewController::_unregisterQuickPanelEvent() {
    drop(_quickPanelHandler, ecore_event_handler_del);
}

Eina_Bool AlarmEditViewController::_quickPanelStateChangedCb(void* data, int, void* event) {
    RETURN_IF_NULL(data, ECORE_CALLBACK_PASS_ON);
    RETURN_IF_NULL(event, ECORE_CALLBACK_PASS_ON);
    auto* self = static_cast<AlarmEditViewController*>(data);
    const auto* message = static_cast<Ecore_X_Event_Client_Message*>(event);
    if (message->message_type != ECORE_X_ATOM_E_ILLUME_QUICKPANEL_STATE)
        return ECORE_CALLBACK_PASS_ON;
    if (static_cast<Ecore_X_Atom>(message->data.l[0]) == ECORE_X_ATOM_E_ILLUME_QUICKPANEL_OFF) {
        if (self->volumeRow())
            self->_updateVolumeAfterQuickPanelStateChange();
        self->_registerVolumeKeyGrab();
    } else {
        self->_unregisterVolumeKeyGrab();
    }
    return ECORE_CALLBACK_PASS_ON;
}

void AlarmEditViewController::_updateVolumeAfterQuickPanelStateChange() {
    int volume = 0;
    if (sound_manager_get_volume(SOUND_TYPE_ALARM, &volume) != SOUND_MANAGER_ERROR_NONE) {
        LOG_ERROR("Failed to get recovery alarm volume");
        return;
    }
    if (AlarmVolumeItem* row = volumeRow()) {
        row->moveSlider(volume);
        row->setVolume(volume);
    }
}

void AlarmEditViewController::_soundManagerVolumeChangedCb(sound_type_e type, unsigned int volume,
                                                           void* data) {
    RETURN_IF_NULL(data);
    LOG_INFO("Sound manager volume changed [Type=%d, Volume=%d]", type, static_cast<int>(volume));
    AlarmEditViewController* self = liveEditor(data);
    if (!self)
        return;
    if (type != SOUND_TYPE_ALARM) {
        LOG_INFO("Changed volume type is not alarm. Ignore callback");
        return;
    }
    AlarmVolumeItem* row = self->volumeRow();
    if (row)
        row->moveSlider(volume);
    self->_alarm.volume = static_cast<int>(volume);
    if (row)
        row->setVolume(static_cast<int>(volume));
}

void AlarmEditViewController::endVolumeMirroring() {
    if (sound_manager_unset_volume_changed_cb() != SOUND_MANAGER_ERROR_NONE)
        LOG_ERROR("Failed to unset sound manager volume change callback");
}

bool AlarmEditViewController::_isUPSMode() const {
    int mode = 0;
    vconf_get_int(POWER_SAVING_KEY, &mode);
    LOG_INFO("Current PS mode value = %d", mode);
    return mode == ULTRA_POWER_SAVING;
}

/**
 * @file
 * @brief The alarm editor.
 */
#pragma once

#include <array>
#include <cstddef>
#include <ctime>
#include <functional>
#include <vector>

#include <Elementary.h>

#include <app_assist/WContentViewController.h>
#include <app_assist/WUiTimer.h>
#include <clock/ClockAlarmDbData.h>
#include <clock/ClockEventListener.h>
#include <device/app_control.h>
#include <device/sound_manager.h>

#include "AlarmEditViewCallerType.h"
#include "ClockUiExport.h"

class AlarmNameItem;
class AlarmRepeatItem;
class AlarmTimePickerItem;
class AlarmVolumeItem;

namespace app_assist {
class WGenlistItem;
}

namespace rules {
enum class EditorRow : int;
}

/**
 * @brief The page on which an alarm is created or edited.
 *
 * One working copy of the alarm is shared by reference with every row; a row writes what the user
 * does into it at once. Done stores it, schedules it and leaves. Leaving otherwise asks first when
 * the copy differs from what it was at the start.
 */
class CLOCK_UI_EXPORT AlarmEditViewController : public app_assist::WContentViewController,
                                                public ClockEventListener {
public:
    /**
     * @param callerType Decides how the page is left.
     * @param alarm The alarm to edit, or a record with defaults; copied.
     * @param isCreate True for a new alarm, which gets the defaults of new alarms.
     */
    AlarmEditViewController(AlarmEditViewCallerType callerType, const ClockAlarmDbData& alarm,
                            bool isCreate);
    ~AlarmEditViewController() override;

    const char* getClassName() const override;
    /** @brief Adds Cancel and Done and the title. */
    void onPushed(Elm_Object_Item* naviItem) override;
    /** @brief Lets the page go, or asks, or ends the application; see #AlarmEditViewCallerType. */
    bool onPop() override;
    void onEvent(ClockEventListener::EventType type) override;

    /** @brief Brings the rows in line with a newly chosen alert type. */
    void _onTypePopupViewSelectedCb();

    /** @name Steps of Done and the minute timer's callback; data is the editor.
     *  @{ */
    static void _saveAlarmName(void* data);
    static void _saveAlarmTime(void* data);
    static void _saveAlarmData(void* data);
    static void _registerAlarmData(void* data);
    static void _createNotiToastForTimeOffest(void* data);
    static void _createNotiToastForDuplicatedAlarm(void* data);
    static bool _updateDateTextTimerCb(void* data);
    /** @} */

    /** @brief Opens the tone picker. */
    void _onRingToneViewSelectedCb();
    /**
     * @brief Takes the tone that the picker answers with.
     * @param data The editor; one that has gone is recognised and left alone.
     */
    static void _onRingToneAppReplyCb(app_control_h request, app_control_h reply,
                                      app_control_result_e result, void* data);

    /** @name Volume keys, the quick panel and the system's volume; data is the editor.
     *  @{ */
    void _registerVolumeKeyGrab();
    void _unregisterVolumeKeyGrab();
    void _registerQuickPanelEvent();
    void _unregisterQuickPanelEvent();
    static Eina_Bool _volumeKeyDownCb(void* data, int type, void* event);
    static Eina_Bool _volumeKeyUpCb(void* data, int type, void* event);
    static Eina_Bool _volumeIncreaseLongPressTimerCb(void* data);
    static Eina_Bool _volumeDecreaseLongPressTimerCb(void* data);
    static Eina_Bool _quickPanelStateChangedCb(void* data, int type, void* event);
    static void _soundManagerVolumeChangedCb(sound_type_e type, unsigned int volume, void* data);
    /** @} */

protected:
    void onCreated() override;
    Evas_Object* onCreateView(Evas_Object* parent, void* param) override;

private:
    static constexpr std::size_t ROW_COUNT = 8;

    static void _cancelBtnClickedCb(void* data, Evas_Object* button, void* info);
    static void _doneBtnClickedCb(void* data, Evas_Object* button, void* info);
    static void _scrollDragStartCb(void* data, Evas_Object* genlist, void* info);
    static void _genlistDeletedCb(void* data, Evas* evas, Evas_Object* genlist, void* info);

    Evas_Object* addTitleButton(Elm_Object_Item* naviItem, const char* style, const char* part,
                                const char* textId, Evas_Smart_Cb clicked);
    void setTitle();
    void addThemeExtension();

    // Rows.
    void _createEditViewItems(Evas_Object* genlist);
    app_assist::WGenlistItem* makeRow(rules::EditorRow row);
    app_assist::WGenlistItem* makeTimePickerRow();
    app_assist::WGenlistItem* makeRepeatRow();
    app_assist::WGenlistItem* makeTypeRow();
    app_assist::WGenlistItem* makeToneRow();
    app_assist::WGenlistItem* makeSnoozeRow();
    app_assist::WGenlistItem* makeIncreaseVolumeRow();
    bool offersRow(rules::EditorRow row) const;
    void matchToneRowToPowerSaving();
    void showRepeatScreen();
    void showTypePopup();
    void showDatePopup();
    void insertRow(rules::EditorRow row);
    void removeRow(rules::EditorRow row);
    void refreshRow(rules::EditorRow row);
    void refreshTimePicker();
    app_assist::WGenlistItem* rowAt(rules::EditorRow row) const;
    AlarmTimePickerItem* timePickerRow() const;
    AlarmRepeatItem* repeatRow() const;
    AlarmNameItem* nameRow() const;
    AlarmVolumeItem* volumeRow() const;
    void logMissingSoundRows() const;

    // Date line.
    void _updateDateText();
    void refreshDateText();
    void refreshUndatedText();
    void armMinuteTimer();

    // Sound.
    /** The editor behind a callback's data, or null when it has gone. */
    static AlarmEditViewController* liveEditor(const void* data);
    void stopPreview();
    void _increaseVolume();
    void _decreaseVolume();
    void stepAndRepeat(void (AlarmEditViewController::*step)(), Ecore_Task_Cb repeat);
    Eina_Bool repeatStep(void (AlarmEditViewController::*step)());
    void stopRepeating();
    void _updateVolumeAfterQuickPanelStateChange();
    void endVolumeMirroring();
    bool _isUPSMode() const;

    // Saving.
    void _initialzeAlarmData();
    void storeAlarm();
    void storeOverDuplicate(int duplicateId);
    void replaceOtherAlarm(int otherId, int otherAlarmMgrId);
    void updateStoredAlarm();
    int alarmMgrIdOf(int alarmId);

    // Leaving.
    bool leaveInsideClock();
    bool leaveApplication();
    bool mayLeave() const;
    void askToDiscard(const std::function<void()>& discard);

    /** By place; null while a row is absent. The genlist owns the rows. */
    std::array<app_assist::WGenlistItem*, ROW_COUNT> _rows{};
    app_assist::WWeakPtr<app_assist::WViewController> _discardPopup;
    app_assist::WWeakPtr<app_assist::WViewController> _datePopup;
    app_assist::WWeakPtr<app_assist::WViewController> _typePopup;
    app_assist::WWeakPtr<app_assist::WViewController> _repeatScreen;
    AlarmEditViewCallerType _callerType;
    ClockAlarmDbData _alarm;
    ClockAlarmDbData _snapshot;
    std::vector<ClockAlarmDbData> _alarmList;
    bool _isCreate;
    bool _doneClicked = false;
    bool _resourcesOpen = false;
    Evas_Object* _genlist = nullptr;
    Evas_Object* _cancelButton = nullptr;
    /** The day in the date line. */
    std::tm _date{};
    app_assist::WWeakPtr<app_assist::WUiTimer> _minuteTimer;
    Ecore_Event_Handler* _keyUpHandler = nullptr;
    Ecore_Event_Handler* _keyDownHandler = nullptr;
    Ecore_Event_Handler* _quickPanelHandler = nullptr;
    Ecore_Timer* _longPressTimer = nullptr;
    bool _longPressEnded = false;
    /** The window that has the volume keys for this editor. */
    app_assist::WWeakPtr<app_assist::WViewController> _keyWindow;
};

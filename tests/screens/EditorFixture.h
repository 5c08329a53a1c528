/**
 * @file
 * @brief The alarm editor on the face, over a plain page.
 */
#pragma once

#include <ctime>
#include <string>
#include <vector>

#include <app_assist/WContentViewController.h>
#include <clock/ClockAlarmDbData.h>

#include "AlarmEditViewController.h"
#include "AlarmNameItem.h"
#include "AlarmTimePickerItem.h"
#include "support/ScreenTest.h"

/** Number of times that the application was told to exit. */
int exitRequests();
void forgetExitRequests();

/** The instant of a local time "2026-11-18 09:41:00". */
std::time_t at(const std::string& civil);
/** The local time of an instant. */
std::string civil(std::time_t instant);

class EditorFixture : public ScreenTest {
protected:
    void SetUp() override;
    void TearDown() override;

    /** Opens the editor over a plain page. */
    void openEditor(const ClockAlarmDbData& alarm, bool isCreate,
                    AlarmEditViewCallerType caller = ALARM_EDIT_VIEW_CALLER_CLOCK);
    void createAlarm() { openEditor(ClockAlarmDbData(), true); }
    void editAlarm(const ClockAlarmDbData& alarm) { openEditor(alarm, false); }

    /** Stores an alarm with its schedule, as an earlier Done would have. */
    ClockAlarmDbData storedAlarm(int hour, int minute);
    static std::vector<ClockAlarmDbData> storedAlarms();
    /** "CK08 Name entered" and so on, the oldest first. */
    static std::vector<std::string> usageEvents();

    bool isOpen() const { return static_cast<bool>(_editorAlive); }
    bool asksToDiscard() { return stage().shows("Discard changes"); }
    AlarmEditViewController& editor() { return *_editor; }
    Evas_Object* genlist();
    /** The row of a kind; null when there is none. */
    template <class RowClass>
    RowClass* rowOf() {
        for (Elm_Object_Item* item = elm_genlist_first_item_get(genlist()); item;
             item = elm_genlist_item_next_get(item)) {
            if (auto* found = dynamic_cast<RowClass*>(
                    static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(item))))
                return found;
        }
        return nullptr;
    }
    AlarmTimePickerItem& timePickerRow();
    AlarmNameItem& nameRow();
    Evas_Object* picker() { return timePickerRow().getDateTimeObj(); }
    std::string dateText();
    /** Turns the wheels to a time, as a person would, by the signal that they raise. */
    void pick(int hour, int minute);
    /** Scrolls to the name, taps it and types. */
    void typeName(const std::string& name);
    /** Goes to a row and taps it. */
    template <class RowClass>
    void tapRow() {
        stage().tapRow(rowOf<RowClass>()->getElmObjectItem());
        stage().settle();
    }
    /** Chooses an alert type by its label. */
    void chooseType(const std::string& label);
    void tapCancel() { tapTitle("Cancel"); }
    void tapDone() { tapTitle("Done"); }
    /** Taps a button of the popup, which is nearer than a title button of that name. */
    void tapQuestion(const std::string& text);
    /** Error lines, without those about an empty name and an unfocused field. */
    std::vector<std::string> errorLines();

private:
    void tapTitle(const std::string& text);

    AlarmEditViewController* _editor = nullptr;
    app_assist::WWeakPtr<app_assist::WViewController> _editorAlive;
};

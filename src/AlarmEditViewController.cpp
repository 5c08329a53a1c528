#define LOG_TAG "alarm-ui-common"
#include "AlarmEditViewController.h"

#include <memory>
#include <string>
#include <unordered_set>

#include <app_assist/WGenlistItem.h>
#include <app_assist/WNaviframeController.h>
#include <device/app_resource_manager.h>

#include "AlarmDatePopupViewController.h"
#include "AlarmDiscardPopupViewController.h"
#include "AlarmIncreaseVolumeItem.h"
#include "AlarmNameItem.h"
#include "AlarmRepeatItem.h"
#include "AlarmRepeatViewController.h"
#include "AlarmSnoozeItem.h"
#include "AlarmTimePickerItem.h"
#include "AlarmToneItem.h"
#include "AlarmTypeItem.h"
#include "AlarmTypePopupViewController.h"
#include "AlarmVolumeItem.h"
#include "ItemClass.h"
#include "NullData.h"
#include "ThemePath.h"
#include "rules/AlarmChange.h"
#include "rules/DateLine.h"
#include "rules/EditorRows.h"
#include "rules/RingDay.h"

using rules::EditorRow;

namespace {

constexpr std::size_t EXPECTED_ALARMS = 20;
// The rows whose texts the list does not translate by itself.
constexpr std::array TRANSLATED_ROWS = {EditorRow::Repeat,         EditorRow::Type,
                                        EditorRow::Tone,           EditorRow::Snooze,
                                        EditorRow::IncreaseVolume, EditorRow::Name};

bool isThemeExtension(const std::string& path) {
    for (const Eina_List* node = elm_theme_extension_list_get(nullptr); node;
         node = eina_list_next(node)) {
        if (path == static_cast<const char*>(eina_list_data_get(node)))
            return true;
    }
    return false;
}

rules::EditorRowSet
presentRows(const std::array<app_assist::WGenlistItem*, rules::EDITOR_ROW_COUNT>& rows) {
    rules::EditorRowSet present;
    for (std::size_t place = 0; place < rows.size(); ++place)
        present.set(place, rows.at(place) != nullptr);
    return present;
}

// Leaves what the row holds beside its texts: a person may just be typing the name.
void translate(const app_assist::WGenlistItem* row) {
    if (row)
        elm_genlist_item_fields_update(row->getElmObjectItem(), "*", ELM_GENLIST_ITEM_FIELD_TEXT);
}

// One that is on its way out does not count.
bool isOpen(const app_assist::WWeakPtr<app_assist::WViewController>& controller) {
    return controller && !controller->isDying();
}

// Answers of other applications and of the system may come after the editor they were meant for.
std::unordered_set<const void*>& liveEditors() {
    static std::unordered_set<const void*> editors;
    return editors;
}

} // namespace

AlarmEditViewController::AlarmEditViewController(AlarmEditViewCallerType callerType,
                                                 const ClockAlarmDbData& alarm, bool isCreate)
    : _callerType(callerType), _alarm(alarm), _snapshot(), _isCreate(isCreate) {
    _alarmList.reserve(EXPECTED_ALARMS);
    liveEditors().insert(this);
}

AlarmEditViewController::~AlarmEditViewController() {
    liveEditors().erase(this);
    _unregisterVolumeKeyGrab();
    _unregisterQuickPanelEvent();
    if (_genlist)
        evas_object_event_callback_del_full(_genlist, EVAS_CALLBACK_DEL, _genlistDeletedCb, this);
    // It edits this editor's record.
    if (isOpen(_repeatScreen))
        _repeatScreen->destroy();
    if (_resourcesOpen)
        app_resource_manager_release();
    app_assist::WUiTimer::destroy(_minuteTimer);
}

AlarmEditViewController* AlarmEditViewController::liveEditor(const void* data) {
    const auto& editors = liveEditors();
    if (!editors.contains(data)) {
        LOG_WARNING("The editor has gone, nothing to do");
        return nullptr;
    }
    return static_cast<AlarmEditViewController*>(const_cast<void*>(data));
}

const char* AlarmEditViewController::getClassName() const {
    return "AlarmEditViewController";
}

Evas_Object* AlarmEditViewController::onCreateView(Evas_Object* parent, void*) {
    app_resource_manager_init();
    _resourcesOpen = true;
    addThemeExtension();
    Evas_Object* genlist = elm_genlist_add(parent);
    if (!genlist)
        return nullptr;
    elm_genlist_mode_set(genlist, ELM_LIST_COMPRESS);
    evas_object_size_hint_weight_set(genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_set(genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
    evas_object_event_callback_add(genlist, EVAS_CALLBACK_DEL, _genlistDeletedCb, this);
    evas_object_smart_callback_add(genlist, "scroll,drag,start", _scrollDragStartCb, this);
    _initialzeAlarmData();
    _createEditViewItems(genlist);
    return genlist;
}

void AlarmEditViewController::onCreated() {
    _registerVolumeKeyGrab();
    _registerQuickPanelEvent();
}

void AlarmEditViewController::addThemeExtension() {
    const std::string path = themePath("edje/AlarmCustomTheme.edj");
    // The toolkit would add it again each time the editor opens, and rebuild every widget.
    if (!path.empty() && !isThemeExtension(path))
        elm_theme_extension_add(nullptr, path.c_str());
}

void AlarmEditViewController::_scrollDragStartCb(void* data, Evas_Object*, void*) {
    RETURN_IF_NULL(data);
    auto* self = static_cast<AlarmEditViewController*>(data);
    if (self->_alarm.type == CLOCK_ALARM_TYPE_VIBRATION)
        return;
    if (AlarmVolumeItem* row = self->volumeRow())
        row->stopSound();
}

void AlarmEditViewController::_genlistDeletedCb(void* data, Evas*, Evas_Object*, void*) {
    auto* self = static_cast<AlarmEditViewController*>(data);
    self->_rows.fill(nullptr);
    self->_genlist = nullptr;
}

void AlarmEditViewController::onPushed(Elm_Object_Item* naviItem) {
    _cancelButton = addTitleButton(naviItem, "naviframe/title_left", "title_left_btn",
                                   "IDS_TPLATFORM_ACBUTTON_CANCEL_ABB", _cancelBtnClickedCb);
    addTitleButton(naviItem, "naviframe/title_right", "title_right_btn",
                   "IDS_TPLATFORM_ACBUTTON_DONE_ABB", _doneBtnClickedCb);
    setTitle();
}

Evas_Object* AlarmEditViewController::addTitleButton(Elm_Object_Item* naviItem, const char* style,
                                                     const char* part, const char* textId,
                                                     Evas_Smart_Cb clicked) {
    Evas_Object* button = elm_button_add(elm_object_item_widget_get(naviItem));
    elm_object_style_set(button, style);
    elm_object_domain_translatable_text_set(button, nullptr, textId);
    evas_object_smart_callback_add(button, "clicked", clicked, this);
    elm_object_item_part_content_set(naviItem, part, button);
    return button;
}

void AlarmEditViewController::setTitle() {
    if (!getNaviItem())
        return;
    elm_object_item_domain_translatable_part_text_set(getNaviItem(), "elm.text.title", nullptr,
                                                      _isCreate ? "IDS_COM_BODY_CREATE"
                                                                : "IDS_COM_SK_EDIT");
}

void AlarmEditViewController::_cancelBtnClickedCb(void* data, Evas_Object*, void*) {
    RETURN_IF_NULL(data);
    static_cast<AlarmEditViewController*>(data)->popOut();
}

void AlarmEditViewController::_doneBtnClickedCb(void* data, Evas_Object*, void*) {
    RETURN_IF_NULL(data);
    auto* self = static_cast<AlarmEditViewController*>(data);
    // The second tap of a hasty double tap must not save again.
    if (self->_doneClicked)
        return;
    self->_doneClicked = true;
    _saveAlarmName(self);
    _saveAlarmTime(self);
    _saveAlarmData(self);
    _registerAlarmData(self);
    self->popOut();
}

void AlarmEditViewController::_createEditViewItems(Evas_Object* genlist) {
    _genlist = genlist;
    _date = rules::localTime(std::time(nullptr));
    for (const EditorRow row : rules::EDITOR_ROWS)
        if (offersRow(row))
            insertRow(row);
    logMissingSoundRows();
    armMinuteTimer();
}

void AlarmEditViewController::logMissingSoundRows() const {
    if (_alarm.type != CLOCK_ALARM_TYPE_VIBRATION)
        return;
    LOG_ERROR("Sound Type is [%d]. So there is no Volume, Tone item", _alarm.type);
    LOG_ERROR("Sound Type is [%d]. So there is no Increase Volume", _alarm.type);
}

bool AlarmEditViewController::offersRow(EditorRow row) const {
    return rules::hasRow(row, _alarm.type) && (row != EditorRow::Tone || !_isUPSMode());
}

app_assist::WGenlistItem* AlarmEditViewController::makeRow(EditorRow row) {
    switch (row) {
    case EditorRow::TimePicker:
        return makeTimePickerRow();
    case EditorRow::Repeat:
        return makeRepeatRow();
    case EditorRow::Type:
        return makeTypeRow();
    case EditorRow::Volume:
        return new AlarmVolumeItem(_alarm);
    case EditorRow::Tone:
        return makeToneRow();
    case EditorRow::Snooze:
        return makeSnoozeRow();
    case EditorRow::IncreaseVolume:
        return makeIncreaseVolumeRow();
    case EditorRow::Name:
        return new AlarmNameItem(_alarm);
    }
    return nullptr;
}

app_assist::WGenlistItem* AlarmEditViewController::makeTimePickerRow() {
    auto* row = new AlarmTimePickerItem(_alarm, _date);
    row->setDateBtnSelectedCb([this] { showDatePopup(); });
    return row;
}

app_assist::WGenlistItem* AlarmEditViewController::makeRepeatRow() {
    auto* row = new AlarmRepeatItem(_alarm);
    row->setSelectedCb([this] { showRepeatScreen(); });
    return row;
}

app_assist::WGenlistItem* AlarmEditViewController::makeTypeRow() {
    auto* row = new AlarmTypeItem(_alarm);
    row->setSelectedCb([this] { showTypePopup(); });
    return row;
}

app_assist::WGenlistItem* AlarmEditViewController::makeToneRow() {
    auto* row = new AlarmToneItem(_alarm);
    row->setSelectedCb([this] { _onRingToneViewSelectedCb(); });
    return row;
}

app_assist::WGenlistItem* AlarmEditViewController::makeSnoozeRow() {
    auto* row = new AlarmSnoozeItem(_alarm);
    row->setSelectedCb([this] { stopPreview(); });
    return row;
}

app_assist::WGenlistItem* AlarmEditViewController::makeIncreaseVolumeRow() {
    auto* row = new AlarmIncreaseVolumeItem(_alarm);
    row->setSelectedCb([this] { stopPreview(); });
    return row;
}

void AlarmEditViewController::showDatePopup() {
    if (isOpen(_datePopup))
        return;
    auto* popup = new AlarmDatePopupViewController(_alarm, timePickerRow(), repeatRow(), _date);
    _datePopup = popup->getWeakPtr();
    attachPopup(popup);
}

void AlarmEditViewController::showTypePopup() {
    if (isOpen(_typePopup))
        return;
    auto* popup = new AlarmTypePopupViewController(_alarm);
    _typePopup = popup->getWeakPtr();
    popup->setSelectedCb([this] { _onTypePopupViewSelectedCb(); });
    attachPopup(popup);
}

void AlarmEditViewController::showRepeatScreen() {
    if (isOpen(_repeatScreen))
        return;
    auto* screen = new AlarmRepeatViewController(_alarm);
    _repeatScreen = screen->getWeakPtr();
    screen->setSelectedCb([this] {
        refreshRow(EditorRow::Repeat);
        _updateDateText();
    });
    getNaviframeController()->push(screen);
}

void AlarmEditViewController::insertRow(EditorRow place) {
    app_assist::WGenlistItem* row = makeRow(place);
    if (!row)
        return;
    const ItemClass itemClass(row->getItemClassNew());
    const auto above = rules::rowAbove(place, presentRows(_rows));
    Elm_Object_Item* item =
        above ? elm_genlist_item_insert_after(_genlist, itemClass.get(), row, nullptr,
                                              rowAt(*above)->getElmObjectItem(),
                                              ELM_GENLIST_ITEM_NONE, row->getSelectCb(), row)
              : elm_genlist_item_prepend(_genlist, itemClass.get(), row, nullptr,
                                         ELM_GENLIST_ITEM_NONE, row->getSelectCb(), row);
    row->setElmObjectItem(item);
    _rows.at(rules::placeOf(place)) = row;
    if (place == EditorRow::Name)
        elm_genlist_item_select_mode_set(item, ELM_OBJECT_SELECT_MODE_DISPLAY_ONLY);
}

void AlarmEditViewController::removeRow(EditorRow place) {
    app_assist::WGenlistItem*& row = _rows.at(rules::placeOf(place));
    if (!row)
        return;
    elm_object_item_del(row->getElmObjectItem());
    row = nullptr;
}

void AlarmEditViewController::refreshRow(EditorRow place) {
    if (app_assist::WGenlistItem* row = rowAt(place))
        elm_genlist_item_update(row->getElmObjectItem());
}

void AlarmEditViewController::refreshTimePicker() {
    // The row would show a date of the time before the repeat days, and drop them once it is over.
    rules::dropDatesOfWeekly(_alarm);
    if (AlarmTimePickerItem* row = timePickerRow())
        row->renewContent();
    refreshRow(EditorRow::TimePicker);
}

app_assist::WGenlistItem* AlarmEditViewController::rowAt(EditorRow row) const {
    return _rows.at(rules::placeOf(row));
}

AlarmTimePickerItem* AlarmEditViewController::timePickerRow() const {
    return static_cast<AlarmTimePickerItem*>(rowAt(EditorRow::TimePicker));
}

AlarmRepeatItem* AlarmEditViewController::repeatRow() const {
    return static_cast<AlarmRepeatItem*>(rowAt(EditorRow::Repeat));
}

AlarmNameItem* AlarmEditViewController::nameRow() const {
    return static_cast<AlarmNameItem*>(rowAt(EditorRow::Name));
}

AlarmVolumeItem* AlarmEditViewController::volumeRow() const {
    return static_cast<AlarmVolumeItem*>(rowAt(EditorRow::Volume));
}

void AlarmEditViewController::_onTypePopupViewSelectedCb() {
    switch (rules::soundRowsChange(_alarm.type, presentRows(_rows))) {
    case rules::SoundRowsChange::Insert:
        for (const EditorRow row : rules::SOUND_ROWS)
            if (offersRow(row))
                insertRow(row);
        break;
    case rules::SoundRowsChange::RefreshIcon:
        if (AlarmVolumeItem* row = volumeRow())
            row->_updateVolumeIcon(row->getSliderObj());
        break;
    case rules::SoundRowsChange::Remove:
        if (AlarmVolumeItem* row = volumeRow())
            row->stopSound();
        for (const EditorRow row : rules::SOUND_ROWS)
            removeRow(row);
        break;
    case rules::SoundRowsChange::None:
        break;
    }
    refreshRow(EditorRow::Type);
}

void AlarmEditViewController::onEvent(ClockEventListener::EventType type) {
    switch (type) {
    case ClockEventListener::TIME_CHANGED:
        refreshUndatedText();
        refreshTimePicker();
        break;
    case ClockEventListener::LANGUAGE_CHANGED:
        _updateDateText();
        setTitle();
        for (const EditorRow row : TRANSLATED_ROWS)
            translate(rowAt(row));
        refreshTimePicker();
        break;
    case ClockEventListener::PAUSED:
        app_assist::WUiTimer::destroy(_minuteTimer);
        stopPreview();
        break;
    case ClockEventListener::RESUMED:
        refreshDateText();
        matchToneRowToPowerSaving();
        endVolumeMirroring();
        armMinuteTimer();
        break;
    default:
        break;
    }
}

void AlarmEditViewController::matchToneRowToPowerSaving() {
    if (!rules::hasRow(EditorRow::Tone, _alarm.type))
        return;
    const bool offered = offersRow(EditorRow::Tone);
    if (offered && !rowAt(EditorRow::Tone))
        insertRow(EditorRow::Tone);
    else if (!offered)
        removeRow(EditorRow::Tone);
}

bool AlarmEditViewController::onPop() {
    stopPreview();
    switch (_callerType) {
    case ALARM_EDIT_VIEW_CALLER_CLOCK:
        return leaveInsideClock();
    case ALARM_EDIT_VIEW_CALLER_OTHER_APPLICATION:
        return leaveApplication();
    }
    LOG_ERROR("_callerType is ERROR !! Please check it");
    elm_exit();
    return false;
}

bool AlarmEditViewController::mayLeave() const {
    return _doneClicked || !rules::isChanged(_alarm, _snapshot);
}

bool AlarmEditViewController::leaveInsideClock() {
    if (mayLeave())
        return true;
    askToDiscard([this] { destroy(); });
    return false;
}

bool AlarmEditViewController::leaveApplication() {
    if (mayLeave())
        elm_exit();
    else
        askToDiscard([] { elm_exit(); });
    return false;
}

void AlarmEditViewController::askToDiscard(const std::function<void()>& discard) {
    // One question is enough, however often the page is asked to leave.
    if (isOpen(_discardPopup))
        return;
    if (_cancelButton)
        elm_object_focus_set(_cancelButton, EINA_TRUE);
    auto* popup = new AlarmDiscardPopupViewController;
    _discardPopup = popup->getWeakPtr();
    popup->setDiscardBtnSelectedCb(discard);
    attachPopup(popup);
}

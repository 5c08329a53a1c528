#include "QuickPanel.h"

#include <algorithm>
#include <utility>

#include <Elementary.h>

#include "VolumeView.h"
#include "WatchFace.h"
#include "app_assist/WAccessible.h"
#include "clock/ClockText.h"
#include "device/eext.h"
#include "device/sound_manager.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {

namespace {
constexpr double REFRESH_SECONDS = 0.5;
constexpr int LOUDEST = 15;
constexpr const char* TITLE = "IDS_QP_HEADER_ALARM_VOLUME";
} // namespace

QuickPanel::QuickPanel(Evas_Object* window, const std::string& theme,
                       std::function<void(bool shown)> changed)
    : _layout(elm_layout_add(window)), _changed(std::move(changed)) {
    if (!elm_layout_file_set(_layout, theme.c_str(), "simulator/quickpanel"))
        LOG_ERROR("'%s' has no quick panel", theme.c_str());
    app_assist::prepareAnnouncements(_layout);
    elm_object_domain_translatable_part_text_set(_layout, "panel.title", nullptr, TITLE);
    elm_object_domain_translatable_part_text_set(_layout, "panel.hint", nullptr,
                                                 "IDS_QP_BODY_PRESS_THE_VOLUME_KEYS_TO_CHANGE_IT");
    elm_object_signal_callback_add(_layout, "panel,close", "simulator", _closeCb, this);
    evas_object_smart_callback_add(_layout, "language,changed", _languageChangedCb, this);
    evas_object_resize(_layout, FACE_SIZE, FACE_SIZE);
    evas_object_layer_set(_layout, LAYER_SYSTEM);
    evas_object_show(_layout);
}

QuickPanel::~QuickPanel() {
    evas_object_del(_layout);
}

void QuickPanel::toggle() {
    if (isShown())
        close();
    else
        open();
}

void QuickPanel::open() {
    refresh();
    _timer.reset(ecore_timer_add(REFRESH_SECONDS, _refreshCb, this));
    // The back key closes the panel, not what lies below it.
    eext_object_event_callback_add(_layout, EEXT_EVENT_BACK, _backCb, this);
    evas_object_event_callback_add(_layout, EVAS_CALLBACK_MOUSE_WHEEL, _bezelCb, this);
    elm_object_signal_emit(_layout, "panel,show", "simulator");
    app_assist::announce(_layout, readText());
    _changed(true);
}

void QuickPanel::close() {
    _timer.reset();
    eext_object_event_callback_del(_layout, EEXT_EVENT_BACK, _backCb);
    evas_object_event_callback_del_full(_layout, EVAS_CALLBACK_MOUSE_WHEEL, _bezelCb, this);
    elm_object_signal_emit(_layout, "panel,hide", "simulator");
    app_assist::endAnnouncement(_layout);
    _changed(false);
}

void QuickPanel::refresh() {
    int level = 0;
    sound_manager_get_volume(SOUND_TYPE_ALARM, &level);
    if (std::exchange(_level, level) == level)
        return;
    setVolumeLevel(_layout, level);
    if (isShown())
        app_assist::setAccessibleName(_layout, readText());
}

std::string QuickPanel::readText() const {
    return std::string(clockText(TITLE)) + ", " + std::to_string(_level) + " / " +
           std::to_string(LOUDEST);
}

void QuickPanel::_languageChangedCb(void* data, Evas_Object* layout, void*) {
    const auto* self = static_cast<QuickPanel*>(data);
    if (self->isShown())
        app_assist::setAccessibleName(layout, self->readText());
}

Eina_Bool QuickPanel::_refreshCb(void* data) {
    static_cast<QuickPanel*>(data)->refresh();
    return ECORE_CALLBACK_RENEW;
}

/** There is one thing here to turn. */
void QuickPanel::_bezelCb(void* data, Evas*, Evas_Object*, void* info) {
    const auto* event = static_cast<Evas_Event_Mouse_Wheel*>(info);
    int level = 0;
    sound_manager_get_volume(SOUND_TYPE_ALARM, &level);
    level = std::clamp(level + event->z, 0, LOUDEST);
    if (sound_manager_set_volume(SOUND_TYPE_ALARM, level) != SOUND_MANAGER_ERROR_NONE)
        LOG_ERROR("The alarm's volume cannot be set to %d", level);
    static_cast<QuickPanel*>(data)->refresh();
}

void QuickPanel::_closeCb(void* data, Evas_Object*, const char*, const char*) {
    auto* self = static_cast<QuickPanel*>(data);
    if (self->isShown())
        self->close();
}

void QuickPanel::_backCb(void* data, Evas_Object*, void*) {
    static_cast<QuickPanel*>(data)->close();
}

} // namespace simulator

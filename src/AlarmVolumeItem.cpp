#define LOG_TAG "alarm-ui-common"
#include "AlarmVolumeItem.h"

#include <string>
#include <string_view>

#include <Elementary.h>

#include <app_assist/WAccessible.h>
#include <clock/ClockSoundPlayer.h>
#include <clock/ClockText.h>

#include "NullData.h"
#include "ThemePath.h"
#include "rules/VolumeLevel.h"

namespace {

constexpr const char* TITLE = "IDS_QP_HEADER_ALARM_VOLUME";

} // namespace

AlarmVolumeItem::AlarmVolumeItem(ClockAlarmDbData& alarm) : _alarm(alarm) {}

AlarmVolumeItem::~AlarmVolumeItem() {
    // The list may delete the row before the widgets.
    for (Evas_Object* slider : _sliders.all()) {
        evas_object_smart_callback_del_full(slider, "changed", _volumeSliderChangeCb, this);
        evas_object_smart_callback_del_full(slider, "slider,drag,stop", _volumeSliderStopCb, this);
        evas_object_smart_callback_del_full(slider, "language,changed", _languageChangedCb, this);
        while (evas_object_smart_callback_del_full(slider, "unfocused", _volumeSliderUnfocusedCb,
                                                   this)) {
        }
    }
}

Elm_Genlist_Item_Class* AlarmVolumeItem::getItemClassNew() {
    Elm_Genlist_Item_Class* itemClass = elm_genlist_item_class_new();
    itemClass->item_style = "1icon";
    itemClass->func.content_get = _getVolumeItemContent;
    // A finger may be on the slider while the list measures the row again.
    itemClass->func.reusable_content_get = _keepVolumeItemContent;
    itemClass->func.del = deleteCb;
    return itemClass;
}

void AlarmVolumeItem::onSelect(Elm_Object_Item*) {
    if (_selected)
        _selected();
}

/** The row itself has no text that a screen reader could read while it is out of sight. */
void AlarmVolumeItem::onSetElmObjectItem(Elm_Object_Item* item) {
    app_assist::setAccessibleTextId(item, TITLE);
}

void AlarmVolumeItem::setSelectedCb(const std::function<void()>& selected) {
    _selected = selected;
}

Evas_Object* AlarmVolumeItem::getSliderObj() const {
    return _sliders.newest();
}

void AlarmVolumeItem::moveSlider(double value) {
    for (Evas_Object* slider : _sliders.all())
        elm_slider_value_set(slider, value);
}

void AlarmVolumeItem::stopSound() {
    _player.reset();
}

void AlarmVolumeItem::setVolume(int volume) {
    if (!rules::mayBeReplaced(_alarm.volume)) {
        LOG_ERROR("volume in not valid(%d), return", volume);
        return;
    }
    _alarm.volume = volume;
}

void AlarmVolumeItem::increaseVolume() {
    step(rules::louderLevel(_alarm.volume));
}

void AlarmVolumeItem::decreaseVolume() {
    step(rules::quieterLevel(_alarm.volume));
}

void AlarmVolumeItem::step(std::optional<std::int32_t> level) {
    if (!level)
        return;
    _alarm.volume = *level;
    _updateVolumeIconAndPlayer();
}

Evas_Object* AlarmVolumeItem::_getVolumeItemContent(void* data, Evas_Object* genlist,
                                                    const char* part) {
    RETURN_IF_NULL(data, nullptr);
    auto* self = static_cast<AlarmVolumeItem*>(data);
    self->_parent = genlist;
    if (std::string_view(part ? part : "") != "elm.icon")
        return nullptr;
    return self->createSlider(genlist);
}

Evas_Object* AlarmVolumeItem::_keepVolumeItemContent(void* data, Evas_Object*, const char*,
                                                     Evas_Object* old) {
    RETURN_IF_NULL(data, nullptr);
    return static_cast<AlarmVolumeItem*>(data)->_sliders.reusable(old);
}

Evas_Object* AlarmVolumeItem::createSlider(Evas_Object* genlist) {
    Evas_Object* slider = elm_slider_add(genlist);
    if (!slider) {
        LOG_ERROR("slider is NULL !!");
        return nullptr;
    }
    elm_slider_indicator_show_set(slider, EINA_FALSE);
    evas_object_size_hint_weight_set(slider, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_set(slider, EVAS_HINT_FILL, EVAS_HINT_FILL);
    evas_object_propagate_events_set(slider, EINA_FALSE);
    elm_slider_min_max_set(slider, rules::QUIETEST_LEVEL, rules::LOUDEST_LEVEL);
    elm_slider_value_set(slider, _alarm.volume);
    _sliders.add(slider);
    _updateVolumeIcon(genlist);
    evas_object_smart_callback_add(slider, "changed", _volumeSliderChangeCb, this);
    evas_object_smart_callback_add(slider, "slider,drag,stop", _volumeSliderStopCb, this);
    evas_object_smart_callback_add(slider, "language,changed", _languageChangedCb, this);
    return slider;
}

void AlarmVolumeItem::_volumeSliderChangeCb(void* data, Evas_Object* slider, void*) {
    RETURN_IF_NULL(data);
    auto* self = static_cast<AlarmVolumeItem*>(data);
    const std::int32_t level = rules::levelOf(elm_slider_value_get(slider));
    if (level == self->_alarm.volume)
        return;
    self->_alarm.volume = level;
    self->_updateVolumeIcon(slider);
    self->_updatePlayerSound();
    evas_object_smart_callback_add(slider, "unfocused", _volumeSliderUnfocusedCb, self);
}

void AlarmVolumeItem::_volumeSliderStopCb(void* data, Evas_Object* slider, void*) {
    RETURN_IF_NULL(data);
    if (const auto snap = rules::snapOf(elm_slider_value_get(slider)))
        elm_slider_value_set(slider, *snap);
}

void AlarmVolumeItem::_volumeSliderUnfocusedCb(void* data, Evas_Object* slider, void*) {
    RETURN_IF_NULL(data);
    static_cast<AlarmVolumeItem*>(data)->stopSound();
    evas_object_smart_callback_del_full(slider, "unfocused", _volumeSliderUnfocusedCb, data);
}

void AlarmVolumeItem::_updateVolumeIcon(Evas_Object* parent) {
    const std::string path = themePath("edje/AlarmEditViewController.edj");
    const char* group = rules::volumeIconGroup(_alarm.volume, _alarm.type);
    nameSliders();
    for (Evas_Object* slider : _sliders.all()) {
        Evas_Object* icon = elm_image_add(parent ? parent : slider);
        if (!path.empty())
            elm_image_file_set(icon, path.c_str(), group);
        evas_object_size_hint_aspect_set(icon, EVAS_ASPECT_CONTROL_VERTICAL, 1, 1);
        elm_object_part_content_set(slider, "elm.swallow.icon", icon);
    }
}

void AlarmVolumeItem::nameSliders() {
    const std::string name = std::string(clockText(TITLE)) + ", " + std::to_string(_alarm.volume) +
                             " / " + std::to_string(static_cast<int>(rules::LOUDEST_LEVEL));
    for (Evas_Object* slider : _sliders.all())
        app_assist::setAccessibleName(slider, name);
}

void AlarmVolumeItem::_languageChangedCb(void* data, Evas_Object*, void*) {
    RETURN_IF_NULL(data);
    static_cast<AlarmVolumeItem*>(data)->nameSliders();
}

void AlarmVolumeItem::_updatePlayerSound() {
    if (_player) {
        _player->setVolume(_alarm.volume);
        _player->start();
        return;
    }
    _player = std::make_unique<ClockSoundPlayer>();
    _player->initialize(_alarm.soundPath, _alarm.soundPath, CLOCK_SOUND_TYPE_PREVIEW, _alarm.volume,
                        0, true, _alarm.tonePosition);
}

void AlarmVolumeItem::_updateVolumeIconAndPlayer() {
    moveSlider(_alarm.volume);
    _updateVolumeIcon(_parent);
    _updatePlayerSound();
}

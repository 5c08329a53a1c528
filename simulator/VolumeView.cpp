#include "VolumeView.h"

#include <Elementary.h>

#include "WatchFace.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {
namespace {

constexpr double SHOWN_SECONDS = 1.5;
constexpr double LOUDEST = 15;

} // namespace

void setVolumeLevel(Evas_Object* layout, int level) {
    const double part = level / LOUDEST;
    const bool mirrored = elm_object_mirrored_get(layout) != EINA_FALSE;
    edje_object_part_drag_value_set(elm_layout_edje_get(layout), "volume.end",
                                    mirrored ? 1 - part : part, 0);
    elm_object_part_text_set(layout, "volume.number", std::to_string(level).c_str());
    elm_object_signal_emit(layout, level > 0 ? "volume,sounds" : "volume,silent", "simulator");
}

VolumeView::VolumeView(Evas_Object* window, const std::string& theme)
    : _layout(elm_layout_add(window)) {
    if (!elm_layout_file_set(_layout, theme.c_str(), "simulator/volume"))
        LOG_ERROR("'%s' has no volume", theme.c_str());
    evas_object_resize(_layout, FACE_SIZE, FACE_SIZE);
    evas_object_layer_set(_layout, LAYER_SYSTEM);
    evas_object_show(_layout);
}

VolumeView::~VolumeView() {
    evas_object_del(_layout);
}

void VolumeView::show(int level) {
    setVolumeLevel(_layout, level);
    elm_object_signal_emit(_layout, "volume,show", "simulator");
    _timer.reset(ecore_timer_add(SHOWN_SECONDS, _timeOverCb, this));
}

Eina_Bool VolumeView::_timeOverCb(void* data) {
    auto* self = static_cast<VolumeView*>(data);
    // The main loop deletes the timer of a callback that cancels.
    static_cast<void>(self->_timer.release());
    elm_object_signal_emit(self->_layout, "volume,hide", "simulator");
    return ECORE_CALLBACK_CANCEL;
}

} // namespace simulator

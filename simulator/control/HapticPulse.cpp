#include "HapticPulse.h"

#include <utility>

#include <Elementary.h>

#include "WatchFace.h"
#include "device_host.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {

HapticPulse::HapticPulse(Evas_Object* window, const std::string& theme, std::function<void()> felt)
    : _layout(elm_layout_add(window)), _felt(std::move(felt)) {
    if (!elm_layout_file_set(_layout, theme.c_str(), "simulator/haptic"))
        LOG_ERROR("'%s' has no haptic ring", theme.c_str());
    evas_object_resize(_layout, FACE_SIZE, FACE_SIZE);
    evas_object_layer_set(_layout, LAYER_TOAST);
    evas_object_pass_events_set(_layout, EINA_TRUE);
    evas_object_show(_layout);
    device_host_set_haptic_callback(_hapticCb, this);
}

HapticPulse::~HapticPulse() {
    device_host_set_haptic_callback(nullptr, nullptr);
    evas_object_del(_layout);
}

void HapticPulse::_hapticCb(int, void* data) {
    auto* self = static_cast<HapticPulse*>(data);
    elm_object_signal_emit(self->_layout, "haptic,pulse", "simulator");
    self->_felt();
}

} // namespace simulator

#include "screens/EmittedSignals.h"

#include <string_view>
#include <utility>

#include <dlfcn.h>

namespace {

std::vector<EmittedSignal> emitted;

bool isOn(Evas_Object* object) {
    const char* const type = elm_object_widget_type_get(object);
    return type && std::string_view(type).find("Check") != std::string_view::npos &&
           elm_check_state_get(object);
}

} // namespace

// Comes before the toolkit's, which itself emits by other functions.
extern "C" __attribute__((visibility("default"))) void
elm_object_signal_emit(Evas_Object* object, const char* emission, const char* source) {
    using Emit = void (*)(Evas_Object*, const char*, const char*);
    static const auto emit = reinterpret_cast<Emit>(dlsym(RTLD_NEXT, "elm_object_signal_emit"));
    emitted.push_back({object, emission, source, isOn(object)});
    emit(object, emission, source);
}

std::vector<EmittedSignal> takeEmittedSignals() {
    return std::exchange(emitted, {});
}

std::vector<std::string> takeSignalsTo(const Evas_Object* object) {
    std::vector<std::string> signals;
    for (const EmittedSignal& signal : takeEmittedSignals()) {
        if (signal.object == object)
            signals.push_back(signal.source + ": " + signal.signal);
    }
    return signals;
}

SignalCount::SignalCount(Evas_Object* object, const char* signal) {
    elm_object_signal_callback_add(
        object, signal, "elm",
        [](void* data, Evas_Object*, const char*, const char*) {
            ++static_cast<SignalCount*>(data)->_count;
        },
        this);
}

#include "PickCity.h"

#include <Elementary.h>

#include "WorldClockAddCityViewController.h"
#include "app_assist/WWindowController.h"
#include "device_app.h"

namespace simulator {
namespace {

constexpr const char* APPLICATION_ID = "com.vendra.clock.city-picker";

} // namespace

bool isCityPicker(const std::string& program) {
    return program.substr(program.rfind('/') + 1) == APPLICATION_ID;
}

app_assist::WContentViewController* makeCityPicker() {
    return new WorldClockAddCityViewController(ADD_CITY_CALLER_APP_CONTROL,
                                               device_app_launch_request());
}

void attachToCaller(const app_assist::WWindowController& window) {
    device_app_place_window(window.getEvasObj());
    device_app_set_caller_gone_callback([](void*) { elm_exit(); }, nullptr);
}

void detachFromCaller() {
    device_app_set_caller_gone_callback(nullptr, nullptr);
}

} // namespace simulator

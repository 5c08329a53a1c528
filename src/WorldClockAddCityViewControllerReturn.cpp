// What becomes of the chosen city.
#define LOG_TAG "WORLDCLOCK"
#include "WorldClockAddCityViewController.h"

#include <array>
#include <string>
#include <utility>

#include <base/Log.h>
#include <base/Text.h>
#include <clock/ClockText.h>
#include <clock/ClockWorldClockDbModel.h>
#include <device/notification.h>

#include "NullData.h"

namespace {

constexpr std::size_t MAX_EXTRA_BYTES = 63;
constexpr std::size_t MAX_TOAST_BYTES = 511;

// Translating an empty text would give the catalogue's header.
std::string translated(const std::string& id) {
    return id.empty() ? "" : clockText(id.c_str());
}

class AppControl {
public:
    AppControl() {
        if (app_control_create(&_handle) != APP_CONTROL_ERROR_NONE) {
            _handle = nullptr;
            LOG_ERROR("app control create failed");
        }
    }
    ~AppControl() {
        if (_handle)
            app_control_destroy(_handle);
    }
    AppControl(const AppControl&) = delete;
    AppControl& operator=(const AppControl&) = delete;
    app_control_h get() const { return _handle; }

private:
    app_control_h _handle = nullptr;
};

bool addCity(app_control_h reply, const ClockWorldClockDbData& city) {
    const std::array<std::pair<const char*, std::string>, 5> extras{{
        {"index_key", std::to_string(city.index)},
        {"city", city.city},
        {"country", city.country},
        {"timezone", city.timezone},
        {"tz_path", city.tzPath},
    }};
    for (const auto& [key, value] : extras) {
        const std::string cut(base::cutUtf8(value, MAX_EXTRA_BYTES));
        if (app_control_add_extra_data(reply, key, cut.c_str()) != APP_CONTROL_ERROR_NONE) {
            LOG_ERROR("app cotron add extra data failed :: %s", key);
            return false;
        }
    }
    return true;
}

} // namespace

void WorldClockAddCityViewController::_genlistSelectedCb(void* data, Evas_Object*, void* item) {
    RETURN_IF_NULL(data);
    auto* self = static_cast<WorldClockAddCityViewController*>(data);
    self->_hideKeypad();
    auto* row = static_cast<Elm_Object_Item*>(item);
    auto* city = static_cast<ClockWorldClockDbData*>(row ? elm_object_item_data_get(row) : nullptr);
    if (!city) {
        LOG_ERROR("city data is not set for genlist item");
        return;
    }
    elm_genlist_item_selected_set(row, EINA_FALSE);
    LOG_ERROR("_callerType = %d", self->_callerType);
    if (self->_callerType != ADD_CITY_CALLER_WORLD_CLOCK)
        self->_sendReplyToCaller(*city);
    else if (!self->addToWorldClock(*city))
        return;
    self->popOut();
}

bool WorldClockAddCityViewController::addToWorldClock(ClockWorldClockDbData& city) {
    const std::string name = translated(city.city);
    if (city.selected != 0) {
        const std::string text = base::formatTranslation(
            clockText("IDS_CLOCK_BODY_PS_ALREADY_EXISTS"), {name}, MAX_TOAST_BYTES);
        notification_status_message_post(text.c_str());
        return false;
    }
    LOG_ERROR("City selected :: update db record %s(%d)", name.c_str(), city.selected);
    city.selected = 1;
    city.position = _newCityPosition;
    ClockWorldClockDbModel().updateWorldClockDbRecord(city);
    _cityDataReturnFunc(city);
    return true;
}

void WorldClockAddCityViewController::_sendReplyToCaller(const ClockWorldClockDbData& city) {
    if (!_appControl)
        return;
    const AppControl reply;
    if (!reply.get())
        return;
    if (app_control_set_operation(reply.get(), APP_CONTROL_OPERATION_DEFAULT) !=
        APP_CONTROL_ERROR_NONE) {
        LOG_ERROR("app control set operationfailed");
        return;
    }
    if (!addCity(reply.get(), city))
        return;
    const int result =
        app_control_reply_to_launch_request(reply.get(), _appControl, APP_CONTROL_RESULT_SUCCEEDED);
    if (result == APP_CONTROL_ERROR_NONE)
        return;
    LOG_ERROR("app control reply to launch request failed(%d)", result);
    LOG_ERROR("%s", result == APP_CONTROL_ERROR_OUT_OF_MEMORY ? "case out of memory"
                                                              : "case invalid parameter");
}

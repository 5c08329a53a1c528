#include <chrono>
#include <string>
#include <utility>

#include <dlfcn.h>

#include <Ecore.h>
#include <Ecore_Input.h>

#include "Accessibility.h"
#include "Bus.h"
#include "ReaderKeyRules.h"
#include "device/export.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

// While a screen reader is on, the toolkit tells it every key and then drops the key, whether the
// reader wanted it or not. The function below comes before the toolkit's own: what the toolkit
// would have judged keys with is replaced by what asks the same and listens to the answer.

namespace host {

namespace {

/** A reader that stands still must not make keys slow. */
constexpr auto PATIENCE = std::chrono::milliseconds(200);

constexpr BusMethod ADDRESS = {"org.a11y.Bus", "/org/a11y/bus", "org.a11y.Bus", "GetAddress"};
constexpr BusMethod NOTIFY = {"org.a11y.atspi.Registry",
                              "/org/a11y/atspi/registry/deviceeventcontroller",
                              "org.a11y.atspi.DeviceEventController", "NotifyListenersSync"};

/** Where the session has its accessibility bus. */
std::string accessibilityBus(BusError& error) {
    const auto session = sessionBus();
    const BusConnection connection =
        session ? connectToBus(session->c_str(), PATIENCE, error) : nullptr;
    const BusMessage answer =
        connection ? callBus(connection.get(), newBusCall(ADDRESS), PATIENCE, error) : nullptr;
    const char* address = "";
    if (answer)
        dbus_message_get_args(answer.get(), error.get(), DBUS_TYPE_STRING, &address,
                              DBUS_TYPE_INVALID);
    return address;
}

/** The registry's struct of a key event, "(uinnisb)". */
BusMessage newNotice(const Ecore_Event_Key& key, KeyMove move) {
    BusMessage notice = newBusCall(NOTIFY);
    if (!notice)
        return nullptr;
    const auto type = static_cast<dbus_uint32_t>(move);
    const dbus_int32_t symbol = 0; // readers go by the key's code and name
    const auto code = static_cast<dbus_int16_t>(key.keycode);
    const dbus_int16_t modifiers = readerModifiers(key.modifiers);
    const auto timestamp = static_cast<dbus_int32_t>(key.timestamp);
    const char* name = key.key && dbus_validate_utf8(key.key, nullptr) ? key.key : "";
    const dbus_bool_t isText = isReadable(key.string);
    DBusMessageIter at;
    DBusMessageIter event;
    dbus_message_iter_init_append(notice.get(), &at);
    const bool complete =
        dbus_message_iter_open_container(&at, DBUS_TYPE_STRUCT, nullptr, &event) &&
        dbus_message_iter_append_basic(&event, DBUS_TYPE_UINT32, &type) &&
        dbus_message_iter_append_basic(&event, DBUS_TYPE_INT32, &symbol) &&
        dbus_message_iter_append_basic(&event, DBUS_TYPE_INT16, &code) &&
        dbus_message_iter_append_basic(&event, DBUS_TYPE_INT16, &modifiers) &&
        dbus_message_iter_append_basic(&event, DBUS_TYPE_INT32, &timestamp) &&
        dbus_message_iter_append_basic(&event, DBUS_TYPE_STRING, &name) &&
        dbus_message_iter_append_basic(&event, DBUS_TYPE_BOOLEAN, &isText) &&
        dbus_message_iter_close_container(&at, &event);
    return complete ? std::move(notice) : nullptr;
}

/** What readers have asked for; there is one. */
class ReaderKeys {
public:
    static ReaderKeys& instance() {
        static ReaderKeys keys;
        return keys;
    }

    /** The toolkit has found a reader. */
    void connect() {
        BusError error;
        const std::string address = accessibilityBus(error);
        _bus = address.empty() ? nullptr : connectToBus(address.c_str(), PATIENCE, error);
        if (!_bus)
            LOG_WARNING("Screen readers are not asked for keys: %s", error.text());
    }

    /** Whether a reader keeps a key for itself. A bus that is gone keeps none. */
    bool keeps(const Ecore_Event_Key& key, KeyMove move) {
        if (!_bus)
            return false;
        BusError error;
        const BusMessage answer = callBus(_bus.get(), newNotice(key, move), PATIENCE, error);
        dbus_bool_t kept = FALSE;
        if (answer && dbus_message_get_args(answer.get(), error.get(), DBUS_TYPE_BOOLEAN, &kept,
                                            DBUS_TYPE_INVALID))
            return kept;
        LOG_WARNING("No screen reader was told of the key %s: %s", key.key ? key.key : "",
                    error.text());
        if (!dbus_connection_get_is_connected(_bus.get()))
            _bus.reset();
        return false;
    }

private:
    ReaderKeys() = default;

    BusConnection _bus;
};

Eina_Bool passes(void*, void*, int type, void* event) {
    if (!event || (type != ECORE_EVENT_KEY_DOWN && type != ECORE_EVENT_KEY_UP))
        return EINA_TRUE;
    const KeyMove move = type == ECORE_EVENT_KEY_DOWN ? KeyMove::Down : KeyMove::Up;
    return !ReaderKeys::instance().keeps(*static_cast<Ecore_Event_Key*>(event), move);
}

/** The only filter that the toolkit's widgets have is the one for keys. */
bool isOfTheWidgets(Ecore_Filter_Cb filter) {
    Dl_info ofFilter{};
    Dl_info ofWidgets{};
    return dladdr(reinterpret_cast<void*>(filter), &ofFilter) &&
           dladdr(dlsym(RTLD_DEFAULT, "elm_init"), &ofWidgets) &&
           ofFilter.dli_fbase == ofWidgets.dli_fbase;
}

} // namespace

} // namespace host

DEVICE_EXTERN_C_BEGIN

DEVICE_API Ecore_Event_Filter* ecore_event_filter_add(Ecore_Data_Cb start, Ecore_Filter_Cb filter,
                                                      Ecore_End_Cb end, const void* data) {
    static const auto stock = reinterpret_cast<decltype(&ecore_event_filter_add)>(
        dlsym(RTLD_NEXT, "ecore_event_filter_add"));
    if (!stock) {
        LOG_ERROR("ecore_event_filter_add: the toolkit has no such function");
        return nullptr;
    }
    if (!host::isOfTheWidgets(filter))
        return stock(start, filter, end, data);
    host::ReaderKeys::instance().connect();
    return stock(start, host::passes, end, data);
}

DEVICE_EXTERN_C_END

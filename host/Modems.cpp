#include "Modems.h"

#include <atomic>
#include <chrono>
#include <cstdlib>
#include <future>
#include <memory>
#include <string_view>
#include <thread>

#include "Bus.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

// A bus or a service that stands still may hold a caller for ever, even while it connects. So the
// questions are asked in a thread of their own, which is left alone when the time is up.

namespace host {

namespace {

using Modems = std::optional<std::vector<Modem>>;

constexpr auto PATIENCE = std::chrono::milliseconds(300);
/** For one question, so that a slow modem leaves time for the next one. */
constexpr auto ONE_ANSWER = std::chrono::milliseconds(80);

constexpr const char* OFONO = "org.ofono";
constexpr const char* SYSTEM_BUS = "unix:path=/run/dbus/system_bus_socket";

BusMessage ask(DBusConnection* connection, const BusMethod& method, BusError& error) {
    return callBus(connection, newBusCall(method), ONE_ANSWER, error);
}

/** A connection of its own: the toolkit's belongs to the main loop. */
BusConnection connect(BusError& error) {
    const char* address = std::getenv("DBUS_SYSTEM_BUS_ADDRESS");
    return connectToBus(address && *address ? address : SYSTEM_BUS, ONE_ANSWER, error);
}

bool isAt(DBusMessageIter& at, int type) {
    return dbus_message_iter_get_arg_type(&at) == type;
}

std::string textAt(DBusMessageIter& at) {
    const char* text = nullptr;
    dbus_message_iter_get_basic(&at, &text);
    return text;
}

/** The text that a dictionary of variants has for a key; empty without one. */
std::string textOf(DBusMessage* message, std::string_view key) {
    DBusMessageIter at;
    DBusMessageIter entries;
    if (!dbus_message_has_signature(message, "a{sv}") || !dbus_message_iter_init(message, &at))
        return {};
    dbus_message_iter_recurse(&at, &entries);
    for (; isAt(entries, DBUS_TYPE_DICT_ENTRY); dbus_message_iter_next(&entries)) {
        DBusMessageIter entry;
        DBusMessageIter value;
        dbus_message_iter_recurse(&entries, &entry);
        if (textAt(entry) != key)
            continue;
        dbus_message_iter_next(&entry);
        dbus_message_iter_recurse(&entry, &value);
        return isAt(value, DBUS_TYPE_STRING) ? textAt(value) : std::string();
    }
    return {};
}

std::vector<std::string> modemPaths(DBusMessage* message) {
    std::vector<std::string> paths;
    DBusMessageIter at;
    DBusMessageIter modems;
    if (!dbus_message_has_signature(message, "a(oa{sv})") || !dbus_message_iter_init(message, &at))
        return paths;
    dbus_message_iter_recurse(&at, &modems);
    for (; isAt(modems, DBUS_TYPE_STRUCT); dbus_message_iter_next(&modems)) {
        DBusMessageIter modem;
        dbus_message_iter_recurse(&modems, &modem);
        paths.push_back(textAt(modem));
    }
    return paths;
}

std::optional<std::string> plmnOf(DBusConnection* connection, const std::string& modem) {
    BusError error;
    const BusMethod method{OFONO, modem.c_str(), "org.ofono.NetworkRegistration", "GetProperties"};
    const BusMessage answer = ask(connection, method, error);
    if (answer) {
        const std::string country = textOf(answer.get(), "MobileCountryCode");
        return country.empty() ? country : country + textOf(answer.get(), "MobileNetworkCode");
    }
    LOG_WARNING("Modem %s tells no network: %s", modem.c_str(), error.text());
    return error.isSilence() ? std::nullopt : std::optional<std::string>("");
}

/** What the thread does. */
Modems askInTurn() {
    BusError error;
    const BusConnection connection = connect(error);
    if (!connection) {
        LOG_INFO("There is no system bus to ask for modems: %s", error.text());
        return std::vector<Modem>();
    }
    const BusMessage answer =
        ask(connection.get(), {OFONO, "/", "org.ofono.Manager", "GetModems"}, error);
    if (!answer) {
        LOG_WARNING("oFono tells no modems: %s", error.text());
        return error.isAbsence() ? Modems(std::vector<Modem>()) : std::nullopt;
    }
    std::vector<Modem> modems;
    for (const std::string& path : modemPaths(answer.get()))
        modems.push_back({path, plmnOf(connection.get(), path)});
    return modems;
}

} // namespace

std::optional<std::vector<Modem>> askModems() {
    // One that still waits for a bus that stands still is not joined by a second one.
    static const auto asking = std::make_shared<std::atomic<bool>>(false);
    if (asking->exchange(true)) {
        LOG_WARNING("The system bus has not answered the last question for modems yet");
        return std::nullopt;
    }
    std::packaged_task<Modems()> task(askInTurn);
    auto answer = task.get_future();
    std::thread([task = std::move(task), asking = asking]() mutable {
        task();
        *asking = false;
    }).detach();
    if (answer.wait_for(PATIENCE) == std::future_status::ready)
        return answer.get();
    LOG_WARNING("The modems have not answered within %d milliseconds",
                static_cast<int>(PATIENCE.count()));
    return std::nullopt;
}

} // namespace host

#include "Bus.h"

#include <utility>

namespace host {

void CloseBusConnection::operator()(DBusConnection* connection) const {
    dbus_connection_close(connection);
    dbus_connection_unref(connection);
}

void UnrefBusMessage::operator()(DBusMessage* message) const {
    dbus_message_unref(message);
}

BusError::BusError() {
    dbus_error_init(&_error);
}

BusError::~BusError() {
    dbus_error_free(&_error);
}

const char* BusError::text() const {
    return _error.message ? _error.message : "unknown";
}

bool BusError::is(const char* name) const {
    return dbus_error_has_name(&_error, name);
}

bool BusError::isSilence() const {
    return is(DBUS_ERROR_NO_REPLY) || is(DBUS_ERROR_TIMEOUT) || is(DBUS_ERROR_TIMED_OUT) ||
           is(DBUS_ERROR_DISCONNECTED);
}

bool BusError::isAbsence() const {
    return is(DBUS_ERROR_SERVICE_UNKNOWN) || is(DBUS_ERROR_NAME_HAS_NO_OWNER);
}

BusConnection connectToBus(const char* address, std::chrono::milliseconds patience,
                           BusError& error) {
    BusConnection connection(dbus_connection_open_private(address, error.get()));
    if (!connection)
        return nullptr;
    dbus_connection_set_exit_on_disconnect(connection.get(), FALSE);
    const BusMethod hello{DBUS_SERVICE_DBUS, DBUS_PATH_DBUS, DBUS_INTERFACE_DBUS, "Hello"};
    return callBus(connection.get(), newBusCall(hello), patience, error) ? std::move(connection)
                                                                         : nullptr;
}

BusMessage newBusCall(const BusMethod& method) {
    return BusMessage(
        dbus_message_new_method_call(method.service, method.path, method.interface, method.name));
}

BusMessage callBus(DBusConnection* connection, const BusMessage& call,
                   std::chrono::milliseconds patience, BusError& error) {
    if (!call)
        return nullptr;
    return BusMessage(dbus_connection_send_with_reply_and_block(
        connection, call.get(), static_cast<int>(patience.count()), error.get()));
}

} // namespace host

/**
 * @file
 * @brief Calls over a message bus that wait for their answer.
 */
#pragma once

#include <chrono>
#include <memory>

#include <dbus/dbus.h>

namespace host {

struct CloseBusConnection {
    void operator()(DBusConnection* connection) const;
};
struct UnrefBusMessage {
    void operator()(DBusMessage* message) const;
};
/** A connection of its own; it is closed with this. */
using BusConnection = std::unique_ptr<DBusConnection, CloseBusConnection>;
using BusMessage = std::unique_ptr<DBusMessage, UnrefBusMessage>;

/** Why a call failed. */
class BusError {
public:
    BusError();
    ~BusError();
    BusError(const BusError&) = delete;
    BusError& operator=(const BusError&) = delete;

    DBusError* get() { return &_error; }
    const char* text() const;
    /** Nobody answered, as against an answer that is an error. */
    bool isSilence() const;
    /** There is no such service, and nothing can start it. */
    bool isAbsence() const;

private:
    bool is(const char* name) const;

    DBusError _error{};
};

/** Where a method is. */
struct BusMethod {
    const char* service;
    const char* path;
    const char* interface;
    const char* name;
};

/**
 * @brief Connects to a bus and greets it. A bus that stands still may hold the caller.
 * @param patience For the answer to the greeting.
 * @return Nothing when that fails; @p error tells why.
 */
BusConnection connectToBus(const char* address, std::chrono::milliseconds patience,
                           BusError& error);

/** @return A call without arguments; nothing when memory is short. */
BusMessage newBusCall(const BusMethod& method);

/**
 * @brief Sends a call and waits for its answer.
 * @param call May be nothing: so is the answer then.
 * @return Nothing when there is no answer, or an error; @p error tells which.
 */
BusMessage callBus(DBusConnection* connection, const BusMessage& call,
                   std::chrono::milliseconds patience, BusError& error);

} // namespace host

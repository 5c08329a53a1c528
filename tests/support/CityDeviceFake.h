/**
 * @file
 * @brief The mobile network of a test's device.
 *
 * Calls of tel_ and feedback_ are noted in device().calls(), and device().fail() makes them fail:
 * functions that return pointers then return null.
 */
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

/** A modem of the device. */
struct FakeModem {
    std::string name;
    std::optional<std::string> plmn; ///< Nothing: the modem does not answer.
};

class CityDeviceFake {
public:
    /** One modem, "modem1", without a network. */
    void reset();

    /** Sets the modems; the first one answers who names none. */
    void setModems(std::vector<FakeModem> modems) { _modems = std::move(modems); }
    const std::vector<FakeModem>& modems() const { return _modems; }
    /** Connections to modems that were made and not ended. */
    std::size_t openConnections() const { return _connections; }

private:
    friend struct CityDeviceCalls;

    std::vector<FakeModem> _modems = {{"modem1", ""}};
    std::size_t _connections = 0;
};

/** The only one. */
CityDeviceFake& cityDevice();

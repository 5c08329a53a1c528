/**
 * @file
 * @brief The device's settings by name, as commands and the control panel change them.
 */
#pragma once

#include <string>
#include <vector>

namespace simulator {

/** One setting of the device. Values are texts, as a person types them. */
struct DeviceSetting {
    const char* name;
    const char* values; ///< What may be set, for help texts.
    /** @return Empty, or one sentence why this can be no value of it on any device. */
    std::string (*check)(const std::string& value);
    /** Sets a value that was checked. @return As check(); nothing has changed then. */
    std::string (*set)(const std::string& value);
    /** @return The value in force, in a form that can be set again. */
    std::string (*get)();
};

/** @brief All settings, in the order in which they are listed. */
const std::vector<DeviceSetting>& deviceSettings();

/** @brief Looks at a value before there is a device. @return Empty, or what is wrong with it. */
std::string checkDevice(const std::string& name, const std::string& value);

/** @brief Changes one setting. @return Empty, or one sentence why not. */
std::string setDevice(const std::string& name, const std::string& value);

/** @brief The value of one setting; empty for an unknown name. */
std::string deviceSetting(const std::string& name);

} // namespace simulator

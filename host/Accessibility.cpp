#include "Accessibility.h"

#include <cerrno>
#include <cstdlib>
#include <filesystem>
#include <string>

#include <Elementary.h>

namespace host {

namespace {

/** What a path in an address leads to. */
bool leadsToABus(const std::string& address) {
    const std::string prefix = "unix:path=";
    std::error_code unknown;
    return !address.starts_with(prefix) ||
           std::filesystem::exists(address.substr(prefix.size(), address.find(',') - prefix.size()),
                                   unknown);
}

} // namespace

std::optional<std::string> sessionBus() {
    std::string address;
    if (const char* given = std::getenv("DBUS_SESSION_BUS_ADDRESS"); given && *given)
        address = given;
    else if (const char* runtime = std::getenv("XDG_RUNTIME_DIR"))
        address = std::string("unix:path=") + runtime + "/bus";
    return !address.empty() && leadsToABus(address) ? std::optional(address) : std::nullopt;
}

void followScreenReaders() {
    if (!sessionBus())
        return;
    // What a reader calls the application; the toolkit was started without arguments.
    elm_app_name_set(program_invocation_short_name);
    elm_config_atspi_mode_set(EINA_TRUE);
}

} // namespace host

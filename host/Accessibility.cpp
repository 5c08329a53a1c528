#include "Accessibility.h"

#include <cerrno>
#include <cstdlib>
#include <filesystem>
#include <string>

#include <Elementary.h>

namespace host {

namespace {

/** Where a session's bus is when no variable says so. */
bool hasSessionBus() {
    const char* address = std::getenv("DBUS_SESSION_BUS_ADDRESS");
    if (address && *address) {
        const std::string text = address;
        const std::string prefix = "unix:path=";
        std::error_code unknown;
        return !text.starts_with(prefix) ||
               std::filesystem::exists(text.substr(prefix.size(), text.find(',') - prefix.size()),
                                       unknown);
    }
    const char* runtime = std::getenv("XDG_RUNTIME_DIR");
    std::error_code unknown;
    return runtime && std::filesystem::exists(std::string(runtime) + "/bus", unknown);
}

} // namespace

void followScreenReaders() {
    if (!hasSessionBus())
        return;
    // What a reader calls the application; the toolkit was started without arguments.
    elm_app_name_set(program_invocation_short_name);
    elm_config_atspi_mode_set(EINA_TRUE);
}

} // namespace host

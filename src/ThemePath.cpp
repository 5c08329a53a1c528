// Under the name of the screens that ask.
#define LOG_TAG tag
#include "ThemePath.h"

#include <cstdlib>
#include <memory>

#include <base/Log.h>
#include <base/Text.h>
#include <device/app_resource_manager.h>

namespace {
constexpr std::size_t MAX_PATH_BYTES = 4095;
}

std::string themePath(const char* resourceName, const char* tag) {
    char* found = nullptr;
    app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, resourceName, &found);
    const std::unique_ptr<char, decltype(&std::free)> owner(found, &std::free);
    if (!found) {
        LOG_ERROR("path is NULL !!");
        return "";
    }
    std::string path(base::cutUtf8(found, MAX_PATH_BYTES));
    LOG_ERROR("path: %s", path.c_str());
    return path;
}

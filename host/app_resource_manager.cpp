#include "device/app_resource_manager.h"

#include <cstring>
#include <filesystem>

#include "Folders.h"

namespace {

int users = 0;

/** A relative name that stays below the folder it is looked up in. */
bool isResourceName(const std::filesystem::path& name) {
    if (name.empty() || name.is_absolute())
        return false;
    for (const auto& segment : name) {
        if (segment == "..")
            return false;
    }
    return true;
}

} // namespace

int app_resource_manager_init(void) {
    ++users;
    return APP_RESOURCE_ERROR_NONE;
}

int app_resource_manager_release(void) {
    if (users == 0)
        return APP_RESOURCE_ERROR_NOT_FOUND;
    --users;
    return APP_RESOURCE_ERROR_NONE;
}

int app_resource_manager_get(app_resource_e type, const char* id, char** path) {
    if (!path)
        return APP_RESOURCE_ERROR_INVALID_PARAMETER;
    *path = nullptr;
    if (type != APP_RESOURCE_TYPE_IMAGE || !id || !isResourceName(id))
        return APP_RESOURCE_ERROR_INVALID_PARAMETER;
    if (users == 0)
        return APP_RESOURCE_ERROR_NOT_FOUND;
    const std::string file = host::folders().resources + "/" + id;
    std::error_code ignored;
    if (!std::filesystem::is_regular_file(file, ignored))
        return APP_RESOURCE_ERROR_NOT_FOUND;
    *path = strdup(file.c_str());
    return *path ? APP_RESOURCE_ERROR_NONE : APP_RESOURCE_ERROR_NOT_FOUND;
}

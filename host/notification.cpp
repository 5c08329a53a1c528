#include "device/notification.h"

#include <cerrno>
#include <cstring>
#include <optional>
#include <string>

#include <unistd.h>

#include "Files.h"
#include "Folders.h"
#include "device_host.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace {

device_host_toast_cb toastCallback = nullptr;
void* toastData = nullptr;

std::string notificationFolder() {
    return host::folders().runtime + "/notifications";
}

std::optional<std::string> fileOf(const char* tag) {
    return tag ? host::fileNameFor(tag) : std::nullopt;
}

} // namespace

void device_host_set_toast_callback(device_host_toast_cb callback, void* data) {
    toastCallback = callback;
    toastData = data;
}

int notification_status_message_post(const char* message) {
    if (!message)
        return NOTIFICATION_ERROR_INVALID_PARAMETER;
    LOG_INFO("Toast: %s", message);
    if (toastCallback)
        toastCallback(message, toastData);
    return NOTIFICATION_ERROR_NONE;
}

int notification_post_with_tag(const char* tag, const char* text) {
    const auto file = fileOf(tag);
    if (!file || !text)
        return NOTIFICATION_ERROR_INVALID_PARAMETER;
    const std::string folder = notificationFolder();
    int problem = host::createFolder(folder);
    if (problem == 0)
        problem = host::replaceFile(folder, *file, text);
    if (problem != 0) {
        LOG_ERROR("Notification %s cannot be posted in %s: %s", tag, folder.c_str(),
                  std::strerror(problem));
        return NOTIFICATION_ERROR_IO_ERROR;
    }
    LOG_INFO("Notification %s: %s", tag, text);
    return NOTIFICATION_ERROR_NONE;
}

int notification_delete_by_tag(const char* tag) {
    const auto file = fileOf(tag);
    if (!file)
        return NOTIFICATION_ERROR_INVALID_PARAMETER;
    const std::string path = notificationFolder() + "/" + *file;
    if (unlink(path.c_str()) == 0)
        return NOTIFICATION_ERROR_NONE;
    if (errno == ENOENT || errno == ENOTDIR)
        return NOTIFICATION_ERROR_NOT_EXIST_ID;
    LOG_ERROR("%s cannot be removed: %s", path.c_str(), std::strerror(errno));
    return NOTIFICATION_ERROR_IO_ERROR;
}

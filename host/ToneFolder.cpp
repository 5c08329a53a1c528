#include "ToneFolder.h"

#include <cstdlib>
#include <filesystem>

#include "Folders.h"

namespace host {

namespace {

std::string toneFolderHere() {
    const char* chosen = std::getenv("CLOCK_TONE_DIR");
    if (!chosen || !*chosen)
        return folders().resources + "/tones";
    // Others, the sound library among them, take only absolute paths.
    std::error_code ignored;
    return std::filesystem::absolute(chosen, ignored).string();
}

} // namespace

std::string pathHere(std::string_view devicePath) {
    if (!devicePath.starts_with(DEVICE_TONE_FOLDER))
        return std::string(devicePath);
    const std::string_view rest = devicePath.substr(DEVICE_TONE_FOLDER.size());
    if (!rest.empty() && !rest.starts_with('/'))
        return std::string(devicePath);
    std::string path = toneFolderHere();
    while (path.ends_with('/'))
        path.pop_back();
    return path.append(rest);
}

} // namespace host

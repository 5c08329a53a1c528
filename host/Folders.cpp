#include "Folders.h"

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <optional>

#include <dlfcn.h>
#include <fcntl.h>
#include <pwd.h>
#include <sys/stat.h>
#include <unistd.h>

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace fs = std::filesystem;

namespace host {

namespace {

std::optional<Folders>& chosen() {
    static std::optional<Folders> folders;
    return folders;
}

std::string environment(const char* name) {
    const char* value = std::getenv(name);
    return value ? value : "";
}

/** The first that is set: the program's choice, the environment's choice, the default. */
std::string choose(const char* configured, const char* variable, const std::string& byDefault) {
    std::string path = configured ? configured : "";
    if (path.empty())
        path = environment(variable);
    if (path.empty())
        path = byDefault;
    std::error_code ignored;
    const fs::path absolute = fs::absolute(path, ignored).lexically_normal();
    return absolute.has_filename() ? absolute.string() : absolute.parent_path().string();
}

std::string homeFolder() {
    std::string home = environment("HOME");
    if (home.starts_with('/'))
        return home;
    const passwd* user = getpwuid(getuid());
    return user && user->pw_dir ? user->pw_dir : "/";
}

std::string defaultData() {
    const std::string dataHome = environment("XDG_DATA_HOME");
    return (dataHome.starts_with('/') ? dataHome : homeFolder() + "/.local/share") + "/clock-ui";
}

std::string defaultRuntime() {
    const std::string runtime = environment("XDG_RUNTIME_DIR");
    if (runtime.starts_with('/'))
        return runtime + "/clock-ui";
    return "/tmp/clock-ui-" + std::to_string(getuid());
}

/** An installed library has its resources in <prefix>/share, a built one where the build put them.
 */
std::string defaultResources() {
    Dl_info library{};
    if (dladdr(reinterpret_cast<const void*>(&defaultResources), &library) && library.dli_fname) {
        std::error_code ignored;
        fs::path folder = fs::canonical(library.dli_fname, ignored).parent_path();
        // <prefix>/lib or <prefix>/lib/<architecture>
        for (int level = 0; level < 2 && folder.has_parent_path(); ++level) {
            folder = folder.parent_path();
            const fs::path candidate = folder / "share" / "clock-ui";
            if (fs::exists(candidate / "edje", ignored))
                return candidate.string();
        }
    }
    return CLOCK_RESOURCE_DIR;
}

/** Tries a write for real: permission bits say nothing about a read-only or full disk. */
int tryWriting(const std::string& folder) {
    std::string probe = folder + "/.probe-XXXXXX";
    const int file = mkostemp(probe.data(), O_CLOEXEC);
    if (file < 0)
        return errno;
    close(file);
    return unlink(probe.c_str()) == 0 ? 0 : errno;
}

/** A folder of another user below /tmp would let that user change our state. */
int checkOwner(const std::string& folder) {
    struct stat status {};
    if (stat(folder.c_str(), &status) != 0)
        return errno;
    return status.st_uid == geteuid() ? 0 : EPERM;
}

int makeUsable(const std::string& folder) {
    int problem = createFolder(folder);
    if (problem == 0)
        problem = checkOwner(folder);
    return problem == 0 ? tryWriting(folder) : problem;
}

Folders resolve(const device_host_config_s& config) {
    return {choose(config.data_dir, "CLOCK_DATA_DIR", defaultData()),
            choose(config.runtime_dir, "CLOCK_RUNTIME_DIR", defaultRuntime()),
            choose(config.resource_dir, "CLOCK_RESOURCE_DIR", defaultResources())};
}

std::string sentence(const char* what, const std::string& folder, int problem) {
    return "The " + std::string(what) + " folder " + folder +
           " cannot be used: " + std::strerror(problem) + ".";
}

} // namespace

int createFolder(const std::string& path) {
    for (std::size_t end = path.find('/', 1);; end = path.find('/', end + 1)) {
        const std::string head = path.substr(0, end);
        if (mkdir(head.c_str(), S_IRWXU) != 0 && errno != EEXIST) {
            const int problem = errno;
            // A folder above may exist on a read-only disk or in a place we may not look into.
            struct stat status {};
            if (stat(head.c_str(), &status) != 0 || !S_ISDIR(status.st_mode))
                return problem;
        }
        if (end == std::string::npos)
            break;
    }
    struct stat status {};
    if (stat(path.c_str(), &status) != 0)
        return errno;
    return S_ISDIR(status.st_mode) ? 0 : ENOTDIR;
}

const Folders& folders() {
    if (!chosen()) {
        std::string error;
        if (!prepareFolders({}, error)) {
            LOG_ERROR("%s", error.c_str());
            chosen() = resolve({});
        }
    }
    return *chosen();
}

bool prepareFolders(const device_host_config_s& config, std::string& error) {
    const Folders wanted = resolve(config);
    if (const int problem = makeUsable(wanted.data)) {
        error = sentence("data", wanted.data, problem);
        return false;
    }
    if (const int problem = makeUsable(wanted.runtime)) {
        error = sentence("runtime", wanted.runtime, problem);
        return false;
    }
    std::error_code reason;
    if (!fs::is_directory(wanted.resources, reason)) {
        error = sentence("resource", wanted.resources, reason ? reason.value() : ENOTDIR);
        return false;
    }
    chosen() = wanted;
    return true;
}

void forgetFolders() {
    chosen().reset();
}

} // namespace host

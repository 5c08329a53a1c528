#include "Program.h"

#include <array>
#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <filesystem>
#include <string_view>
#include <vector>

#include <dlfcn.h>
#include <fcntl.h>
#include <spawn.h>
#include <sys/socket.h>
#include <unistd.h>

#include "Folders.h"
#include "Language.h"

namespace fs = std::filesystem;

namespace host {

namespace {

/** Built and installed alike, the applications' folder is one or two above the library's. */
std::string defaultFolder() {
    Dl_info library{};
    if (!dladdr(reinterpret_cast<const void*>(&defaultFolder), &library) || !library.dli_fname)
        return "";
    std::error_code ignored;
    fs::path folder = fs::canonical(library.dli_fname, ignored).parent_path();
    for (int level = 0; level < 2 && folder.has_parent_path(); ++level) {
        folder = folder.parent_path();
        const fs::path candidate = folder / CLOCK_APPLICATION_FOLDER;
        if (fs::is_directory(candidate, ignored))
            return candidate.string();
    }
    return "";
}

std::string applicationFolder() {
    const char* chosen = std::getenv("CLOCK_APPLICATION_DIR");
    return chosen && *chosen ? chosen : defaultFolder();
}

bool isDescriptorVariable(std::string_view variable, const std::vector<std::string>& replacements) {
    const auto name = variable.substr(0, variable.find('=') + 1);
    for (const auto& replacement : replacements)
        if (replacement.starts_with(name))
            return true;
    return false;
}

/** This process's environment, with the folders that are in use here. */
std::vector<std::string> environmentForProgram() {
    std::vector<std::string> variables{
        std::string(CHANNEL_VARIABLE).append("=").append(std::to_string(CHANNEL_DESCRIPTOR)),
        "CLOCK_DATA_DIR=" + folders().data,
        "CLOCK_RUNTIME_DIR=" + folders().runtime,
        "CLOCK_RESOURCE_DIR=" + folders().resources,
        "LANGUAGE=" + environmentLanguages(),
    };
    const std::vector<std::string> replacements = variables;
    for (char** variable = environ; variable && *variable; ++variable)
        if (!isDescriptorVariable(*variable, replacements))
            variables.emplace_back(*variable);
    return variables;
}

std::vector<char*> pointersTo(std::vector<std::string>& texts) {
    std::vector<char*> pointers;
    pointers.reserve(texts.size() + 1);
    for (auto& text : texts)
        pointers.push_back(text.data());
    pointers.push_back(nullptr);
    return pointers;
}

/** What the program does not inherit: other open files, and signals that are ignored here. */
class SpawnSettings {
public:
    explicit SpawnSettings(int channel) {
        posix_spawn_file_actions_init(&_files);
        posix_spawnattr_init(&_attributes);
        posix_spawn_file_actions_adddup2(&_files, channel, CHANNEL_DESCRIPTOR);
        posix_spawn_file_actions_addclosefrom_np(&_files, CHANNEL_DESCRIPTOR + 1);
        sigset_t signals;
        sigemptyset(&signals);
        posix_spawnattr_setsigmask(&_attributes, &signals);
        for (const int signal : {SIGPIPE, SIGINT, SIGTERM, SIGHUP, SIGQUIT, SIGCHLD})
            sigaddset(&signals, signal);
        posix_spawnattr_setsigdefault(&_attributes, &signals);
        posix_spawnattr_setflags(&_attributes, POSIX_SPAWN_SETSIGMASK | POSIX_SPAWN_SETSIGDEF);
    }
    ~SpawnSettings() {
        posix_spawn_file_actions_destroy(&_files);
        posix_spawnattr_destroy(&_attributes);
    }
    SpawnSettings(const SpawnSettings&) = delete;
    SpawnSettings& operator=(const SpawnSettings&) = delete;

    const posix_spawn_file_actions_t* files() const { return &_files; }
    const posix_spawnattr_t* attributes() const { return &_attributes; }

private:
    posix_spawn_file_actions_t _files{};
    posix_spawnattr_t _attributes{};
};

int spawn(const std::string& path, int channel, pid_t& process) {
    std::vector<std::string> words{path};
    std::vector<std::string> variables = environmentForProgram();
    const SpawnSettings settings(channel);
    return posix_spawn(&process, path.c_str(), settings.files(), settings.attributes(),
                       pointersTo(words).data(), pointersTo(variables).data());
}

} // namespace

std::string programOf(const std::string& appId) {
    if (appId.empty() || appId.front() == '.' || appId.find('/') != std::string::npos)
        return "";
    const std::string folder = applicationFolder();
    const std::string path = folder + "/" + appId;
    std::error_code ignored;
    const bool isThere =
        !folder.empty() && fs::is_regular_file(path, ignored) && access(path.c_str(), X_OK) == 0;
    return isThere ? path : "";
}

int startProgram(const std::string& path, Program& program) {
    std::array<int, 2> ends{};
    if (socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()) != 0)
        return errno;
    int problem = spawn(path, ends[1], program.process);
    close(ends[1]);
    // Only this end: the program's is its own to choose.
    if (problem == 0 && fcntl(ends[0], F_SETFL, O_NONBLOCK) != 0)
        problem = errno;
    if (problem != 0)
        close(ends[0]);
    else
        program.channel = ends[0];
    return problem;
}

} // namespace host

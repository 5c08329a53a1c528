#include "device/vconf.h"

#include <cerrno>
#include <charconv>
#include <cstring>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <set>
#include <string>
#include <string_view>
#include <utility>
#include <variant>
#include <vector>

#include "Files.h"
#include "FolderWatch.h"
#include "Folders.h"
#include "Settings.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

struct keynode_s {
    const char* name;
};

namespace {

using Value = std::variant<int, bool, std::string>;

constexpr std::size_t longestText = 65536;
constexpr std::size_t largestFile = longestText + 16;

struct Location {
    std::string folder;
    std::string fileName;

    std::string path() const { return folder + "/" + fileName; }
};

bool hasEmptySegment(std::string_view key) {
    return key.starts_with('/') || key.ends_with('/') || key.find("//") != std::string_view::npos;
}

bool hasDotSegment(std::string_view key) {
    for (std::size_t start = 0; start <= key.size();) {
        const std::size_t end = std::min(key.find('/', start), key.size());
        const std::string_view segment = key.substr(start, end - start);
        if (segment == "." || segment == "..")
            return true;
        start = end + 1;
    }
    return false;
}

/** Where a key's value is kept; nothing for something that cannot be a key. */
std::optional<Location> locate(const char* key) {
    const std::string_view name = key ? key : "";
    const bool lasting = name.starts_with("db/");
    if ((lasting || name.starts_with("memory/")) && !hasEmptySegment(name) &&
        !hasDotSegment(name)) {
        if (auto file = host::fileNameFor(name)) {
            const auto& folders = host::folders();
            return Location{(lasting ? folders.data : folders.runtime) + "/settings",
                            std::move(*file)};
        }
    }
    LOG_ERROR("\"%s\" is not the name of a setting", key ? key : "(null)");
    return std::nullopt;
}

/** Values are kept as their type and text: "int 7", "bool 1", "string Seoul". */
std::string serialize(const Value& value) {
    if (const int* number = std::get_if<int>(&value))
        return "int " + std::to_string(*number) + "\n";
    if (const bool* flag = std::get_if<bool>(&value))
        return *flag ? "bool 1\n" : "bool 0\n";
    return "string " + std::get<std::string>(value) + "\n";
}

std::optional<Value> parse(std::string_view contents) {
    // A file without its line end was not written to the end.
    if (!contents.ends_with('\n') || contents.find('\0') != std::string_view::npos)
        return std::nullopt;
    contents.remove_suffix(1);
    const auto space = contents.find(' ');
    if (space == std::string_view::npos)
        return std::nullopt;
    const std::string_view type = contents.substr(0, space);
    const std::string_view text = contents.substr(space + 1);
    if (type == "string")
        return std::string(text);
    if (type == "bool" && (text == "0" || text == "1"))
        return text == "1";
    int number = 0;
    const char* end = text.data() + text.size();
    const auto result = std::from_chars(text.data(), end, number);
    if (type == "int" && result.ec == std::errc() && result.ptr == end)
        return number;
    return std::nullopt;
}

std::optional<Value> load(const Location& location) {
    std::string contents;
    const int problem = host::readFile(location.path(), largestFile, contents);
    if (problem == ENOENT)
        return std::nullopt;
    if (problem != 0) {
        LOG_ERROR("%s cannot be read: %s", location.path().c_str(), std::strerror(problem));
        return std::nullopt;
    }
    auto value = parse(contents);
    if (!value)
        LOG_ERROR("%s does not hold a setting", location.path().c_str());
    return value;
}

template <typename T>
int get(const char* key, T& value) {
    const auto location = locate(key);
    if (!location)
        return VCONF_ERROR;
    const auto stored = load(*location);
    if (!stored)
        return VCONF_ERROR;
    const T* typed = std::get_if<T>(&*stored);
    if (!typed)
        return VCONF_ERROR_WRONG_TYPE;
    value = *typed;
    return VCONF_OK;
}

/** The folder of settings, made ready once per place. */
int prepare(const std::string& folder) {
    if (const int problem = host::createFolder(folder))
        return problem;
    static std::set<std::string> tidied;
    if (tidied.insert(folder).second)
        host::removeLeftovers(folder);
    return 0;
}

int set(const char* key, const Value& value) {
    const auto location = locate(key);
    if (!location)
        return VCONF_ERROR;
    const std::string contents = serialize(value);
    std::string stored;
    if (host::readFile(location->path(), largestFile, stored) == 0 && stored == contents)
        return VCONF_OK;
    int problem = prepare(location->folder);
    if (problem == 0)
        problem = host::replaceFile(location->folder, location->fileName, contents);
    if (problem == 0)
        return VCONF_OK;
    LOG_ERROR("%s cannot be written: %s", location->path().c_str(), std::strerror(problem));
    return VCONF_ERROR;
}

/** Who wants to know of changes. */
class Callbacks {
public:
    Callbacks() = default;
    ~Callbacks() { *_alive = false; }
    Callbacks(const Callbacks&) = delete;
    Callbacks& operator=(const Callbacks&) = delete;

    int add(const std::string& key, const std::string& folder, std::function<void()> run) {
        if (const int problem = _watch.add(folder))
            return problem;
        _byKey[key].push_back(std::move(run));
        return 0;
    }
    void deliver() { _watch.deliver(); }

private:
    void fileChanged(const std::string& fileName) {
        if (fileName.empty())
            runAll();
        else if (const auto key = host::nameOfFile(fileName))
            run(*key);
    }

    void runAll() {
        std::vector<std::string> keys;
        for (const auto& [key, callbacks] : _byKey)
            keys.push_back(key);
        const auto alive = _alive;
        for (const auto& key : keys) {
            if (*alive)
                run(key);
        }
    }

    void run(const std::string& key) {
        const auto found = _byKey.find(key);
        if (found == _byKey.end())
            return;
        // A copy: a callback may add callbacks, or end the device.
        const auto callbacks = found->second;
        const auto alive = _alive;
        for (const auto& callback : callbacks) {
            if (*alive)
                callback();
        }
    }

    std::map<std::string, std::vector<std::function<void()>>> _byKey;
    std::shared_ptr<bool> _alive = std::make_shared<bool>(true);
    host::FolderWatch _watch{[this](const std::string& fileName) {
        fileChanged(fileName);
    }};
};

std::unique_ptr<Callbacks>& callbacks() {
    // Never destroyed by itself: the main loop's library may be gone by then.
    static auto* const instance = new std::unique_ptr<Callbacks>;
    return *instance;
}

} // namespace

namespace host {

void deliverSettingChanges() {
    if (callbacks())
        callbacks()->deliver();
}

void forgetSettingCallbacks() {
    callbacks().reset();
}

} // namespace host

int vconf_get_int(const char* key, int* value) {
    return value ? get(key, *value) : VCONF_ERROR;
}

int vconf_get_bool(const char* key, int* value) {
    bool flag = false;
    const int result = value ? get(key, flag) : VCONF_ERROR;
    if (result == VCONF_OK)
        *value = flag ? 1 : 0;
    return result;
}

char* vconf_get_str(const char* key) {
    std::string text;
    return get(key, text) == VCONF_OK ? strdup(text.c_str()) : nullptr;
}

int vconf_set_int(const char* key, int value) {
    return set(key, value);
}

int vconf_set_bool(const char* key, int value) {
    return set(key, value != 0);
}

int vconf_set_str(const char* key, const char* value) {
    if (!value)
        return VCONF_ERROR;
    if (strnlen(value, longestText + 1) > longestText) {
        LOG_ERROR("The text for %s is longer than %zu bytes", key ? key : "(null)", longestText);
        return VCONF_ERROR;
    }
    return set(key, std::string(value));
}

int vconf_notify_key_changed(const char* key, vconf_callback_fn callback, void* data) {
    const auto location = locate(key);
    if (!location || !callback)
        return VCONF_ERROR;
    if (!callbacks())
        callbacks() = std::make_unique<Callbacks>();
    const std::string name = key;
    const int problem = callbacks()->add(name, location->folder, [name, callback, data] {
        keynode_t node{name.c_str()};
        callback(&node, data);
    });
    if (problem == 0)
        return VCONF_OK;
    LOG_ERROR("%s cannot be watched: %s", location->folder.c_str(), std::strerror(problem));
    return VCONF_ERROR;
}

const char* vconf_keynode_get_name(const keynode_t* node) {
    return node ? node->name : nullptr;
}

#include "device_remote.h"

#include <algorithm>
#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <memory>

#include <sys/socket.h>
#include <unistd.h>

#include "../Folders.h"
#include "FaceAgent.h"
#include "ProgramRequests.h"
#include "base/LocalSocket.h"

namespace host {

namespace {

struct Answerer {
    device_remote_request_cb callback = nullptr;
    void* data = nullptr;
};

Answerer& answerer() {
    static Answerer current;
    return current;
}

/** Faces of the device, the one in front first. */
std::vector<std::string> facesIn(const std::string& folder) {
    std::vector<std::string> names;
    std::error_code ignored;
    for (const auto& entry : std::filesystem::directory_iterator(folder, ignored))
        names.push_back(entry.path().filename());
    std::sort(names.rbegin(), names.rend());
    return names;
}

int sendTo(int channel, const Words& words) {
    const auto message = base::encodeMessage(words);
    if (!message)
        return -EMSGSIZE;
    const ssize_t sent = send(channel, message->data(), message->size(), MSG_NOSIGNAL);
    return sent == static_cast<ssize_t>(message->size()) ? 0 : -EIO;
}

} // namespace

Words askProgram(const Words& words) {
    const Answerer current = answerer();
    if (!current.callback || words.empty())
        return {"nobody knows this request"};
    std::vector<const char*> pointers;
    pointers.reserve(words.size());
    for (const std::string& word : words)
        pointers.push_back(word.c_str());
    const std::unique_ptr<char, decltype(&std::free)> answer(
        current.callback(pointers.data(), static_cast<int>(pointers.size()), current.data),
        std::free);
    if (!answer)
        return {""};
    if (*answer == '=')
        return {"", answer.get() + 1};
    return {answer.get()};
}

std::string devicesFolder() {
    return folders().runtime + "/simulators";
}

} // namespace host

char* device_remote_folder(void) {
    return strdup(host::devicesFolder().c_str());
}

int device_remote_listen(const char* folder) {
    return folder ? host::FaceAgent::listen(folder) : -EINVAL;
}

void device_remote_set_request_callback(device_remote_request_cb callback, void* data) {
    host::answerer() = {callback, data};
}

int device_remote_send(const char* const* words, int count) {
    const host::FaceAgent* own = host::FaceAgent::get();
    const host::Words request(words, words + count);
    if (own) {
        for (const std::string& face : host::facesIn(own->folder())) {
            if (face == own->name())
                break;
            const int channel = base::connectTo(own->folder(), face);
            if (channel < 0)
                continue;
            const int result = host::sendTo(channel, request);
            close(channel);
            return result;
        }
    }
    // Nothing that is asked for so needs any time.
    const host::Work work = host::doRequest(request, [](const host::Words&) {});
    return 0;
}

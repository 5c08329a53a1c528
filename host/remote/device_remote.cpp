#include "device_remote.h"

#include <algorithm>
#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <memory>
#include <optional>

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

/** @return Nothing when nobody listens there any more. */
std::optional<int> sendToFace(const std::string& folder, const std::string& face,
                              const Words& request) {
    const int channel = base::connectTo(folder, face);
    if (channel < 0)
        return std::nullopt;
    const int result = sendTo(channel, request);
    close(channel);
    return result;
}

void doHere(const Words& request) {
    // Nothing that is asked for so needs any time.
    const Work work = doRequest(request, [](const Words&) {});
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
    if (folder)
        return host::FaceAgent::listen(folder);
    host::FaceAgent::end();
    return 0;
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
            if (const auto result = host::sendToFace(own->folder(), face, request))
                return *result;
        }
    }
    host::doHere(request);
    return 0;
}

int device_remote_send_to_all(const char* const* words, int count) {
    const host::Words request(words, words + count);
    int result = 0;
    const host::FaceAgent* own = host::FaceAgent::get();
    const std::string folder = own ? own->folder() : "";
    const std::string name = own ? own->name() : "";
    for (const std::string& face : host::facesIn(folder)) {
        if (face == name)
            continue;
        if (const int sent = host::sendToFace(folder, face, request).value_or(0); sent < 0)
            result = sent;
    }
    host::doHere(request);
    return result;
}

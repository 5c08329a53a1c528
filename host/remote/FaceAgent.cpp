#include "FaceAgent.h"

#include <array>
#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <utility>

#include <sys/socket.h>
#include <unistd.h>

#include "MainLoopWork.h"
#include "base/LocalSocket.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace host {

namespace {

constexpr const char* TOO_LONG = "the answer is too long";

/** Never destroyed: at the process's end the toolkit is gone before statics are. */
std::unique_ptr<FaceAgent>& ownAgent() {
    static auto* const agent = new std::unique_ptr<FaceAgent>;
    return *agent;
}

/** Later ones sort behind earlier ones. */
std::string makeName() {
    constexpr double MICROSECONDS = 1e6;
    std::array<char, 64> name{};
    std::snprintf(name.data(), name.size(), "%020.0f-%d", ecore_time_get() * MICROSECONDS,
                  static_cast<int>(getpid()));
    return name.data();
}

} // namespace

FaceCaller::FaceCaller(int channel, std::function<void(FaceCaller*)> gone)
    : _channel(channel), _gone(std::move(gone)),
      _handler(
          ecore_main_fd_handler_add(channel, ECORE_FD_READ, _channelCb, this, nullptr, nullptr)) {}

FaceCaller::~FaceCaller() {
    if (_nextJob)
        ecore_job_del(_nextJob);
    ecore_main_fd_handler_del(_handler);
    close(_channel);
}

Eina_Bool FaceCaller::_channelCb(void* data, Ecore_Fd_Handler* handler) {
    noteOwnTurn();
    auto* self = static_cast<FaceCaller*>(data);
    if (ecore_main_fd_handler_active_get(handler, ECORE_FD_WRITE))
        self->send();
    if (!ecore_main_fd_handler_active_get(handler, ECORE_FD_READ) || self->receive())
        return ECORE_CALLBACK_RENEW;
    self->leave();
    return ECORE_CALLBACK_RENEW;
}

void FaceCaller::leave() {
    // A copy: the one who is told destroys this object.
    const auto gone = _gone;
    gone(this);
}

/** @return False when the caller has gone, or does not speak this protocol. */
bool FaceCaller::receive() {
    std::array<char, 16UL * 1024> buffer{};
    const ssize_t size = recv(_channel, buffer.data(), buffer.size(), MSG_DONTWAIT);
    if (size < 0)
        return errno == EINTR || errno == EAGAIN;
    _reader.add({buffer.data(), static_cast<std::size_t>(size)});
    if (size > 0 && !_reader.isOverlong())
        next();
    return size > 0 && !_reader.isOverlong();
}

void FaceCaller::send() {
    const ssize_t sent =
        ::send(_channel, _toSend.data(), _toSend.size(), MSG_NOSIGNAL | MSG_DONTWAIT);
    if (sent >= 0)
        _toSend.erase(0, static_cast<std::size_t>(sent));
    else if (errno != EINTR && errno != EAGAIN)
        // That the reader has gone is noticed when its end is read.
        _toSend.clear();
    ecore_main_fd_handler_active_set(
        _handler, static_cast<Ecore_Fd_Handler_Flags>(
                      _toSend.empty() ? ECORE_FD_READ : ECORE_FD_READ | ECORE_FD_WRITE));
}

void FaceCaller::_nextCb(void* data) {
    noteOwnTurn();
    auto* self = static_cast<FaceCaller*>(data);
    self->_nextJob = nullptr;
    self->_work.reset();
    self->next();
}

void FaceCaller::next() {
    if (_working)
        return;
    if (const auto message = _reader.next())
        doNext(*message);
}

void FaceCaller::doNext(const std::string& message) {
    Words words;
    for (const auto text : base::textsOfMessage(message))
        words.emplace_back(text);
    _working = true;
    Work work = doRequest(words, [this](const Words& answer) {
        _toSend += base::encodeMessage(answer).value_or(*base::encodeMessage({TOO_LONG}));
        send();
        _working = false;
        // Not here: the work that has answered is in the middle of it.
        if (!_nextJob)
            _nextJob = ecore_job_add(_nextCb, this);
    });
    _work = std::move(work);
}

FaceAgent* FaceAgent::get() {
    return ownAgent().get();
}

int FaceAgent::listen(const std::string& folder) {
    ownAgent().reset();
    std::string name = makeName();
    const int channel = base::listenAt(folder, name);
    if (channel < 0)
        return channel;
    ownAgent().reset(new FaceAgent(folder, std::move(name), channel));
    setenv(FACE_FOLDER_VARIABLE, folder.c_str(), 1);
    return 0;
}

void FaceAgent::listenIfAsked() {
    const char* folder = std::getenv(FACE_FOLDER_VARIABLE);
    if (!folder || !*folder || get())
        return;
    if (const int problem = listen(folder); problem < 0)
        LOG_ERROR("Nobody can use this face from outside, in %s: %s", folder,
                  std::strerror(-problem));
}

void FaceAgent::end() {
    ownAgent().reset();
}

FaceAgent::FaceAgent(std::string folder, std::string name, int channel)
    : _folder(std::move(folder)), _name(std::move(name)), _channel(channel),
      _front(_folder, _name) {
    ecore_init();
    _handler = ecore_main_fd_handler_add(channel, ECORE_FD_READ, _callerCb, this, nullptr, nullptr);
}

FaceAgent::~FaceAgent() {
    _callers.clear();
    ecore_main_fd_handler_del(_handler);
    close(_channel);
    unlink((_folder + "/" + _name).c_str());
    ecore_shutdown();
}

Eina_Bool FaceAgent::_callerCb(void* data, Ecore_Fd_Handler* /*handler*/) {
    noteOwnTurn();
    auto* self = static_cast<FaceAgent*>(data);
    const int caller = accept4(self->_channel, nullptr, nullptr, SOCK_CLOEXEC | SOCK_NONBLOCK);
    if (caller < 0)
        return ECORE_CALLBACK_RENEW;
    self->_callers.push_back(std::make_unique<FaceCaller>(caller, [self](FaceCaller* gone) {
        self->_callers.remove_if([gone](const auto& each) { return each.get() == gone; });
    }));
    return ECORE_CALLBACK_RENEW;
}

} // namespace host

#include "Launch.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <list>
#include <memory>
#include <utility>

#include <Ecore_Evas.h>
#include <sys/socket.h>
#include <sys/wait.h>
#include <unistd.h>

#include "remote/FrontWatch.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace host {

namespace {

/** How long a process that has closed its channel, or was told to end, may take to do so. */
constexpr double patience = 2.0;

/** Open launches. Never destroyed: at the process's end the toolkit is gone before statics are. */
std::list<std::unique_ptr<Launch>>& launches() {
    static auto* const all = new std::list<std::unique_ptr<Launch>>;
    return *all;
}

/** Takes a launch out of the list once its process has ended. */
void finish(pid_t process, bool well) {
    const auto found =
        std::find_if(launches().begin(), launches().end(),
                     [process](const auto& launch) { return launch->process() == process; });
    if (found == launches().end())
        return;
    const std::unique_ptr<Launch> launch = std::move(*found);
    launches().erase(found);
    forgetFace(process);
    launch->ended(well);
}

/** An answer on its way through the main loop. */
struct Answer {
    app_control_s request;
    ReplyTo replyTo;
    Reply reply;
};

void answerCb(void* data) {
    const std::unique_ptr<Answer> answer(static_cast<Answer*>(data));
    answer->replyTo.callback(&answer->request, &answer->reply.texts, answer->reply.result,
                             answer->replyTo.data);
}

bool isOnX(const Ecore_Evas* ee) {
    const char* engine = ecore_evas_engine_name_get(ee);
    return engine && std::strstr(engine, "x11");
}

/** The window that a person looks at when this process starts another application. */
unsigned long ownWindow() {
    unsigned long window = 0;
    Eina_List* const all = ecore_evas_ecore_evas_list_get();
    for (const Eina_List* at = all; at; at = eina_list_next(at)) {
        const auto* ee = static_cast<const Ecore_Evas*>(eina_list_data_get(at));
        if (isOnX(ee) && ecore_evas_visibility_get(ee) && (!window || ecore_evas_focus_get(ee)))
            window = ecore_evas_window_get(ee);
    }
    eina_list_free(all);
    return window;
}

} // namespace

Launch::Launch(app_control_s request, ReplyTo replyTo, const Program& program, std::string message)
    : _request(std::move(request)), _replyTo(replyTo), _program(program),
      _toSend(std::move(message)) {
    // Keeps the main loop's handlers alive for as long as this object has some.
    ecore_init();
    _handler = ecore_main_fd_handler_add(
        _program.channel, static_cast<Ecore_Fd_Handler_Flags>(ECORE_FD_READ | ECORE_FD_WRITE),
        _channelCb, this, nullptr, nullptr);
    // The main loop takes in the exit status of every child process.
    _endHandler = ecore_event_handler_add(ECORE_EXE_EVENT_DEL, _processEndedCb, this);
    send();
}

Launch::~Launch() {
    closeChannel();
    ecore_event_handler_del(_endHandler);
    if (_patience)
        ecore_timer_del(_patience);
    ecore_shutdown();
}

Eina_Bool Launch::_channelCb(void* data, Ecore_Fd_Handler* handler) {
    auto* self = static_cast<Launch*>(data);
    if (ecore_main_fd_handler_active_get(handler, ECORE_FD_WRITE))
        self->send();
    if (self->_handler && ecore_main_fd_handler_active_get(handler, ECORE_FD_READ))
        self->receive();
    // The handler was deleted, not to be renewed, if the channel is closed by now.
    return self->_handler ? ECORE_CALLBACK_RENEW : ECORE_CALLBACK_CANCEL;
}

Eina_Bool Launch::_processEndedCb(void* data, int, void* info) {
    const auto* event = static_cast<Ecore_Exe_Event_Del*>(info);
    if (event->pid == static_cast<Launch*>(data)->process())
        finish(event->pid, event->exited && event->exit_code == 0);
    return ECORE_CALLBACK_PASS_ON;
}

void Launch::send() {
    while (!_toSend.empty()) {
        const ssize_t sent = ::send(_program.channel, _toSend.data(), _toSend.size(), MSG_NOSIGNAL);
        if (sent < 0 && errno == EINTR)
            continue;
        if (sent < 0 && errno == EAGAIN)
            return;
        // A reader that has gone is noticed when its end of the channel is read.
        _toSend.erase(0, sent < 0 ? _toSend.size() : static_cast<std::size_t>(sent));
    }
    if (_handler)
        ecore_main_fd_handler_active_set(_handler, ECORE_FD_READ);
}

void Launch::receive() {
    std::array<char, 16UL * 1024> buffer{};
    while (_program.channel >= 0) {
        const ssize_t size = recv(_program.channel, buffer.data(), buffer.size(), 0);
        if (size < 0 && errno == EINTR)
            continue;
        if (size < 0 && errno == EAGAIN)
            return;
        if (size <= 0) {
            channelClosed();
            return;
        }
        _reader.add({buffer.data(), static_cast<std::size_t>(size)});
        readMessages();
    }
}

void Launch::readMessages() {
    if (_reader.isOverlong()) {
        breakOff("a message is too long");
        return;
    }
    while (const auto message = _reader.next()) {
        auto reply = decodeReply(*message);
        if (!reply) {
            breakOff("a message makes no sense");
            return;
        }
        if (_answered) {
            breakOff("it answered a second time");
            return;
        }
        answer(std::move(*reply));
    }
}

void Launch::channelClosed() {
    closeChannel();
    if (!_reader.isEmpty())
        fail("its answer ends in the middle");
    waitForEnd();
}

void Launch::breakOff(const char* why) {
    fail(why);
    terminate();
}

void Launch::closeChannel() {
    if (_handler)
        ecore_main_fd_handler_del(_handler);
    _handler = nullptr;
    if (_program.channel >= 0)
        close(_program.channel);
    _program.channel = -1;
    _toSend.clear();
}

void Launch::terminate() {
    closeChannel();
    kill(_program.process, SIGTERM);
    _killed = true;
    waitForEnd();
}

void Launch::waitForEnd() {
    if (!_patience)
        _patience = ecore_timer_add(patience, _impatientCb, this);
}

Eina_Bool Launch::_impatientCb(void* data) {
    auto* self = static_cast<Launch*>(data);
    self->_patience = nullptr;
    const pid_t process = self->process();
    int status = -1;
    // Somebody else may have taken in the exit status before the main loop could.
    if (waitpid(process, &status, WNOHANG) != 0) {
        finish(process, WIFEXITED(status) && WEXITSTATUS(status) == 0);
        return ECORE_CALLBACK_CANCEL;
    }
    if (!self->_answered)
        self->fail("it closed its channel and runs on");
    if (std::exchange(self->_killed, false))
        kill(process, SIGKILL);
    return ECORE_CALLBACK_CANCEL;
}

void Launch::replace() {
    if (_answered)
        return;
    LOG_INFO("%s is started again, the earlier request is cancelled", appId().c_str());
    answer({APP_CONTROL_RESULT_CANCELED, {}});
    terminate();
}

void Launch::ended(bool well) {
    receive();
    if (_answered)
        return;
    if (!well) {
        fail("it broke down without an answer");
        return;
    }
    LOG_INFO("%s was left without an answer", appId().c_str());
    answer({APP_CONTROL_RESULT_CANCELED, {}});
}

void Launch::answer(Reply reply) {
    if (std::exchange(_answered, true) || !_replyTo.callback)
        return;
    ecore_job_add(answerCb, new Answer{_request, _replyTo, std::move(reply)});
}

void Launch::fail(const char* why) {
    LOG_ERROR("%s (process %d): %s", appId().c_str(), process(), why);
    answer({APP_CONTROL_RESULT_FAILED, {}});
}

std::vector<pid_t> launchedProcesses() {
    std::vector<pid_t> processes;
    for (const auto& open : launches())
        processes.push_back(open->process());
    return processes;
}

int launch(const app_control_s& request, ReplyTo replyTo) {
    const std::string path = programOf(request.appId);
    if (path.empty()) {
        LOG_ERROR("There is no application %s", request.appId.c_str());
        return APP_CONTROL_ERROR_APP_NOT_FOUND;
    }
    app_control_s sent = request;
    if (request.mode == APP_CONTROL_LAUNCH_MODE_GROUP)
        sent.callerWindow = ownWindow();
    auto message = encodeRequest(sent);
    if (!message) {
        LOG_ERROR("The request to %s is too long", request.appId.c_str());
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    }
    for (const auto& open : launches())
        if (open->appId() == request.appId)
            open->replace();
    Program program;
    if (const int problem = startProgram(path, program)) {
        LOG_ERROR("%s cannot be started: %s", path.c_str(), std::strerror(problem));
        return APP_CONTROL_ERROR_IO;
    }
    launches().push_back(std::make_unique<Launch>(sent, replyTo, program, std::move(*message)));
    return APP_CONTROL_ERROR_NONE;
}

} // namespace host

/**
 * @file
 * @brief Applications that this process has started and that still run.
 */
#pragma once

#include <string>
#include <vector>

#include <Ecore.h>

#include "AppControl.h"
#include "Program.h"

namespace host {

/** The one who waits for an answer. */
struct ReplyTo {
    app_control_reply_cb callback = nullptr;
    void* data = nullptr;
};

/**
 * @brief One application that was started, from its start until its process has ended.
 *
 * The answer is handed on from the main loop, exactly once and never from within a call of the one
 * who waits for it.
 */
class Launch {
public:
    Launch(app_control_s request, ReplyTo replyTo, const Program& program, std::string message);
    ~Launch();
    Launch(const Launch&) = delete;
    Launch& operator=(const Launch&) = delete;

    const std::string& appId() const { return _request.appId; }
    pid_t process() const { return _program.process; }

    /** Makes room for the application's next start: cancels the request and ends the process. */
    void replace();
    /** What the process has left behind is read; then it has ended. */
    void ended(bool well);

private:
    static Eina_Bool _channelCb(void* data, Ecore_Fd_Handler* handler);
    static Eina_Bool _impatientCb(void* data);
    static Eina_Bool _processEndedCb(void* data, int type, void* info);
    void send();
    void receive();
    void readMessages();
    void channelClosed();
    void breakOff(const char* why);
    void closeChannel();
    void terminate();
    void waitForEnd();
    void answer(Reply reply);
    void fail(const char* why);

    app_control_s _request;
    ReplyTo _replyTo;
    Program _program;
    std::string _toSend;
    MessageReader _reader;
    Ecore_Fd_Handler* _handler = nullptr;
    Ecore_Event_Handler* _endHandler = nullptr;
    Ecore_Timer* _patience = nullptr;
    bool _answered = false;
    bool _killed = false;
};

/** The processes of the applications that were started here and still run. */
std::vector<pid_t> launchedProcesses();

/** @brief Starts the application of a request. @return One of app_control_error_e. */
int launch(const app_control_s& request, ReplyTo replyTo);

} // namespace host

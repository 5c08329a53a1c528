/**
 * @file
 * @brief Answers those who use this process's face from outside.
 */
#pragma once

#include <functional>
#include <list>
#include <memory>
#include <string>
#include <vector>

#include <Ecore.h>

#include "FrontWatch.h"
#include "base/Message.h"

namespace host {

/** Environment variable that names the folder in which a started application listens. */
inline constexpr const char* FACE_FOLDER_VARIABLE = "CLOCK_FACE_DIR";

/** Words of a request; the first one tells what to do. */
using Words = std::vector<std::string>;
/** The first word of an answer is empty or tells why not; what was asked for follows. */
using Answer = std::function<void(Words words)>;

/** Work that goes on until its answer is given or it is destroyed. */
using Work = std::shared_ptr<void>;

/**
 * @brief Does one request.
 * @param answer Called exactly once, at once or later.
 * @return What must be kept until the answer; null when it was given.
 */
Work doRequest(const Words& request, const Answer& answer);

/** One who is connected. Requests are done one after the other. */
class FaceCaller {
public:
    /** @param channel Owned by this object. @param gone May destroy this object. */
    FaceCaller(int channel, std::function<void(FaceCaller*)> gone);
    ~FaceCaller();
    FaceCaller(const FaceCaller&) = delete;
    FaceCaller& operator=(const FaceCaller&) = delete;

private:
    static Eina_Bool _channelCb(void* data, Ecore_Fd_Handler* handler);
    static void _nextCb(void* data);
    bool receive();
    void send();
    void next();
    void doNext(const std::string& message);
    void leave();

    int _channel;
    std::function<void(FaceCaller*)> _gone;
    Ecore_Fd_Handler* _handler;
    Ecore_Job* _nextJob = nullptr;
    base::MessageReader _reader;
    std::string _toSend;
    Work _work;
    bool _working = false;
};

/** Listens in the device's folder of faces while it lives. */
class FaceAgent {
public:
    /** The one of this process; null before listen(). */
    static FaceAgent* get();
    /** @return 0 or a negative errno. */
    static int listen(const std::string& folder);
    /** Listens where the environment says, if it does. */
    static void listenIfAsked();
    static void end();

    ~FaceAgent();
    FaceAgent(const FaceAgent&) = delete;
    FaceAgent& operator=(const FaceAgent&) = delete;

    const std::string& folder() const { return _folder; }
    const std::string& name() const { return _name; }

private:
    FaceAgent(std::string folder, std::string name, int channel);
    static Eina_Bool _callerCb(void* data, Ecore_Fd_Handler* handler);

    std::string _folder;
    std::string _name;
    int _channel;
    Ecore_Fd_Handler* _handler;
    std::list<std::unique_ptr<FaceCaller>> _callers;
    FrontWatch _front;
};

} // namespace host

#include "Recorder.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <utility>

#include <fcntl.h>
#include <poll.h>
#include <sys/socket.h>
#include <sys/time.h>
#include <sys/wait.h>
#include <unistd.h>

#include "AnimatedPicture.h"
#include "FaceChannel.h"
#include "FacePicture.h"
#include "RunningWatch.h"
#include "base/LocalSocket.h"
#include "base/Message.h"

namespace simulator {

namespace {

/** Beside the folder: what lies in it are the watch's applications. */
std::string recorderName(const std::string& folder) {
    return folder.substr(folder.rfind('/') + 1) + ".recorder";
}

std::string recorderFolder(const std::string& folder) {
    return folder.substr(0, folder.rfind('/'));
}

/** The recording in its own process. */
class Recording {
public:
    Recording(const std::string& folder, std::string file, int picturesPerSecond, int listener)
        : _watch(folder), _file(std::move(file)), _interval(1.0 / picturesPerSecond),
          _listener(listener) {}

    /** Until somebody stops it or the watch has ended. */
    void run() {
        _start = _watch.now();
        for (int count = 0; _problem.empty(); ++count) {
            const double due = _start + count * _interval;
            const int caller = waitUntil(std::max(due, _watch.now()));
            if (caller >= 0 && wantsEnd(caller)) {
                answer(caller, finish());
                return;
            }
            if (!takeNext())
                break;
        }
        // Nobody has asked yet: the file is there when somebody does.
        const std::string result = finish();
        constexpr double PATIENCE_SECONDS = 5;
        const int caller = waitUntil(_watch.now() + PATIENCE_SECONDS);
        if (caller >= 0 && wantsEnd(caller))
            answer(caller, result);
    }

private:
    /** @return Who connects before a time; -1 when nobody does. */
    int waitUntil(double time) {
        constexpr double MILLISECONDS = 1000;
        pollfd waiting{_listener, POLLIN, 0};
        const double left = std::max(0.0, time - _watch.now());
        if (poll(&waiting, 1, static_cast<int>(left * MILLISECONDS)) <= 0)
            return -1;
        return accept4(_listener, nullptr, nullptr, SOCK_CLOEXEC);
    }

    /** @return False, with the connection closed, for one who only looked. */
    static bool wantsEnd(int caller) {
        const timeval patience{1, 0};
        setsockopt(caller, SOL_SOCKET, SO_RCVTIMEO, &patience, sizeof patience);
        std::array<char, 64> bytes{};
        if (recv(caller, bytes.data(), bytes.size(), 0) > 0)
            return true;
        close(caller);
        return false;
    }

    /** @return False when there is nothing to record any more. */
    bool takeNext() {
        FacePicture picture;
        const double now = _watch.now() - _start;
        const std::string problem = takePicture(_watch, picture);
        if (!problem.empty())
            // An application that has just started shows nothing yet.
            return _watch.askWatch({"launches"}).problem.empty();
        cutRound(picture);
        if (picture.bytes == _last)
            return true;
        if (!_animation)
            _animation = std::make_unique<AnimatedPicture>(picture.width, picture.height);
        _problem = _animation->add(picture, now);
        _last = std::move(picture.bytes);
        return true;
    }

    std::string finish() {
        if (_problem.empty() && !_animation)
            _problem = "nothing was shown that could be recorded";
        if (_problem.empty())
            _problem = _animation->write(_file, _watch.now() - _start);
        return _problem;
    }

    static void answer(int caller, const std::string& result) {
        const std::string message = base::encodeMessage({result}).value_or("");
        send(caller, message.data(), message.size(), MSG_NOSIGNAL);
        close(caller);
    }

    RunningWatch _watch;
    std::string _file;
    double _interval;
    int _listener;
    double _start = 0;
    std::unique_ptr<AnimatedPicture> _animation;
    std::string _last;
    std::string _problem;
};

/** Cuts the process off from its parent, so that nobody waits for it. */
void becomeBackground(int listener) {
    setsid();
    const int nothing = open("/dev/null", O_RDWR | O_CLOEXEC);
    for (const int stream : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO})
        dup2(nothing, stream);
    // What this process has inherited must not keep anybody's channel open.
    constexpr int FIRST = 3;
    for (int open = FIRST; open < static_cast<int>(sysconf(_SC_OPEN_MAX)) && open < 256; ++open)
        if (open != listener)
            close(open);
}

/** Only looks whether somebody listens: a recorder ends when it is told to. */
bool isRunning(const std::string& place, const std::string& name) {
    const int recorder = base::connectTo(place, name);
    if (recorder >= 0)
        close(recorder);
    return recorder >= 0;
}

std::string checkWritable(const std::string& file) {
    std::FILE* stream = std::fopen(file.c_str(), "abe");
    if (stream == nullptr)
        return file + " cannot be written: " + std::strerror(errno);
    std::fclose(stream);
    return "";
}

} // namespace

std::string startRecording(const std::string& folder, const std::string& file,
                           int picturesPerSecond) {
    const std::string place = recorderFolder(folder);
    const std::string name = recorderName(folder);
    if (isRunning(place, name))
        return "a recording runs already";
    std::string problem = checkWritable(file);
    if (!problem.empty())
        return problem;
    unlink((place + "/" + name).c_str());
    const int listener = base::listenAt(place, name);
    if (listener < 0)
        return std::string("the recorder cannot start: ") + std::strerror(-listener);
    std::fflush(nullptr);
    const pid_t process = fork();
    if (process == 0) {
        // Twice, so that the recorder is nobody's child.
        if (fork() == 0) {
            becomeBackground(listener);
            Recording(folder, file, picturesPerSecond, listener).run();
            unlink((place + "/" + name).c_str());
        }
        _exit(EXIT_SUCCESS);
    }
    close(listener);
    if (process < 0)
        return std::string("the recorder cannot start: ") + std::strerror(errno);
    waitpid(process, nullptr, 0);
    return "";
}

std::string stopRecording(const std::string& folder) {
    const auto recorder = FaceChannel::open(recorderFolder(folder), recorderName(folder));
    if (!recorder)
        return "no recording runs";
    const auto reply = recorder->ask({"stop"});
    return reply ? reply->problem : "the recorder broke down";
}

} // namespace simulator

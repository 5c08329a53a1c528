#include "SoundThread.h"

#include <system_error>
#include <utility>

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace host {

using namespace std::chrono_literals;

namespace {

// A sound card that works is silent after a millisecond or two; for one that does not, the screen
// must not stand still.
constexpr auto LONGEST_WAIT = 100ms;

// A file without sound in it ends at once, and would begin again for ever.
constexpr auto SHORTEST_LOOP = 20ms;

} // namespace

SoundThread::SoundThread(const std::string& sink) : _sink(sink) {}

std::shared_ptr<SoundThread> SoundThread::start(const std::string& sink) {
    auto player = std::make_shared<SoundThread>(sink);
    try {
        // It keeps the object: the thread may outlive its owner, when a sound card hangs.
        player->_thread = std::thread([player] { player->run(); });
    } catch (const std::system_error& problem) {
        LOG_ERROR("There is no thread for sound: %s", problem.what());
        return nullptr;
    }
    return player;
}

void SoundThread::setPath(const std::string& path) {
    Lock lock(_mutex);
    beSilent(lock);
    _path = path;
}

bool SoundThread::hasPath() {
    const Lock lock(_mutex);
    return !_path.empty();
}

void SoundThread::setGain(double gain) {
    const Lock lock(_mutex);
    _gain = gain;
    if (_stream)
        _stream->setGain(gain);
}

void SoundThread::setLoop(bool loop) {
    const Lock lock(_mutex);
    _loop = loop;
}

void SoundThread::play() {
    const Lock lock(_mutex);
    if (_playing)
        return;
    _playing = true;
    ++_wishedRun;
    _changed.notify_all();
}

void SoundThread::stop() {
    Lock lock(_mutex);
    beSilent(lock);
}

void SoundThread::quit() {
    Lock lock(_mutex);
    _quit = true;
    _playing = false;
    _changed.notify_all();
    if (_changed.wait_for(lock, LONGEST_WAIT, [this] { return _finished; })) {
        lock.unlock();
        _thread.join();
        return;
    }
    LOG_WARNING("The sound of %s is still being ended", _path.c_str());
    _thread.detach();
}

void SoundThread::beSilent(Lock& lock) {
    _playing = false;
    // Heard sooner than the end of the stream, if that should take long.
    if (_stream)
        _stream->setGain(0.0);
    _changed.notify_all();
    if (!_changed.wait_for(lock, LONGEST_WAIT, [this] { return !_audible; }))
        LOG_WARNING("The sound of %s does not end in time", _path.c_str());
}

unsigned SoundThread::wishedRun() const {
    return _playing ? _wishedRun : 0;
}

void SoundThread::run() {
    Lock lock(_mutex);
    while (!_quit) {
        if (_run != 0 && _run != wishedRun())
            closeStream(lock);
        else if (_ending)
            handleEnding(lock);
        else if (_run != wishedRun())
            openStream(lock);
        else
            _changed.wait(lock);
    }
    closeStream(lock);
    _finished = true;
    _changed.notify_all();
}

void SoundThread::openStream(Lock& lock) {
    _run = wishedRun();
    const std::string path = _path;
    lock.unlock();
    std::string problem;
    auto stream = ToneStream::open(
        path, _sink, [this](const auto& why) { noteEnding(why); }, problem);
    lock.lock();
    if (!stream) {
        _ending = Ending{problem};
        return;
    }
    _stream = std::move(stream);
    if (_quit || _run != wishedRun())
        return;
    _stream->setGain(_gain);
    _audible = true;
    _began = std::chrono::steady_clock::now();
    // Only this thread replaces the stream.
    lock.unlock();
    _stream->play();
    lock.lock();
}

void SoundThread::closeStream(Lock& lock) {
    auto gone = std::move(_stream);
    lock.unlock();
    gone.reset();
    lock.lock();
    _ending.reset();
    _run = 0;
    _audible = false;
    _changed.notify_all();
}

bool SoundThread::repeats(const Ending& ending) const {
    if (!_loop || ending.problem)
        return false;
    if (std::chrono::steady_clock::now() - _began >= SHORTEST_LOOP)
        return true;
    LOG_WARNING("%s is too short to be repeated", _path.c_str());
    return false;
}

void SoundThread::handleEnding(Lock& lock) {
    const Ending ending = *std::exchange(_ending, std::nullopt);
    if (ending.problem)
        LOG_ERROR("%s cannot be played: %s", _path.c_str(), ending.problem->c_str());
    if (!repeats(ending)) {
        _playing = false;
        closeStream(lock);
        return;
    }
    _began = std::chrono::steady_clock::now();
    lock.unlock();
    const bool rewound = _stream->rewind();
    lock.lock();
    if (!rewound)
        closeStream(lock);
}

void SoundThread::noteEnding(const std::optional<std::string>& problem) {
    const Lock lock(_mutex);
    if (_ending)
        return;
    _ending = Ending{problem};
    _changed.notify_all();
}

} // namespace host

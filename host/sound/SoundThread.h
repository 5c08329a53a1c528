/**
 * @file
 * @brief Plays on a thread of its own.
 */
#pragma once

#include <chrono>
#include <condition_variable>
#include <memory>
#include <mutex>
#include <optional>
#include <string>
#include <thread>

#include "ToneStream.h"

namespace host {

/**
 * @brief A sound player that never makes the main loop wait for a sound card.
 *
 * The main thread states what it wishes; the thread brings the sound in line with it.
 */
class SoundThread {
public:
    /**
     * @param sink As ToneStream::open() takes it.
     * @return A running thread, or null when there can be none. To be ended with quit().
     */
    static std::shared_ptr<SoundThread> start(const std::string& sink);
    /** For start(). */
    explicit SoundThread(const std::string& sink);

    /** Chooses the file and stops. */
    void setPath(const std::string& path);
    bool hasPath();
    void setGain(double gain);
    void setLoop(bool loop);
    /** Plays from the beginning; a sound that plays goes on. */
    void play();
    /** Stops. Waits for silence, but only a moment. */
    void stop();
    /** Stops, and ends the thread or leaves it to end by itself. */
    void quit();

private:
    using Lock = std::unique_lock<std::mutex>;

    /** How a stream has ended: at the end of the file if there was no problem. */
    struct Ending {
        std::optional<std::string> problem;
    };

    void run();
    unsigned wishedRun() const;
    void openStream(Lock& lock);
    void closeStream(Lock& lock);
    void handleEnding(Lock& lock);
    bool repeats(const Ending& ending) const;
    void beSilent(Lock& lock);
    void noteEnding(const std::optional<std::string>& problem);

    const std::string _sink;
    std::thread _thread;
    std::mutex _mutex;
    std::condition_variable _changed;

    // The wishes.
    std::string _path;
    bool _loop = false;
    bool _playing = false;
    bool _quit = false;
    double _gain = 1.0;
    /** Counts the times that playing began. */
    unsigned _wishedRun = 0;

    // What is.
    /** Which of those times the thread is about, 0 for none. */
    unsigned _run = 0;
    bool _audible = false;
    bool _finished = false;
    std::unique_ptr<ToneStream> _stream;
    std::optional<Ending> _ending;
    std::chrono::steady_clock::time_point _began;
};

} // namespace host

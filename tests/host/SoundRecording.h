/**
 * @file
 * @brief What a sound card would have got, and files to play.
 */
#pragma once

#include <cstdint>
#include <string>
#include <vector>

/** Samples of one channel, 44100 in a second. */
using Samples = std::vector<std::int16_t>;

inline constexpr double SAMPLES_PER_SECOND = 44100.0;

/** Keeps all sound of players that are created while it lives, at the speed of a sound card. */
class SoundRecording {
public:
    explicit SoundRecording(const std::string& path);
    ~SoundRecording();
    SoundRecording(const SoundRecording&) = delete;
    SoundRecording& operator=(const SoundRecording&) = delete;

    /** Everything until now. */
    Samples samples() const;
    /** Length of everything until now. */
    double seconds() const;
    /** Waits until there is that much of it. @return False when it does not come. */
    bool waitFor(double seconds) const;

private:
    std::string _path;
    int _file;
};

/** Takes away the chosen sink for a while, or chooses another one. */
class AudioSink {
public:
    explicit AudioSink(const char* description);
    ~AudioSink();
    AudioSink(const AudioSink&) = delete;
    AudioSink& operator=(const AudioSink&) = delete;
};

/** Loudness of a part of a sound, both ends in seconds; 1 is that of the loudest possible sound. */
double loudness(const Samples& samples, double from = 0.0, double to = 1e9);

/** How often a sound begins after a silence. */
int beginnings(const Samples& samples);

/** An even tone. */
Samples evenTone(double seconds);

Samples silence(double seconds);

/** Writes samples as a WAV file. */
void writeWave(const std::string& path, const Samples& samples);

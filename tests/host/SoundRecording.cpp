#include "SoundRecording.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <cstring>
#include <numbers>

#include <fcntl.h>
#include <unistd.h>

#include "Helper.h"

namespace {

constexpr const char* SINK = "CLOCK_AUDIO_SINK";

void append(std::string& bytes, std::uint32_t value, int size) {
    for (int index = 0; index < size; ++index)
        bytes += static_cast<char>(value >> (8 * index) & 255U);
}

std::size_t indexAt(const Samples& samples, double seconds) {
    const double index =
        std::clamp(seconds * SAMPLES_PER_SECOND, 0.0, static_cast<double>(samples.size()));
    return static_cast<std::size_t>(index);
}

} // namespace

SoundRecording::SoundRecording(const std::string& path)
    : _path(path), _file(open(path.c_str(), O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC, 0600)) {
    const std::string description =
        "audioconvert ! audioresample ! audio/x-raw,format=S16LE,channels=1,rate=44100 ! "
        "fdsink sync=true fd=" +
        std::to_string(_file);
    setenv(SINK, description.c_str(), 1);
}

SoundRecording::~SoundRecording() {
    unsetenv(SINK);
    close(_file);
}

Samples SoundRecording::samples() const {
    const std::string bytes = readFile(_path);
    Samples samples(bytes.size() / sizeof(std::int16_t));
    if (!samples.empty())
        std::memcpy(samples.data(), bytes.data(), samples.size() * sizeof(std::int16_t));
    return samples;
}

double SoundRecording::seconds() const {
    return static_cast<double>(samples().size()) / SAMPLES_PER_SECOND;
}

bool SoundRecording::waitFor(double wanted) const {
    return iterateUntil([&] { return seconds() >= wanted; });
}

AudioSink::AudioSink(const char* description) {
    if (description)
        setenv(SINK, description, 1);
    else
        unsetenv(SINK);
}

AudioSink::~AudioSink() {
    unsetenv(SINK);
}

double loudness(const Samples& samples, double from, double to) {
    const std::size_t begin = indexAt(samples, from);
    const std::size_t end = indexAt(samples, to);
    double sum = 0.0;
    for (std::size_t index = begin; index < end; ++index)
        sum += static_cast<double>(samples[index]) * samples[index];
    return begin < end ? std::sqrt(sum / static_cast<double>(end - begin)) / 32768.0 : 0.0;
}

int beginnings(const Samples& samples) {
    // Longer than the zeros in the middle of a tone.
    constexpr int SILENCE = 400;
    int found = 0;
    int quiet = SILENCE;
    for (const std::int16_t sample : samples) {
        if (std::abs(sample) < 8) {
            ++quiet;
            continue;
        }
        found += quiet >= SILENCE ? 1 : 0;
        quiet = 0;
    }
    return found;
}

Samples evenTone(double seconds) {
    Samples samples(static_cast<std::size_t>(seconds * SAMPLES_PER_SECOND));
    for (std::size_t index = 0; index < samples.size(); ++index)
        samples[index] = static_cast<std::int16_t>(
            16000.0 * std::sin(2.0 * std::numbers::pi * 441.0 * static_cast<double>(index) /
                               SAMPLES_PER_SECOND));
    return samples;
}

Samples silence(double seconds) {
    return Samples(static_cast<std::size_t>(seconds * SAMPLES_PER_SECOND), 0);
}

void writeWave(const std::string& path, const Samples& samples) {
    const auto size = static_cast<std::uint32_t>(samples.size() * sizeof(std::int16_t));
    std::string bytes = "RIFF";
    append(bytes, size + 36, 4);
    bytes += "WAVEfmt ";
    append(bytes, 16, 4);
    append(bytes, 1, 2);
    append(bytes, 1, 2);
    append(bytes, 44100, 4);
    append(bytes, 88200, 4);
    append(bytes, 2, 2);
    append(bytes, 16, 2);
    bytes += "data";
    append(bytes, size, 4);
    bytes.append(reinterpret_cast<const char*>(samples.data()), size);
    writeFile(path, bytes);
}

#include "WheelMotion.h"

#include <algorithm>
#include <cmath>

namespace host {

namespace {

constexpr unsigned SPEED_WINDOW_MS = 100;
constexpr unsigned REST_MS = 60;
/** How long a wheel runs on, in seconds of its speed. */
constexpr double RUN_ON = 0.25;
constexpr double SHORTEST_GLIDE = 0.16;
constexpr double LONGEST_GLIDE = 1.2;
constexpr double RESISTANCE = 0.35;

} // namespace

void FingerSpeed::add(unsigned milliseconds, double position) {
    _samples.push_back({milliseconds, position});
    while (milliseconds - _samples.front().time > SPEED_WINDOW_MS)
        _samples.pop_front();
}

double FingerSpeed::at(unsigned milliseconds) const {
    if (_samples.size() < 2 || milliseconds - _samples.back().time > REST_MS)
        return 0;
    const unsigned elapsed = _samples.back().time - _samples.front().time;
    if (elapsed == 0)
        return 0;
    return (_samples.back().position - _samples.front().position) * 1000.0 / elapsed;
}

double Glide::at(double now) const {
    if (endedAt(now))
        return static_cast<double>(to);
    const double left = 1.0 - std::max(0.0, now - start) / duration;
    return static_cast<double>(to) - (static_cast<double>(to) - from) * left * left * left;
}

long restingPlace(double position, double speed) {
    return std::lround(position + speed * RUN_ON);
}

Glide glideFrom(double position, long to, double speed, double now) {
    const double distance = static_cast<double>(to) - position;
    // The curve of Glide::at() starts at three times its mean speed.
    const double natural = speed * distance > 0 ? 3.0 * distance / speed : SHORTEST_GLIDE;
    return {position, to, now, std::clamp(natural, SHORTEST_GLIDE, LONGEST_GLIDE)};
}

int wrapped(long value, int count) {
    const long remainder = value % count;
    return static_cast<int>(remainder < 0 ? remainder + count : remainder);
}

double resisting(double position, int count) {
    const double last = count - 1;
    if (position < 0)
        return -std::min(RESISTANCE, -position * RESISTANCE);
    if (position > last)
        return last + std::min(RESISTANCE, (position - last) * RESISTANCE);
    return position;
}

} // namespace host

/**
 * @file
 * @brief How a wheel moves, without a toolkit: fingers in, positions out.
 */
#pragma once

#include <deque>

namespace host {

/** Speed of a finger from its last moves. */
class FingerSpeed {
public:
    void reset() { _samples.clear(); }
    /** @param milliseconds Time of the input event. @param position In values of the wheel. */
    void add(unsigned milliseconds, double position);
    /** @return Values per second at `milliseconds`; 0 when the finger rested before. */
    double at(unsigned milliseconds) const;

private:
    struct Sample {
        unsigned time;
        double position;
    };
    std::deque<Sample> _samples;
};

/** A move that slows down and ends exactly on a value. */
struct Glide {
    double from = 0;
    long to = 0;
    double start = 0;    ///< Seconds.
    double duration = 0; ///< Seconds.

    double at(double now) const;
    bool endedAt(double now) const { return now >= start + duration; }
};

/** Where a wheel that is let go at a speed comes to rest when nothing stops it. */
long restingPlace(double position, double speed);

/** A glide that begins at the speed of the finger as far as it can. */
Glide glideFrom(double position, long to, double speed, double now);

/** The remainder that is never negative. */
int wrapped(long value, int count);

/** A position that resists beyond the ends of a wheel that does not wrap. */
double resisting(double position, int count);

} // namespace host

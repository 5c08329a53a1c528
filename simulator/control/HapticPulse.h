/**
 * @file
 * @brief Haptic taps that can be seen.
 */
#pragma once

#include <functional>
#include <string>

#include <Evas.h>

namespace simulator {

/**
 * @brief Lets a ring flash round the rim of the face with every tap that the wearer would feel.
 *
 * One object per process; it must go before its window.
 */
class HapticPulse {
public:
    /**
     * @param window The face.
     * @param theme Path of the simulator's theme.
     * @param felt Told of every tap too.
     */
    HapticPulse(Evas_Object* window, const std::string& theme, std::function<void()> felt);
    ~HapticPulse();
    HapticPulse(const HapticPulse&) = delete;
    HapticPulse& operator=(const HapticPulse&) = delete;

private:
    static void _hapticCb(int pattern, void* data);

    Evas_Object* _layout;
    std::function<void()> _felt;
};

} // namespace simulator

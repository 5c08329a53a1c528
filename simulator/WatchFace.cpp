#include "WatchFace.h"

#include <algorithm>
#include <cmath>
#include <cstdint>

namespace simulator {
namespace {

/** The body's colour at a point, premultiplied ARGB: clear inside the circle, soft at its edge. */
std::uint32_t bezelPixel(int x, int y) {
    constexpr double RADIUS = FACE_SIZE / 2.0;
    constexpr unsigned RED = 38;
    constexpr unsigned GREEN = 40;
    constexpr unsigned BLUE = 46;
    const double distance = std::hypot(x + 0.5 - RADIUS, y + 0.5 - RADIUS);
    const double cover = std::clamp(distance - (RADIUS - 0.5), 0.0, 1.0);
    const auto scaled = [cover](unsigned value) {
        return static_cast<std::uint32_t>(std::lround(cover * value));
    };
    return scaled(255) << 24 | scaled(RED) << 16 | scaled(GREEN) << 8 | scaled(BLUE);
}

} // namespace

void addBezel(Evas_Object* window) {
    Evas_Object* bezel = evas_object_image_filled_add(evas_object_evas_get(window));
    evas_object_image_alpha_set(bezel, EINA_TRUE);
    evas_object_image_size_set(bezel, FACE_SIZE, FACE_SIZE);
    auto* pixels = static_cast<std::uint32_t*>(evas_object_image_data_get(bezel, EINA_TRUE));
    if (pixels != nullptr) {
        for (int i = 0; i < FACE_SIZE * FACE_SIZE; ++i)
            pixels[i] = bezelPixel(i % FACE_SIZE, i / FACE_SIZE);
        evas_object_image_data_set(bezel, pixels);
        evas_object_image_data_update_add(bezel, 0, 0, FACE_SIZE, FACE_SIZE);
    }
    evas_object_resize(bezel, FACE_SIZE, FACE_SIZE);
    // Above everything, popups included.
    evas_object_layer_set(bezel, EVAS_LAYER_MAX);
    evas_object_pass_events_set(bezel, EINA_TRUE);
    evas_object_show(bezel);
}

} // namespace simulator

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <utility>

#include <Ecore_X.h>
#include <Elementary.h>

#include "LaunchRequest.h"
#include "device_app.h"

namespace {

constexpr int FACE_SIZE = 360;

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

/** Where a window is on the screen; a window manager may have put it into a frame. */
std::pair<int, int> placeOf(Ecore_X_Window window) {
    std::pair<int, int> place{0, 0};
    while (window) {
        int x = 0;
        int y = 0;
        ecore_x_window_geometry_get(window, &x, &y, nullptr, nullptr);
        place.first += x;
        place.second += y;
        window = ecore_x_window_parent_get(window);
    }
    return place;
}

} // namespace

void device_app_place_window(Evas_Object* window) {
    host::LaunchRequest* own = host::LaunchRequest::get();
    const Ecore_X_Window mine = window ? elm_win_xwindow_get(window) : 0;
    const auto caller =
        own ? static_cast<Ecore_X_Window>(own->request()->callerWindow) : Ecore_X_Window{0};
    Ecore_X_Window_Attributes attributes{};
    // The caller may be gone by now: nothing of it may be named then.
    if (!mine || !caller || !ecore_x_window_attributes_get(caller, &attributes))
        return;
    const auto [x, y] = placeOf(caller);
    ecore_x_icccm_transient_for_set(mine, caller);
    evas_object_move(window, x, y);
}

void device_app_add_bezel(Evas_Object* window) {
    if (!window)
        return;
    Evas_Object* bezel = evas_object_image_filled_add(evas_object_evas_get(window));
    evas_object_image_alpha_set(bezel, EINA_TRUE);
    evas_object_image_size_set(bezel, FACE_SIZE, FACE_SIZE);
    auto* pixels = static_cast<std::uint32_t*>(evas_object_image_data_get(bezel, EINA_TRUE));
    if (pixels) {
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

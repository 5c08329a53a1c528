#include "screens/SliderHand.h"

#include <cmath>

#include <gtest/gtest.h>

namespace {

Area partOf(Evas_Object* slider, const char* part) {
    const Evas_Object* edje = elm_layout_edje_get(slider);
    Area inside;
    int x = 0;
    int y = 0;
    evas_object_geometry_get(edje, &x, &y, nullptr, nullptr);
    if (!edje_object_part_geometry_get(edje, part, &inside.x, &inside.y, &inside.width,
                                       &inside.height))
        ADD_FAILURE() << "no part \"" << part << "\"";
    return {x + inside.x, y + inside.y, inside.width, inside.height};
}

} // namespace

Spot SliderHand::knob(Evas_Object* slider) {
    return partOf(slider, "elm.dragable.slider").middle();
}

Spot SliderHand::place(Evas_Object* slider, double value) {
    double least = 0;
    double most = 0;
    elm_slider_min_max_get(slider, &least, &most);
    const Area bar = partOf(slider, "elm.swallow.bar");
    const int knob = partOf(slider, "elm.dragable.slider").width;
    const double part = (value - least) / (most - least);
    return {static_cast<int>(std::lround(bar.x + knob / 2.0 + part * (bar.width - knob))),
            bar.middle().y};
}

void SliderHand::take(Evas_Object* slider) {
    _finger = knob(slider);
    _stage.press(_finger.x, _finger.y);
}

void SliderHand::moveTo(Evas_Object* slider, double value) {
    constexpr int STEPS = 12;
    const Spot from = _finger;
    const Spot to = place(slider, value);
    for (int step = 1; step <= STEPS; ++step) {
        _finger = {from.x + (to.x - from.x) * step / STEPS,
                   from.y + (to.y - from.y) * step / STEPS};
        _stage.moveTo(_finger.x, _finger.y);
    }
    Stage::frames(2);
}

void SliderHand::letGo() {
    _stage.release();
    Stage::frames(3);
}

void SliderHand::drag(Evas_Object* slider, double value) {
    take(slider);
    moveTo(slider, value);
    letGo();
}

std::string iconGroupOf(Evas_Object* slider) {
    const Evas_Object* icon = elm_object_part_content_get(slider, "elm.swallow.icon");
    const char* file = nullptr;
    const char* group = nullptr;
    if (icon)
        elm_image_file_get(icon, &file, &group);
    return group ? group : "";
}

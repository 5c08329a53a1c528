#include "support/Look.h"

#include <algorithm>
#include <cstdlib>
#include <initializer_list>

#include "support/Ring.h"

namespace {

/** What an eye tells apart on a small display. */
constexpr int CLEARLY = 12;
/** How much more blue than red the accent colour has at least, over whatever it lies. */
constexpr int BLUISH = 60;

constexpr int RED = 16;
constexpr int GREEN = 8;
constexpr int BLUE = 0;

int channel(unsigned pixel, int shift) {
    return static_cast<int>(pixel >> static_cast<unsigned>(shift) & 0xFF);
}

int brightness(unsigned pixel) {
    return std::max({channel(pixel, RED), channel(pixel, GREEN), channel(pixel, BLUE)});
}

bool differ(unsigned one, unsigned other) {
    return std::ranges::any_of(std::initializer_list<int>{RED, GREEN, BLUE}, [&](int shift) {
        return std::abs(channel(one, shift) - channel(other, shift)) >= CLEARLY;
    });
}

} // namespace

Look::Look(Stage& stage, const Area& area) {
    stage.settle();
    _pixels = stage.pixels(area.x, area.y, area.width, area.height);
}

int Look::unlike(const Look& other) const {
    int count = 0;
    for (std::size_t i = 0; i < std::min(_pixels.size(), other._pixels.size()); ++i)
        count += differ(_pixels[i], other._pixels[i]) ? 1 : 0;
    return count;
}

int Look::accent() const {
    return static_cast<int>(std::ranges::count_if(_pixels, [](unsigned pixel) {
        return channel(pixel, BLUE) > channel(pixel, RED) + BLUISH;
    }));
}

int Look::brightest() const {
    int most = 0;
    for (const unsigned pixel : _pixels)
        most = std::max(most, brightness(pixel));
    return most;
}

int Look::darkest() const {
    int least = 255;
    for (const unsigned pixel : _pixels)
        least = std::min(least, brightness(pixel));
    return least;
}

void pressOn(Stage& stage, Evas_Object* object) {
    const Spot middle = Stage::area(object).middle();
    stage.press(middle.x, middle.y);
}

bool tabTo(Stage& stage, const Evas_Object* widget) {
    constexpr int THINGS = 20;
    for (int i = 0; i < THINGS; ++i) {
        stage.keySettled("Tab");
        const auto found = ringed(stage);
        if (!found.empty() && found.front().edje == elm_layout_edje_get(widget))
            return true;
    }
    return false;
}

#include "support/Stage.h"

#include <cmath>
#include <cstdlib>
#include <utility>

#include <Ecore_Evas.h>

#include <gtest/gtest.h>

#include "app_assist/WContentViewController.h"
#include "device_app.h"
#include "support/VirtualClock.h"

namespace {

constexpr int QUIET_FRAMES = 15;

void renderedCb(void* data, Evas* /*canvas*/, void* /*info*/) {
    ++*static_cast<int*>(data);
}

} // namespace

bool Area::insideCircle() const {
    const double radius = Stage::SIZE / 2.0;
    for (const int cornerX : {x, x + width}) {
        for (const int cornerY : {y, y + height}) {
            if (std::hypot(cornerX - radius, cornerY - radius) > radius) {
                return false;
            }
        }
    }
    return true;
}

Stage::Stage() {
    _window = std::make_unique<app_assist::WWindowController>("stage", SIZE, SIZE);
    _window->create(nullptr, nullptr);
    _naviframe = new app_assist::WNaviframeController;
    _window->setBaseController(_naviframe);
    evas_event_callback_add(canvas(), EVAS_CALLBACK_RENDER_FLUSH_POST, renderedCb, _rendered.get());
    device_app_add_bezel(window());
    // A window of the buffer engine has the focus for the toolkit only after it was without it.
    Ecore_Evas* const ee = ecore_evas_ecore_evas_get(canvas());
    ecore_evas_focus_set(ee, EINA_FALSE);
    frames(1);
    ecore_evas_focus_set(ee, EINA_TRUE);
    frames(2);
}

Stage::~Stage() {
    takeDown();
}

Evas_Object* Stage::window() const {
    return _window ? _window->getEvasObj() : nullptr;
}

Evas* Stage::canvas() const {
    return evas_object_evas_get(window());
}

void Stage::push(app_assist::WContentViewController* page) {
    _naviframe->push(page);
    settle(2);
}

void Stage::takeDown() {
    if (!_window) {
        return;
    }
    if (Evas_Object* face = window()) {
        const Area size = area(face);
        EXPECT_TRUE(size.width == SIZE && size.height == SIZE)
            << "what was shown has made the window " << size.width << " x " << size.height;
    }
    _naviframe = nullptr;
    _window.reset();
    frames(3);
}

void Stage::frames(int count) {
    VirtualClock::frames(count);
}

void Stage::advance(double seconds) {
    VirtualClock::advance(seconds);
}

bool Stage::settle(double seconds) {
    int drawn = *_rendered;
    int quiet = 0;
    for (int left = static_cast<int>(seconds * 60); left > 0 && quiet < QUIET_FRAMES; --left) {
        frames(1);
        quiet = drawn == *_rendered ? quiet + 1 : 0;
        drawn = *_rendered;
    }
    return quiet == QUIET_FRAMES;
}

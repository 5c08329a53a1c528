#include "FaceStill.h"

#include <utility>

#include <Eo.h>

#include "Animations.h"
#include "FaceWindow.h"

namespace host {

namespace {

constexpr double LOOK_SECONDS = 0.04;
/** A display sends its next tick well within this. */
constexpr int QUIET_LOOKS = 3;
/** The look's own timer turns the loop, once or twice. */
constexpr int OWN_TURNS = 2;

} // namespace

FaceStill::FaceStill(double seconds, Done done)
    : _end(ecore_time_get() + seconds), _done(std::move(done)),
      _timer(ecore_timer_add(LOOK_SECONDS, _lookCb, this)) {
    countTurns();
    _seen = turnsSoFar();
}

FaceStill::~FaceStill() {
    follow(nullptr);
    if (_timer)
        ecore_timer_del(_timer);
}

void FaceStill::follow(Ecore_Evas* window) {
    Evas* canvas = window ? ecore_evas_get(window) : nullptr;
    if (canvas == _canvas)
        return;
    if (_canvas) {
        evas_event_callback_del_full(_canvas, EVAS_CALLBACK_RENDER_POST, _renderedCb, this);
        efl_wref_del(_canvas, &_canvas);
    }
    _canvas = canvas;
    if (_canvas) {
        evas_event_callback_add(_canvas, EVAS_CALLBACK_RENDER_POST, _renderedCb, this);
        efl_wref_add(_canvas, &_canvas);
    }
}

void FaceStill::_renderedCb(void* data, Evas* /*canvas*/, void* info) {
    auto* self = static_cast<FaceStill*>(data);
    const auto* event = static_cast<const Evas_Event_Render_Post*>(info);
    if (!event || !event->updated_area)
        return;
    ++self->_rendered;
    self->_changed = *static_cast<const Eina_Rectangle*>(eina_list_data_get(event->updated_area));
}

std::string FaceStill::describeChange() const {
    return "it is drawn again and again at " + std::to_string(_changed.x) + " " +
           std::to_string(_changed.y) + ", " + std::to_string(_changed.w) + " x " +
           std::to_string(_changed.h) + " pixels";
}

std::string FaceStill::look() {
    const Turns now = turnsSoFar();
    const Turns before = std::exchange(_seen, now);
    const int rendered = std::exchange(_rendered, 0);
    Ecore_Evas* window = faceWindow();
    const bool sameCanvas = window && ecore_evas_get(window) == _canvas;
    follow(window);
    if (!window)
        return "no window is shown";
    if (rendered > 0)
        return describeChange();
    if (isAnimated(_canvas))
        return "an animation runs that draws nothing";
    if (evas_changed_get(_canvas))
        return "something waits to be drawn";
    // Serving a request takes a turn, and another one to get back to sleep.
    const int own = 2 * (now.own - before.own);
    if (!sameCanvas || now.busy - before.busy > OWN_TURNS + own ||
        now.all - before.all > 2 * OWN_TURNS + own)
        return "the main loop has work to do";
    return "";
}

Eina_Bool FaceStill::_lookCb(void* data) {
    auto* self = static_cast<FaceStill*>(data);
    const std::string why = self->look();
    self->_quietLooks = why.empty() ? self->_quietLooks + 1 : 0;
    const bool still = self->_quietLooks >= QUIET_LOOKS;
    if (!still && ecore_time_get() < self->_end)
        return ECORE_CALLBACK_RENEW;
    self->_timer = nullptr;
    const Done done = std::move(self->_done);
    done(still ? "" : why.empty() ? "it has only just come to rest" : why);
    return ECORE_CALLBACK_CANCEL;
}

} // namespace host

// Who waits for frames is known to the toolkit's object interface alone.
#define EFL_BETA_API_SUPPORT 1
#include "Animations.h"

#include <Eo.h>

namespace host {

bool isAnimated(Evas* canvas) {
    return efl_event_callback_count(canvas, EFL_CANVAS_OBJECT_EVENT_ANIMATOR_TICK) > 0;
}

} // namespace host

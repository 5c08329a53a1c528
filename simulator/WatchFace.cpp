#include "WatchFace.h"

#include "device_app.h"

namespace simulator {

void addBezel(Evas_Object* window) {
    // The same for every application of the device.
    device_app_add_bezel(window);
}

} // namespace simulator

// A program whose link line names the toolkit before the device library.
#include <Elementary.h>

#include "device_host.h"

/** @return 0 when the device notices. */
int main() {
    char error[512] = "";
    elm_init(0, nullptr);
    const bool started = device_host_init(nullptr, error, sizeof error) == 0;
    const bool refused = device_host_init_toolkit() < 0;
    device_host_shutdown();
    elm_shutdown();
    return started && refused ? 0 : 1;
}

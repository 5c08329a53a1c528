#include <cstdio>
#include <cstdlib>

#include "Options.h"
#include "PickCity.h"
#include "Watch.h"
#include "device_app.h"
#include "script/ScriptMode.h"

int main(int argc, char** argv) {
    constexpr int USAGE_ERROR = 2;
    // Before anything else: what this process opens and starts must not get at the caller's
    // channel.
    device_app_launch_request();
    simulator::Options options = simulator::parseOptions({argv + (argc > 0), argv + argc});
    if (argc > 0 && simulator::isCityPicker(argv[0]))
        options.pickCity = true;
    if (!options.error.empty()) {
        std::fprintf(stderr, "clock-sim: %s; see clock-sim --help\n", options.error.c_str());
        return USAGE_ERROR;
    }
    if (options.help) {
        std::fputs(simulator::helpText().c_str(), stdout);
        return EXIT_SUCCESS;
    }
    if (options.version) {
        std::puts("clock-sim " CLOCK_UI_VERSION);
        return EXIT_SUCCESS;
    }
    if (!options.commands.empty())
        return simulator::sendCommands(options);
    if (!options.script.empty())
        return simulator::runScript(options, simulator::runWatch);
    return simulator::runWatch(options);
}

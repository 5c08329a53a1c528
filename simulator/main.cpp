#include <cstdio>
#include <cstdlib>

#include "Options.h"
#include "Watch.h"

int main(int argc, char** argv) {
    constexpr int USAGE_ERROR = 2;
    const simulator::Options options = simulator::parseOptions({argv + (argc > 0), argv + argc});
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
    return simulator::runWatch(options);
}

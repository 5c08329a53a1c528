#include <cstdio>
#include <cstdlib>
#include <string_view>

#include "Options.h"
#include "PickCity.h"
#include "Watch.h"
#include "device_app.h"

namespace {

/** Applications are started by their names alone. */
bool isCityPicker(const char* program) {
    const std::string_view path(program);
    return path.substr(path.rfind('/') + 1) == simulator::CITY_PICKER_ID;
}

} // namespace

int main(int argc, char** argv) {
    constexpr int USAGE_ERROR = 2;
    simulator::Options options = simulator::parseOptions({argv + (argc > 0), argv + argc});
    if (argc > 0 && isCityPicker(argv[0]))
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
    return simulator::runWatch(options);
}

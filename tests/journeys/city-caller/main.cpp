// Another application that asks for a city, and prints the answer.

#include <cstdio>
#include <cstdlib>

#include <Ecore.h>

#include <device/app_control.h>
#include <device_app.h>
#include <device_host.h>

namespace {

bool printExtra(const char* key, const char* value, void*) {
    std::printf("%s = %s\n", key, value);
    return true;
}

void answeredCb(app_control_h, app_control_h reply, app_control_result_e result, void*) {
    std::printf("result = %d\n", static_cast<int>(result));
    device_app_foreach_extra_data(reply, printExtra, nullptr);
    std::fflush(stdout);
    ecore_main_loop_quit();
}

bool ask(const char* application) {
    app_control_h request = nullptr;
    const bool sent =
        app_control_create(&request) == APP_CONTROL_ERROR_NONE &&
        app_control_set_app_id(request, application) == APP_CONTROL_ERROR_NONE &&
        app_control_send_launch_request(request, answeredCb, nullptr) == APP_CONTROL_ERROR_NONE;
    app_control_destroy(request);
    return sent;
}

} // namespace

int main(int argc, char** argv) {
    if (argc != 2) {
        std::fprintf(stderr, "usage: city-caller APPLICATION\n");
        return 2;
    }
    if (device_host_init(nullptr, nullptr, 0) != 0)
        return EXIT_FAILURE;
    ecore_init();
    const bool sent = ask(argv[1]);
    if (sent)
        ecore_main_loop_begin();
    device_host_shutdown();
    ecore_shutdown();
    return sent ? EXIT_SUCCESS : EXIT_FAILURE;
}

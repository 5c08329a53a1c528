// Opens the alarm editor for a new alarm and ends when the editor is left.

#include <Elementary.h>

#include <AlarmEditViewController.h>
#include <app_assist/WNaviframeController.h>
#include <app_assist/WWindowController.h>
#include <device_host.h>

int main(int argc, char** argv) {
    // On a watch the three calls to device_host fall away: the device is already there.
    char error[256];
    if (device_host_init(nullptr, error, sizeof error) != 0) {
        fprintf(stderr, "%s\n", error);
        return 1;
    }
    elm_init(argc, argv);
    if (device_host_init_toolkit() != 0) {
        fprintf(stderr, "The device's theme is missing.\n");
        return 1;
    }

    {
        app_assist::WWindowController window("alarm-editor", 360, 360);
        window.create(nullptr, nullptr);
        auto* pages = new app_assist::WNaviframeController();
        window.setBaseController(pages);
        pages->setOnEmpty([] { elm_exit(); });
        pages->push(
            new AlarmEditViewController(ALARM_EDIT_VIEW_CALLER_CLOCK, ClockAlarmDbData(), true));
        evas_object_show(window.getEvasObj());
        elm_run();
    }

    device_host_shutdown();
    elm_shutdown();
    return 0;
}

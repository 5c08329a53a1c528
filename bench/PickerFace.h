// The city picker on a watch face, used in real time.
#pragma once

#include <string>
#include <vector>

#include <Elementary.h>

#include "WorldClockAddCityViewController.h"
#include "app_assist/WNaviframeController.h"
#include "app_assist/WWindowController.h"

/** What the main loop did until it had nothing left to do. */
struct Work {
    double longestTurn = 0; ///< In ms: how long a key press may have to wait.
    int turns = 0;
};

/** Runs the main loop until it wants to sleep. */
Work runUntilAsleep();
/** Runs the main loop, asleep or not. */
void runFor(double seconds);
/** In ms. */
double millisecondsNow();

/** The window; a picker is pressed and looked at with the device's own events. */
class PickerFace {
public:
    PickerFace();
    ~PickerFace();
    PickerFace(const PickerFace&) = delete;
    PickerFace& operator=(const PickerFace&) = delete;

    Evas_Object* window() { return _window.getEvasObj(); }
    Evas_Object* naviframe() { return _pages->getEvasObj(); }
    int frames() const { return _frames; }
    /** Waits until all rows are there, and everything that moved stands. */
    void rest();
    /** Draws all of the face again. @return The time in ms. */
    double drawFrame();

    /** Opens the picker. @return The time to the first frame that shows cities, in ms; negative
     *  when there is none. */
    double open();
    /** Puts the cursor into the search field. */
    void tapEntry();
    void close();
    /**
     * Presses a key.
     * @param text What the search field holds then.
     * @return The time to the first frame that shows the cities of that text, in ms; negative when
     *         there is none.
     */
    double press(const char* key, const std::string& text);
    /** Types or erases, and waits until all rows are there. */
    Work bringTo(const std::string& text);
    std::string text();
    int rowCount();

private:
    static void renderedCb(void* self, Evas* canvas, void* info);
    static Eina_Bool tooLateCb(void* self);

    Evas_Object* part(const std::vector<const char*>& path);
    Evas_Object* genlist();
    Evas_Object* entry();
    void sendKey(int type, const char* key);
    double timeToCities();
    bool showsCities();

    app_assist::WWindowController _window;
    app_assist::WNaviframeController* _pages = nullptr;
    WorldClockAddCityViewController* _picker = nullptr;
    int _frames = 0;
    bool _waiting = false;
    std::string _awaited;
    double _start = 0;
    double _shown = -1;
    unsigned _stamp = 1;
};

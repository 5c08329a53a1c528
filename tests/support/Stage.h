/**
 * @file
 * @brief A watch face to put screens on, and a person's hands.
 *
 * A window of 360 x 360 on the buffer engine, with a naviframe in it. Each gesture is made of real
 * input events and lets the frames pass that it takes.
 */
#pragma once

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include <Elementary.h>

#include <app_assist/WNaviframeController.h>
#include <app_assist/WWindowController.h>

#include "support/Picture.h"

namespace app_assist {
class WContentViewController;
}

/** A place on the face. */
struct Spot {
    int x = 0;
    int y = 0;
};

/** A rectangle on the face. */
struct Area {
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;
    Spot middle() const { return {x + width / 2, y + height / 2}; }
    /** True when every pixel of it lies on the round face. */
    bool insideCircle() const;
};

/** A text on the face. */
struct FoundText {
    std::string text;
    Evas_Object* object = nullptr; ///< What draws the text.
    Evas_Object* widget = nullptr; ///< The closest widget around it.
    Area area;
};

/** A row of a list. */
struct Row {
    Elm_Object_Item* item = nullptr;
    std::vector<std::string> texts; ///< As drawn, from the top; empty while the row is out of view.
    Area area;
    bool realized = false;
};

class Stage {
public:
    static constexpr int SIZE = 360;

    Stage();
    /** Takes the window down, with all that is in it. */
    ~Stage();
    Stage(const Stage&) = delete;
    Stage& operator=(const Stage&) = delete;

    app_assist::WWindowController& windowController() { return *_window; }
    app_assist::WNaviframeController& naviframe() { return *_naviframe; }
    Evas_Object* window() const;
    Evas* canvas() const;
    /** Pushes a page and waits until it stands. */
    void push(app_assist::WContentViewController* page);
    /** Takes the window down before the test ends. */
    void takeDown();

    // Time.

    static void frames(int count);
    static void advance(double seconds);
    /**
     * @brief Runs frames until nothing has been drawn for a while.
     * @param seconds At most this long.
     * @return False when it still moves.
     */
    bool settle(double seconds = 5);
    /** Number of frames that have drawn something. */
    int renderedFrames() const { return *_rendered; }

    // Fingers.

    void tap(int x, int y);
    void tap(const Spot& spot) { tap(spot.x, spot.y); }
    /** Taps the middle of an object; fails the test when it cannot be seen. */
    void tap(Evas_Object* object);
    /** Taps the middle of a part of a layout; fails the test when there is no such part. */
    void tapPart(Evas_Object* layout, const std::string& part);
    /** Taps a text as it reads on the face; fails the test when it is not there. */
    void tapText(const std::string& text);
    /** Scrolls a row into view and taps it. */
    void tapRow(Elm_Object_Item* item);
    void press(int x, int y);
    void moveTo(int x, int y);
    void release();
    /** Moves the finger by (dx, dy) within some time, holds still, and lets go. */
    void drag(int x, int y, int dx, int dy, int milliseconds = 300);
    /** Moves the finger fast and lets go while it moves. */
    void flick(int x, int y, int dx, int dy, int milliseconds = 50);
    /** Turns the wheel; positive = down. */
    void wheel(int x, int y, int steps);

    /** Turns the bezel by some detents; positive = clockwise. Waits until nothing moves. */
    void bezel(int steps);
    /** Presses the bezel's wheel. Waits until nothing moves. */
    void pressBezel();

    // Keys. Each reaches the toolkit's key handlers and the focused widget, as from a keyboard.

    void key(const std::string& name);
    void keyDown(const std::string& name);
    void keyUp(const std::string& name);
    /** A key, and the time until nothing moves. */
    void keySettled(const std::string& name);
    /** Types text; UTF-8. */
    void type(const std::string& text);
    void backKey() { key("XF86Back"); }

    // Looking.

    /** The texts that can be seen, from the top. */
    std::vector<FoundText> texts() const;
    /** The first text that reads so. */
    std::optional<FoundText> findText(const std::string& text) const;
    bool shows(const std::string& text) const { return findText(text).has_value(); }
    /** The visible widgets of a type ("Elm_Genlist", or its part such as "Genlist"). */
    std::vector<Evas_Object*> widgets(const std::string& type) const;
    static std::vector<Row> rows(Evas_Object* genlist);
    /** Scrolls a row to the middle of its list. */
    void showRow(Elm_Object_Item* item);
    static Area area(Evas_Object* object);
    /** False when it, or what it is clipped by, is hidden, or it lies outside the window. */
    bool canBeSeen(Evas_Object* object) const;

    // Pictures.

    /** Writes the face to CLOCK_TEST_OUTPUT_DIR/screens/<name>.png. @return The path. */
    std::string screenshot(const std::string& name);
    /**
     * @brief Compares the face with tests/screens/approved/<name>.png.
     *
     * Fails the test when it differs, and leaves <name>.png and <name>-difference.png. With
     * CLOCK_UPDATE_PICTURES=1 it writes the approved picture instead.
     * @param tolerance Greatest difference of a channel that counts as equal.
     * @param fraction Greatest part of the pixels that may differ.
     */
    void expectPicture(const std::string& name, int tolerance = PICTURE_TOLERANCE,
                       double fraction = PICTURE_FRACTION);
    /** Colour at a place as 0xAARRGGBB. */
    unsigned pixel(int x, int y);
    /** The colours of a rectangle, row by row. */
    std::vector<unsigned> pixels(int x, int y, int width, int height);

private:
    void feedMove(int x, int y);
    void sendKey(int type, const std::string& name, const std::string& text);

    std::unique_ptr<app_assist::WWindowController> _window;
    app_assist::WNaviframeController* _naviframe = nullptr;
    std::shared_ptr<int> _rendered = std::make_shared<int>(0);
    Spot _finger;
};

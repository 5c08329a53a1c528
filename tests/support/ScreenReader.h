/**
 * @file
 * @brief What a screen reader of the desktop is told.
 */
#pragma once

#include <string>
#include <vector>

#include <Elementary.h>

/** A widget or a row, as the toolkit shows it on the bus. */
struct ReadThing {
    Eo* object = nullptr;
    std::string role; ///< "push button"
    std::string name;
    bool checked = false;
    bool focused = false;
    bool disabled = false;
    bool pressable = false;

    /** "check box | Snooze | checked", and so on; without the focus. */
    std::string line() const;
};

/** A screen reader that is on as long as it lives. */
class ScreenReader {
public:
    ScreenReader();
    ~ScreenReader();
    ScreenReader(const ScreenReader&) = delete;
    ScreenReader& operator=(const ScreenReader&) = delete;

    /**
     * @brief What a person uses or has to know of a window, a popup, or another widget.
     *
     * Things that only hold others are left out, and so is what cannot be seen, apart from rows
     * that a list has further up or down.
     */
    static std::vector<ReadThing> things(Eo* root);
    /** The same, a line for each. */
    static std::vector<std::string> lines(Eo* root);
    /** What is announced in a window now. */
    static std::vector<std::string> announced(Eo* window);
    /** Presses the first thing of a role and a name. @return False when it cannot be pressed. */
    static bool press(Eo* root, const std::string& role, const std::string& name);
    /** Where the focus was said to have gone since the last call: "push button | Back". */
    std::vector<std::string> takeFocusTold();

private:
    static void stateChangedCb(void* data, const Efl_Event* event);

    void* _handler;
    std::vector<std::string> _focusTold;
};

/**
 * @file
 * @brief Keys and the bezel lead the focus over a window.
 */
#pragma once

#include <map>
#include <optional>

#include <Ecore.h>
#include <Eo.h>
#include <Evas.h>

#include "FocusRules.h"
#include "FocusView.h"

namespace host {

/**
 * @brief Lets every page and popup of a window be used with keys alone, or with the bezel alone.
 *
 * The bezel arrives as mouse wheel, a press of it as the middle button. What the back key would
 * close is what the focus stays in; each page and popup remembers where its focus was. The focus
 * is ringed from the first key or step until the next touch. There is one per window, and it goes
 * with the window.
 */
class FocusNavigator {
public:
    static void install(Evas_Object* window);
    /** Ends turning in the window of an object; false when nothing was being turned. */
    static bool stopTurning(const Evas_Object* object);
    /** Gives a row of the page that keys are for the focus, wherever the row is. */
    static void reach(Elm_Object_Item* row);
    /** Whether keys have reached a row; nothing while they do not lead. */
    static std::optional<bool> hasFocus(const Elm_Object_Item* row);

    FocusNavigator(const FocusNavigator&) = delete;
    FocusNavigator& operator=(const FocusNavigator&) = delete;
    ~FocusNavigator();

private:
    /** Where the focus was in a page or popup. */
    struct Memory {
        std::optional<FocusThing> thing;
        int index = -1; ///< Of its row, which may be made anew.
    };

    explicit FocusNavigator(Evas_Object* window);
    static FocusNavigator* of(const Evas* canvas);
    static FocusNavigator* ofKeys(Ecore_Window window);
    static Eina_Bool _keyDownCb(void* data, int type, void* info);
    static Eina_Bool _idleCb(void* data);
    static Eina_Bool _heldCb(void* data);
    static void _windowDeletedCb(void* data, Evas*, Evas_Object*, void*);
    static void _windowResizedCb(void* data, Evas*, Evas_Object* window, void*);
    static void _rootDeletedCb(void* data, const Efl_Event* event);
    static void _wheelCb(void* data, Evas*, Evas_Object*, void* info);
    static void _mouseDownCb(void* data, Evas*, Evas_Object*, void* info);
    static void _mouseUpCb(void* data, Evas*, Evas_Object*, void* info);
    static void _rowRealizedCb(void* data, Evas_Object* list, void* item);

    /** @return False when the toolkit may have the input. */
    bool handle(FocusInput input);
    bool act(const FocusView& view, const FocusResponse& response, FocusInput input);
    std::optional<FocusThing> destination(const FocusView& view, FocusAction move) const;
    std::optional<FocusThing> besideOrSame(const FocusView& view, int direction) const;
    void use(const FocusThing& thing, const FocusResponse& response);
    void turnInSight(const FocusThing& thing, int steps);
    /** Finds the page that the input is for, and where its focus was. */
    bool enterPage();
    std::optional<FocusThing> found(const FocusView& view) const;
    std::optional<FocusThing> remade(const FocusView& view) const;
    void focus(const std::optional<FocusThing>& thing, bool byKeyboard);
    void take(const FocusThing& thing, bool byKeyboard);
    void startTurning(bool turning);
    /** The bezel is pressed: a row waits whether it is held. @return False for all else. */
    bool startPress();
    /** The bezel is let go. @return True when a row was pressed and not held. */
    bool endPress();
    /** Whether the row that was pressed has the focus still. */
    bool isStillPressed();
    void touched(int x, int y);
    void lead(bool keys);
    void hideRings() const;
    void showReturned();

    Evas_Object* _window;
    Evas_Object* _catcher;
    Evas_Object* _root = nullptr; ///< The page or popup of the last input.
    std::map<Evas_Object*, Memory> _memories;
    Ecore_Idle_Enterer* _idle = nullptr; ///< While keys lead.
    Ecore_Timer* _press = nullptr;       ///< While the bezel is pressed on a row.
    FocusThing _pressed;                 ///< The row that it was pressed on last.
    bool _turning = false;
    bool _returns = false;    ///< The page has come, but does not yet show what has the focus.
    bool _endsTyping = false; ///< Return has just gone to a field.
};

} // namespace host

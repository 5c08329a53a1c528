/**
 * @file
 * @brief The window.
 */
#pragma once

#include <string>

#include <app_assist/WViewController.h>

namespace app_assist {

/**
 * @brief Owns a window and the controller that fills it.
 *
 * Unlike the others it is made by the application, which calls create(nullptr, nullptr) and deletes
 * it after the main loop. Deleting it takes everything in the window down, in order and at once.
 */
class APP_ASSIST_EXPORT WWindowController : public WViewController {
public:
    /** @param name Name of the window, for the window system. */
    WWindowController(std::string name, int width, int height);
    ~WWindowController() override;

    /**
     * @brief Creates a controller in the window, fills the window with it, and takes ownership.
     *
     * Replaces an earlier one.
     */
    void setBaseController(WViewController* controller);
    WViewController* getBaseController() const { return _base.get(); }

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void* param) override;

private:
    friend class WViewController;
    /** The controller of the window that shows a canvas; null when there is none. */
    static WWindowController* ofCanvas(const Evas* canvas);
    /** Ends what fills the window now. */
    void finishBase();

    std::string _name;
    int _width;
    int _height;
    WWeakPtr<WViewController> _base;
};

} // namespace app_assist

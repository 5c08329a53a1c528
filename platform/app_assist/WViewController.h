/**
 * @file
 * @brief Owner of one view.
 */
#pragma once

#include <functional>
#include <vector>

#include <Evas.h>

#include <app_assist/Export.h>
#include <app_assist/WWeakPtr.h>

namespace app_assist {

class WPopupController;
class WWindowController;

/**
 * @brief Owns one Evas object, its view, and its lifetime.
 *
 * Life: constructor, create(), onCreate(), onCreateView(), onCreated(), events, onDestroy(),
 * destructor. A controller is made with new and given to the framework (push, attachPopup,
 * setBaseController), which deletes it. Deletion is always deferred to the end of the main loop's
 * turn, so every function here may be called from inside an event of the object that dies. When
 * something else deletes the view, the controller is destroyed as well.
 */
class APP_ASSIST_EXPORT WViewController {
public:
    WViewController();
    WViewController(const WViewController&) = delete;
    WViewController& operator=(const WViewController&) = delete;

    /** @brief Name of the class, for log lines. */
    virtual const char* getClassName() const;

    /**
     * @brief Builds the view: runs onCreate(), onCreateView() and onCreated(). Once only.
     * @param parent Widget that the view belongs to.
     * @param param Handed through; may be null.
     * @return False, with a log line, when a step failed; the view is then null.
     */
    virtual bool create(Evas_Object* parent, void* param);

    /**
     * @brief Takes the controller down without asking it.
     *
     * Attached popups go at once; onDestroy(), the view's deletion and the destructor follow at the
     * end of the main loop's turn. A second call does nothing.
     */
    virtual void destroy();

protected:
    /** @brief First step of create(). @return False to give up. */
    virtual bool onCreate(void* param);
    /** @brief Makes the view. @return The view, owned by the framework from then on, or null. */
    virtual Evas_Object* onCreateView(Evas_Object* parent, void* param);
    /** @brief The view stands. */
    virtual void onCreated();
    /** @brief The end has come; the view is still there unless something else deleted it. */
    virtual void onDestroy();

public:
    virtual ~WViewController();

    /** @brief The view; null before create() and once the view is gone. */
    Evas_Object* getEvasObj() const { return _view; }

    /** @brief A pointer that expires with this controller. */
    WWeakPtr<WViewController> getWeakPtr();

    /**
     * @brief Shows a popup over this controller and takes ownership of it.
     *
     * The popup goes with this controller. A null popup, or one that is attached already, is
     * refused with a log line; a popup whose creation fails is deleted.
     */
    void attachPopup(WPopupController* popup);

    /** @brief The controller of the window this view is in; null without a window. */
    WWindowController* getWindowController() const;

    /** @brief True from destroy(), or the loss of the view, on. */
    bool isDying() const { return _dying; }

protected:
    /** @brief Destroys the attached popups. */
    void destroyPopups();

private:
    friend class WDeferredDeletion;
    friend class WContentViewController;
    friend class WNaviframeController;
    friend class WWindowController;
    static void _viewDeletedCb(void* data, Evas* evas, Evas_Object* view, void* info);
    /** Takes over what onCreateView() made. @return False when there is no view to go on with. */
    bool adoptView(Evas_Object* view);
    /** Defers the end of this controller; once. */
    void scheduleEnd();
    /** Runs onDestroy(), deletes the view and, unless the application owns it, this object. */
    void finish();
    void deleteView();
    /** Ends the attached popups now. */
    void finishPopups();

    WLifeToken _life;
    Evas_Object* _view = nullptr;
    std::vector<WWeakPtr<WViewController>> _popups;
    /** Takes the view out of its container, between onDestroy() and the view's deletion. */
    std::function<void()> _detach;
    bool _created = false;
    bool _stands = false;
    bool _dying = false;
    bool _attached = false;
    bool _ownedByApplication = false;
};

} // namespace app_assist

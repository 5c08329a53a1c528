/**
 * @file
 * @brief A page of a naviframe.
 */
#pragma once

#include <Elementary.h>

#include <app_assist/WViewController.h>

namespace app_assist {

class WNaviframeController;

/**
 * @brief A view shown as a naviframe page.
 *
 * After create(), WNaviframeController::push() runs onSetContainerProperties(),
 * onPushToNaviframe(), onSetAsPageContent(), onPushed() and onBecomeTop(). Every way out but
 * destroy() asks onPop() first: popOut(), the back key, and the toolkit's own pop.
 */
class APP_ASSIST_EXPORT WContentViewController : public WViewController {
public:
    WContentViewController();
    ~WContentViewController() override;

    /** @brief Leaves the naviframe without asking onPop(). */
    void destroy() override;

    /**
     * @brief The page is about to be pushed.
     * @param naviItem Null: onPushToNaviframe() makes the item.
     */
    virtual void onSetContainerProperties(WNaviframeController* naviframeController,
                                          Elm_Object_Item* naviItem);
    /** @brief Pushes the view. @return The page's item, or null when that failed. */
    virtual Elm_Object_Item* onPushToNaviframe(Evas_Object* naviframe);
    /** @brief The page is on the naviframe. */
    virtual void onPushed(Elm_Object_Item* naviItem);
    /** @brief The page is to be left. @return True lets it go. */
    virtual bool onPop();
    /** @brief The page has become the one on top, also when the page above it has gone. */
    virtual void onBecomeTop();
    /** @brief The view has become the page's content. */
    virtual void onSetAsPageContent(Evas_Object* object);
    /**
     * @brief Gives the page a button for more actions, in the item part "more_btn".
     * @param object The button.
     * @param callback Runs on its "clicked".
     */
    virtual void onSetMoreButton(Evas_Object* object, Evas_Smart_Cb callback, void* data);

    /** @brief The page's item; null while it is not on a naviframe. */
    Elm_Object_Item* getNaviItem() const { return _naviItem; }
    /** @brief The naviframe's controller; null while the page is not on one. */
    WNaviframeController* getNaviframeController() const;

    /**
     * @brief Leaves the page if onPop() agrees.
     *
     * Does nothing when the page is not on a naviframe, or is already leaving.
     */
    void popOut();

private:
    friend class WNaviframeController;
    static Eina_Bool _itemPopCb(void* data, Elm_Object_Item* item);
    static void _itemDeletedCb(void* data, Evas_Object* naviframe, void* info);
    /** Asks onPop() once per attempt. @return True when the page goes. */
    bool askToLeave();
    /** Keeps the item and listens to it. */
    void adoptItem(WNaviframeController* naviframeController, Elm_Object_Item* item);
    /** Takes the item off the naviframe without asking. */
    void leave();
    /** Deletes what the page has put into its item, but for the view. */
    void deleteItemContents();

    WWeakPtr<WViewController> _naviframeController;
    Elm_Object_Item* _naviItem = nullptr;
    bool _leaving = false;
    bool _asking = false;
    /** The item slides out. */
    bool _popping = false;
    bool _heardFromToolkit = false;
};

} // namespace app_assist

/**
 * @file
 * @brief A stack of pages.
 */
#pragma once

#include <functional>
#include <vector>

#include <app_assist/WViewController.h>

namespace app_assist {

class WContentViewController;

/** @brief Owns an elm_naviframe and the pages on it; leads the back key to the page on top. */
class APP_ASSIST_EXPORT WNaviframeController : public WViewController {
public:
    WNaviframeController();
    ~WNaviframeController() override;

    /**
     * @brief Creates a page if need be, shows it on top and takes ownership of it.
     *
     * A null page, or one that is on a naviframe already, is refused with a log line. A page whose
     * creation or push fails is deleted.
     */
    void push(WContentViewController* page);

    /** @brief The page on top; null when there is none. */
    WContentViewController* getTop() const;

    /** @brief Sets what happens once the last page has gone. Replaces the earlier function. */
    void setOnEmpty(const std::function<void()>& onEmpty);

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void* param) override;
    void onDestroy() override;

private:
    friend class WContentViewController;
    static void _backKeyCb(void* data, Evas_Object* naviframe, void* info);
    /** Creates the page if need be and puts it on the stack. @return False when a step failed. */
    bool show(WContentViewController* page);
    /** Called by a page that goes for good. */
    void pageGone(const WContentViewController* page);
    /** Tells the page on top that it is there, unless it knows. */
    void announceTop();

    std::vector<WWeakPtr<WViewController>> _pages;
    WWeakPtr<WViewController> _announced;
    std::function<void()> _onEmpty;
};

} // namespace app_assist

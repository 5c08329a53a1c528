/**
 * @file
 * @brief What the clock application's pages have in common.
 */
#pragma once

#include <memory>
#include <string>

#include <Ecore.h>

#include "app_assist/WContentViewController.h"
#include "app_assist/WGenlistItem.h"
#include "clock/ClockEventListener.h"

namespace simulator {

/** Message identifiers of a page's texts. */
struct ListPageTexts {
    const char* title;
    const char* other; ///< Name of the page that the title's button leads to.
    const char* add;   ///< On the button at the lower end.
    const char* empty; ///< In place of a list without rows.
};

/** @brief A list with a button that adds to it, and one in its title that leads to another page. */
class ListPage : public app_assist::WContentViewController, public ClockEventListener {
public:
    /** @param theme Path of the simulator's theme. */
    ListPage(std::string theme, const ListPageTexts& texts);
    ~ListPage() override;

    void onPushed(Elm_Object_Item* naviItem) override;
    void onBecomeTop() override;
    void onEvent(EventType type) override;

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void* param) override;
    void onDestroy() override;

    const std::string& theme() const { return _theme; }
    /** Whether a person can use this page: a second tap while a page slides in does nothing. */
    bool isOnTop() const;
    /** Refreshes at the end of the main loop's turn: the list may be in the middle of an event. */
    void scheduleRefresh();
    /** Draws the rows that can be seen again. */
    void updateRows();
    /** Puts a row at the end of the list, which takes ownership. */
    Elm_Object_Item* append(app_assist::WGenlistItem* row);

    /** Appends the rows as they are stored now. @return The row to show, or null for the top. */
    virtual Elm_Object_Item* appendRows() = 0;
    virtual void onAddTapped() = 0;
    virtual void onOtherTapped() = 0;

private:
    struct JobDeleter {
        void operator()(Ecore_Job* job) const { ecore_job_del(job); }
    };
    static void _addClickedCb(void* data, Evas_Object* button, void* info);
    static void _otherClickedCb(void* data, Evas_Object* button, void* info);
    static void _refreshCb(void* data);
    static Evas_Object* createList(Evas_Object* parent);
    void setTexts();
    /** Puts a new list into the page. */
    void fill(Evas_Object* layout);
    void appendPadding(const char* style);

    std::string _theme;
    ListPageTexts _texts;
    Evas_Object* _list = nullptr;
    Evas_Object* _add = nullptr;
    Evas_Object* _other = nullptr;
    int _rows = 0;
    bool _wasTop = false;
    std::unique_ptr<Ecore_Job, JobDeleter> _refreshJob;
};

} // namespace simulator

/**
 * @file
 * @brief What the clock application's pages have in common.
 */
#pragma once

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include <Ecore.h>

#include "ListRow.h"
#include "app_assist/WContentViewController.h"
#include "app_assist/WViewController.h"
#include "app_assist/WWeakPtr.h"
#include "clock/ClockEventListener.h"

namespace simulator {

/** Message identifiers of a page's texts. */
struct ListPageTexts {
    const char* title;
    const char* other; ///< Name of the page that the title's button leads to.
    const char* add;   ///< On the button at the lower end.
    const char* empty; ///< In place of a list without rows.
};

/** @brief What is written when something is to leave a list. */
struct RemovalQuestion {
    std::function<std::string()> title; ///< What it is, in a few letters; asked in each language.
    std::string name;   ///< What a person has called it, which may be long; empty for nothing.
    const char* textId; ///< Message identifier of the sentence below.
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
    /** Asks whether something is to leave the list. */
    void askToRemove(RemovalQuestion question, std::function<void()> remove);
    /** Of the keys of all rows the one below another, or above it when it is the last. */
    static std::optional<int> neighbourOf(const std::vector<int>& keys, int key);
    /** Draws the rows that can be seen again. */
    void updateRows();
    /** Puts a row at the end of the list, which takes ownership. */
    Elm_Object_Item* append(ListRow* row);

    /** Appends the rows as they are stored now. @return The row to show, or null for the top. */
    virtual Elm_Object_Item* appendRows() = 0;
    /** Draws what is stored now on the rows that are there. @return False when that needs others.
     */
    virtual bool renewRows() { return false; }
    /** The clock shows another minute; only while the page is shown. */
    virtual void onMinute() { updateRows(); }
    virtual void onAddTapped() = 0;
    virtual void onOtherTapped() = 0;

private:
    struct JobDeleter {
        void operator()(Ecore_Job* job) const { ecore_job_del(job); }
    };
    struct TimerDeleter {
        void operator()(Ecore_Timer* timer) const { ecore_timer_del(timer); }
    };
    static void _addClickedCb(void* data, Evas_Object* button, void* info);
    static void _otherClickedCb(void* data, Evas_Object* button, void* info);
    static void _refreshCb(void* data);
    static void _rowHeldCb(void* data, Evas_Object* list, void* item);
    template <bool dragged>
    static void _dragCb(void* data, Evas_Object* list, void* info);
    static Eina_Bool _minuteCb(void* data);
    Evas_Object* createList(Evas_Object* parent);
    void waitForNextMinute();
    void setTexts();
    /** Puts a new list into the page. */
    void fill(Evas_Object* layout);
    void appendPadding(const char* style);
    /** Writes the question in the language of now. */
    void writeQuestion(Evas_Object* popup) const;

    std::string _theme;
    ListPageTexts _texts;
    Evas_Object* _list = nullptr;
    Evas_Object* _add = nullptr;
    Evas_Object* _other = nullptr;
    int _rows = 0;
    bool _wasTop = false;
    bool _dragged = false; ///< The list is under a finger that moves.
    app_assist::WWeakPtr<app_assist::WViewController> _questionPopup;
    RemovalQuestion _question = {};
    std::unique_ptr<Ecore_Job, JobDeleter> _refreshJob;
    std::unique_ptr<Ecore_Timer, TimerDeleter> _minuteTimer; ///< While a person sees the page.
};

} // namespace simulator

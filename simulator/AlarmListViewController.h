/**
 * @file
 * @brief The clock application's first page.
 */
#pragma once

#include <memory>
#include <string>
#include <vector>

#include <Ecore.h>

#include "app_assist/WContentViewController.h"
#include "clock/ClockAlarmDbData.h"
#include "clock/ClockEventListener.h"

namespace simulator {

/** @brief The list of stored alarms, with a button that creates one. */
class AlarmListViewController : public app_assist::WContentViewController,
                                public ClockEventListener {
public:
    /** @param theme Path of the simulator's theme. */
    explicit AlarmListViewController(std::string theme);
    ~AlarmListViewController() override;

    const char* getClassName() const override;
    void onPushed(Elm_Object_Item* naviItem) override;
    void onBecomeTop() override;
    void onEvent(EventType type) override;

    /** @brief Opens the editor for a new alarm; only while this page is on top. */
    void createAlarm();
    /** @brief Opens the editor on a stored alarm; only while this page is on top. */
    void editAlarm(int id);

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void* param) override;
    void onDestroy() override;

private:
    struct JobDeleter {
        void operator()(Ecore_Job* job) const { ecore_job_del(job); }
    };
    static void _createClickedCb(void* data, Evas_Object* button, void* info);
    static void _refreshCb(void* data);
    static Evas_Object* createList(Evas_Object* parent);
    Evas_Object* createButton(Evas_Object* parent);
    void openEditor(const ClockAlarmDbData& alarm, bool isCreate);
    void setTexts();
    /** Refreshes at the end of the main loop's turn: the list may be in the middle of an event. */
    void scheduleRefresh();
    /** Puts a list of the stored alarms into the page. */
    void fill(Evas_Object* layout);
    void appendPadding(const char* style);
    Elm_Object_Item* appendAlarm(const ClockAlarmDbData& alarm, bool twelveHour);

    std::string _theme;
    Evas_Object* _list = nullptr;
    Evas_Object* _button = nullptr;
    std::vector<ClockAlarmDbData> _alarms;
    int _editedId = -1; ///< The alarm that the editor was last opened on.
    bool _wasTop = false;
    std::unique_ptr<Ecore_Job, JobDeleter> _refreshJob;
};

} // namespace simulator

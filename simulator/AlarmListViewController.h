/**
 * @file
 * @brief The clock application's first page.
 */
#pragma once

#include <string>
#include <vector>

#include "AlarmListItem.h"
#include "ListPage.h"
#include "clock/ClockAlarmDbData.h"

namespace simulator {

/**
 * @brief The list of stored alarms, with a button that creates one.
 *
 * Each is switched on and off in its row. Their order follows the next ring when the page comes
 * into view, and stays while it is looked at: no row moves away under a finger.
 */
class AlarmListViewController : public ListPage {
public:
    /** @param theme Path of the simulator's theme. */
    explicit AlarmListViewController(std::string theme);
    ~AlarmListViewController() override;

    const char* getClassName() const override;
    void onEvent(EventType type) override;

    /** @brief Opens the editor for a new alarm; only while this page is on top. */
    void createAlarm();
    /** @brief Opens the editor on a stored alarm; only while this page is on top. */
    void editAlarm(int id);
    /** @brief Opens the world clock; only while this page is on top. */
    void openWorldClock();

protected:
    Elm_Object_Item* appendRows() override;
    bool renewRows() override;
    void onMinute() override { drawRows(); }
    void onAddTapped() override { createAlarm(); }
    void onOtherTapped() override { openWorldClock(); }

private:
    void openEditor(const ClockAlarmDbData& alarm, bool isCreate);
    void pushPage(app_assist::WContentViewController* page);
    void switchAlarm(int id, bool on);
    /** Asks whether an alarm is to be removed. */
    void askToRemove(int id);
    void removeAlarm(int id);
    const ClockAlarmDbData* find(int id) const;
    std::vector<int> ids() const;
    /** The alarms as they are stored, in the order in which they are shown. */
    std::vector<ClockAlarmDbData> readAlarms() const;
    std::vector<AlarmRowLook> looks() const;
    void drawRows();

    static constexpr int NONE = -1; ///< No alarm's id.
    std::vector<ClockAlarmDbData> _alarms;
    std::vector<AlarmListItem*> _rows; ///< Of the alarms; they belong to the list.
    int _shownId = NONE;               ///< The alarm that a new list brings into view.
    bool _needsOrder = true;           ///< The order may change: nobody is looking.
    bool _needsRows = false;           ///< The rows that are there are not good any more.
};

} // namespace simulator

/**
 * @file
 * @brief The clock application's first page.
 */
#pragma once

#include <string>
#include <vector>

#include "ListPage.h"
#include "clock/ClockAlarmDbData.h"

namespace simulator {

/** @brief The list of stored alarms, with a button that creates one. */
class AlarmListViewController : public ListPage {
public:
    /** @param theme Path of the simulator's theme. */
    explicit AlarmListViewController(std::string theme);
    ~AlarmListViewController() override;

    const char* getClassName() const override;

    /** @brief Opens the editor for a new alarm; only while this page is on top. */
    void createAlarm();
    /** @brief Opens the editor on a stored alarm; only while this page is on top. */
    void editAlarm(int id);
    /** @brief Opens the world clock; only while this page is on top. */
    void openWorldClock();

protected:
    Elm_Object_Item* appendRows() override;
    void onAddTapped() override { createAlarm(); }
    void onOtherTapped() override { openWorldClock(); }

private:
    void openEditor(const ClockAlarmDbData& alarm, bool isCreate);

    std::vector<ClockAlarmDbData> _alarms;
    int _editedId = -1; ///< The alarm that the editor was last opened on.
};

} // namespace simulator

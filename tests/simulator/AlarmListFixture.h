/**
 * @file
 * @brief The simulator's list of alarms, with alarms in it.
 */
#pragma once

#include <algorithm>
#include <string>
#include <vector>

#include <Elementary.h>

#include "AlarmListViewController.h"
#include "PageFixture.h"
#include "base/SqliteDatabase.h"
#include "clock/ClockAlarmDbModel.h"
#include "clock/ClockAlarmManagerModel.h"
#include "clock/ClockEventListener.h"
#include "support/StoredData.h"

/** @brief It is Wednesday, 18 November 2026, 09:41 in Berlin. */
class AlarmListFixture : public PageFixture {
protected:
    static constexpr int WEDNESDAY = 8;

    void openPage() {
        page = new simulator::AlarmListViewController(theme());
        stage().push(page);
    }
    /** Stores an alarm with its schedule; on weekdays, or else the next time it comes. */
    static ClockAlarmDbData add(int hour, int minute, bool on, int weekdays = 0,
                                const std::string& name = "") {
        ClockAlarmDbData alarm = alarmAt(hour, minute, weekdays);
        alarm.name = name;
        alarm.enable = on ? 1 : 0;
        return add(alarm);
    }
    static ClockAlarmDbData add(ClockAlarmDbData alarm) {
        EXPECT_TRUE(ClockAlarmManagerModel::registerAlarmToServer(alarm));
        EXPECT_TRUE(ClockAlarmDbModel().insertAlarmData(alarm));
        return alarm;
    }
    static std::vector<ClockAlarmDbData> alarms() {
        std::vector<ClockAlarmDbData> alarms;
        EXPECT_TRUE(ClockAlarmDbModel().getAllAlarmList(alarms));
        return alarms;
    }
    static ClockAlarmDbData stored(const ClockAlarmDbData& alarm) {
        for (const ClockAlarmDbData& one : alarms())
            if (one.id == alarm.id)
                return one;
        ADD_FAILURE() << "alarm " << alarm.id << " is not stored";
        return {};
    }
    /** Whether its schedule is to ring. */
    bool rings(const ClockAlarmDbData& alarm) {
        return device().schedules().at(stored(alarm).alarmMgrId).enabled == 1;
    }
    /** Changes the stored alarms behind everybody's back. */
    void edit(const std::string& sql) {
        base::SqliteDatabase database(device().dataPath() + "clock.db");
        ASSERT_TRUE(database.open("test", {}));
        ASSERT_TRUE(database.execute(sql)) << database.lastError();
    }

    /** The switch on the line of a time. */
    Evas_Object* switchOf(const std::string& time) {
        const auto text = stage().findText(time);
        for (Evas_Object* check : stage().widgets("Elm_Check")) {
            const Area area = Stage::area(check);
            if (text && area.y <= text->area.middle().y &&
                text->area.middle().y < area.y + area.height)
                return check;
        }
        ADD_FAILURE() << "no switch beside " << time << " in " << readFace();
        return nullptr;
    }
    bool isOn(const std::string& time) { return elm_check_state_get(switchOf(time)) != EINA_FALSE; }
    void flip(const std::string& time) {
        stage().tap(switchOf(time));
        stage().settle();
    }
    void hold(const Spot& spot) {
        stage().press(spot.x, spot.y);
        Stage::advance(0.8);
        stage().release();
        stage().settle();
    }
    Spot placeOf(const std::string& text) {
        const auto found = stage().findText(text);
        EXPECT_TRUE(found) << text << " is not in " << readFace();
        return found ? found->area.middle() : Spot();
    }
    void tapText(const std::string& text) {
        stage().tapText(text);
        stage().settle();
    }
    unsigned pages() {
        Eina_List* const list = elm_naviframe_items_get(stage().naviframe().getEvasObj());
        const unsigned count = eina_list_count(list);
        eina_list_free(list);
        return count;
    }
    /** All that can be read on the face, one line each. */
    std::string readFace() {
        std::string all;
        for (const FoundText& found : stage().texts())
            all += found.text + "\n";
        return all;
    }
    /** The times of the rows, from the top of the list, also of those out of view. */
    std::vector<std::string> times() {
        Evas_Object* const list = stage().widgets("Elm_Genlist").front();
        std::vector<std::string> times;
        for (Elm_Object_Item* item = elm_genlist_first_item_get(list); item != nullptr;
             item = elm_genlist_item_next_get(item)) {
            void* const row = elm_object_item_data_get(item);
            if (row == nullptr)
                continue;
            char* const text =
                elm_genlist_item_item_class_get(item)->func.text_get(row, list, "row.time");
            times.emplace_back(text == nullptr ? "" : text);
            free(text);
        }
        return times;
    }

    simulator::AlarmListViewController* page = nullptr;
};

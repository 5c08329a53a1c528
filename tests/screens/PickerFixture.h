/**
 * @file
 * @brief A time picker on the watch face, where the alarm editor has it.
 */
#pragma once

#include <ctime>
#include <string>
#include <vector>

#include <device/uxt.h>

#include "support/ScreenTest.h"

class PickerFixture : public ScreenTest {
protected:
    /** Middles of the wheels and the distance of two values. */
    static constexpr int MIDDLE = 160;
    static constexpr int STEP = 54;
    static constexpr int HOUR_24 = 122;
    static constexpr int MINUTE_24 = 238;
    static constexpr int HOUR_12 = 88;
    static constexpr int MINUTE_12 = 197;
    static constexpr int HALF_12 = 281;

    void TearDown() override;

    /** Adds a picker to the window, or to a parent that places it. */
    Evas_Object* addPicker(const char* style, int hour, int minute, Evas_Object* parent = nullptr);
    void show(int hour, int minute);
    /** The picker's time as "07:30". */
    std::string time() const;
    /** The times at each "changed" since the last call. */
    std::vector<std::string> takeChanges();
    Evas_Object* wheel(const std::string& part) const;

    Evas_Object* picker = nullptr;

private:
    static void changedCb(void* data, Evas_Object* object, void* info);
    std::vector<std::string> _changes;
};

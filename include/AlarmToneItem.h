/**
 * @file
 * @brief The alarm editor's row for the ring tone.
 */
#pragma once

#include <functional>

#include <app_assist/WGenlistItem.h>
#include <clock/ClockAlarmDbData.h>

#include "ClockUiExport.h"

/** @brief A row that names the alarm's tone; tapping it opens the tone picker. */
class CLOCK_UI_EXPORT AlarmToneItem : public app_assist::WGenlistItem {
public:
    /** @param alarm The editor's working record; must outlive the row. */
    explicit AlarmToneItem(ClockAlarmDbData& alarm);
    ~AlarmToneItem() override;

    Elm_Genlist_Item_Class* getItemClassNew() override;
    void onSelect(Elm_Object_Item* item) override;

    /** @brief Sets what a tap does. Replaces the earlier function. */
    void setSelectedCb(const std::function<void()>& selected);

    /**
     * @brief Writes the name under which a tone is shown: its title, else its file name without
     * extension.
     * @param path The tone file; null is an error.
     * @param[out] name Gets the name, UTF-8, cut to fit; untouched when files cannot be
     * asked at all.
     * @param size Room at name in bytes, with the terminator.
     */
    void _getToneName(char* path, char* name, int size);

private:
    static char* _getToneItemText(void* data, Evas_Object* genlist, const char* part);

    char* toneText();

    ClockAlarmDbData& _alarm;
    std::function<void()> _selected;
};

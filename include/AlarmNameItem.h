/**
 * @file
 * @brief The editor's row with the alarm's name.
 */
#pragma once

#include <functional>
#include <optional>
#include <string>

#include <app_assist/WGenlistItem.h>
#include <clock/ClockAlarmDbData.h>

#include "ClockUiExport.h"
#include "LiveWidgets.h"

/**
 * @brief A one-line field for a name of at most 20 characters.
 *
 * The record keeps its name until the editor saves. What was typed outlives the field, which the
 * list takes away when the row scrolls out of view and makes anew when it updates the row.
 */
class CLOCK_UI_EXPORT AlarmNameItem : public app_assist::WGenlistItem {
public:
    /** @param alarm The editor's working record; outlives the row. */
    explicit AlarmNameItem(ClockAlarmDbData& alarm);
    ~AlarmNameItem() override;

    /** @brief A new item class of the style "entry.main". */
    Elm_Genlist_Item_Class* getItemClassNew() override;
    /** @brief Runs the function of setSelectedCb(), if there is one. */
    void onSelect(Elm_Object_Item* item) override;
    /** @brief Sets what the row does when it is selected. Replaces the earlier function. */
    void setSelectedCb(const std::function<void()>& selected);

    /** @brief The field; null while the row has none. */
    Evas_Object* getNameEntryObj() const { return _entries.newest(); }
    /** @brief The text of the field, or, while there is none, what it would show. UTF-8. */
    std::string getTypedName() const;

    /** @name Toolkit callbacks; data is the row.
     *  @{ */
    static char* _getNameItemText(void* data, Evas_Object* genlist, const char* part);
    static Evas_Object* _getNameItemIcon(void* data, Evas_Object* genlist, const char* part);
    /** @param old The field that the list took away when it put the row aside; may be null. */
    static Evas_Object* _keepNameItemIcon(void* data, Evas_Object* genlist, const char* part,
                                          Evas_Object* old);
    static void _alarmNameFocusedCb(void* data, Evas_Object* entry, void* info);
    static void _alarmNameActivatedCb(void* data, Evas_Object* entry, void* info);
    static void _alarmNameChangedCb(void* data, Evas_Object* entry, void* info);
    static void _alarmNamePreeditChangedCb(void* data, Evas_Object* entry, void* info);
    static void _alarmNameMaxLengthCb(void* data, Evas_Object* entry, void* info);
    static void _entryLangChangedCb(void* data, Evas_Object* entry, void* info);
    /** @} */

private:
    static void _entryDeletedCb(void* data, Evas* evas, Evas_Object* entry, void* info);
    Evas_Object* createEntry(Evas_Object* genlist);

    std::function<void()> _selected;
    ClockAlarmDbData& _alarm;
    LiveWidgets _entries;
    /** What the field held when the list took it away. */
    std::optional<std::string> _typedName;
};

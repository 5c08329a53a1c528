/**
 * @file
 * @brief Rows of the city picker.
 */
#pragma once

#include <app_assist/WGenlistItem.h>

#include "ClockUiExport.h"

/**
 * @brief Hands out the item class of all rows of the city list.
 *
 * A row's data is its ClockWorldClockDbData, not an object of this class.
 */
class CLOCK_UI_EXPORT WorldClockAddCityItem : public app_assist::WGenlistItem {
public:
    WorldClockAddCityItem();
    ~WorldClockAddCityItem() override;

    Elm_Genlist_Item_Class* getItemClassNew() override;

    /**
     * @brief Colours the first place where a keyword stands in a text.
     * @param text UTF-8.
     * @param keyword UTF-8; upper and lower case of ASCII letters are the same.
     * @return Markup of at most 511 bytes, to be freed with free(); null without a text.
     */
    static char* _addTextHighLight(const char* text, const char* keyword);

private:
    static char* _getText(void* data, Evas_Object* genlist, const char* part);
};

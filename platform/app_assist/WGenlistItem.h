/**
 * @file
 * @brief One row of a list.
 */
#pragma once

#include <Elementary.h>

#include <app_assist/Export.h>

namespace app_assist {

/**
 * @brief One genlist row.
 *
 * Made with new; the genlist owns it from the moment it is appended and destroys it through its
 * item class's delete callback (deleteCb()).
 */
class APP_ASSIST_EXPORT WGenlistItem {
public:
    WGenlistItem() = default;
    WGenlistItem(const WGenlistItem&) = delete;
    WGenlistItem& operator=(const WGenlistItem&) = delete;

    virtual ~WGenlistItem();
    /** @brief An item class that is made once and kept; null when the row has none. */
    virtual Elm_Genlist_Item_Class* getItemClassStatic();
    /** @brief A new item class; the caller frees it with elm_genlist_item_class_free(). */
    virtual Elm_Genlist_Item_Class* getItemClassNew();
    /** @brief The row was selected. */
    virtual void onSelect(Elm_Object_Item* item);
    /** @brief The row has learned its genlist item. */
    virtual void onSetElmObjectItem(Elm_Object_Item* item);

    /**
     * @brief The smart callback to pass when appending, with the row as its data.
     *
     * It unselects the item, so that every tap counts, and runs onSelect(). A null row logs
     * "Data is NULL !!" at error priority.
     */
    static Evas_Smart_Cb getSelectCb();

    /** @brief Records the row's item, then runs onSetElmObjectItem(). */
    void setElmObjectItem(Elm_Object_Item* item);
    /** @brief The row's item; null before it was appended. */
    Elm_Object_Item* getElmObjectItem() const { return _item; }

    /** @brief The delete callback for item classes: deletes the row. A null row is ignored. */
    static void deleteCb(void* data, Evas_Object* genlist);

private:
    Elm_Object_Item* _item = nullptr;
};

} // namespace app_assist

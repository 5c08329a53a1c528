// An item class of a list that its maker gives back.
#pragma once

#include <memory>

#include <Elementary.h>

struct ItemClassFree {
    // Rows that were appended keep it alive.
    void operator()(Elm_Genlist_Item_Class* itemClass) const {
        elm_genlist_item_class_free(itemClass);
    }
};
using ItemClass = std::unique_ptr<Elm_Genlist_Item_Class, ItemClassFree>;

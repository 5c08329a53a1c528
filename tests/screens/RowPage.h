/**
 * @file
 * @brief A page with one row, for tests of the row alone.
 */
#pragma once

#include <Elementary.h>

#include <app_assist/WContentViewController.h>
#include <app_assist/WGenlistItem.h>
#include <device/app_resource_manager.h>

/** Shows a row in a list of its own, which owns it. */
class RowPage : public app_assist::WContentViewController {
public:
    explicit RowPage(app_assist::WGenlistItem* row) : _row(row) { app_resource_manager_init(); }
    ~RowPage() override { app_resource_manager_release(); }
    Evas_Object* genlist() const { return getEvasObj(); }
    Elm_Object_Item* item() const { return _row->getElmObjectItem(); }

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void*) override {
        elm_theme_extension_add(nullptr, CLOCK_RESOURCE_DIR "/edje/AlarmCustomTheme.edj");
        Evas_Object* genlist = elm_genlist_add(parent);
        elm_genlist_mode_set(genlist, ELM_LIST_COMPRESS);
        Elm_Genlist_Item_Class* itemClass = _row->getItemClassNew();
        _row->setElmObjectItem(
            elm_genlist_item_append(genlist, itemClass, _row, nullptr, ELM_GENLIST_ITEM_NONE,
                                    app_assist::WGenlistItem::getSelectCb(), _row));
        elm_genlist_item_class_free(itemClass);
        return genlist;
    }

private:
    app_assist::WGenlistItem* _row;
};

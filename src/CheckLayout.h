// Checks and radios inside list rows.
#pragma once

#include <Elementary.h>

// The layout that holds a check or a radio in the row part "elm.icon.2".
inline Evas_Object* createIconLayout(Evas_Object* genlist) {
    Evas_Object* layout = elm_layout_add(genlist);
    elm_layout_theme_set(layout, "layout", "list/C/type.2", "default");
    evas_object_size_hint_weight_set(layout, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    return layout;
}

// Puts a check or radio into its layout and lets the touch through to the row.
inline void setIcon(Evas_Object* layout, Evas_Object* icon) {
    elm_object_signal_emit(icon, "elm,event,pass,enabled", "elm");
    elm_object_part_content_set(layout, "elm.swallow.content", icon);
}

// Turns a check with its animation; "changed" is not raised.
inline void turnCheck(Evas_Object* check, bool on) {
    elm_object_signal_emit(check, on ? "elm,activate,check,on" : "elm,activate,check,off", "elm");
    elm_check_state_set(check, on ? EINA_TRUE : EINA_FALSE);
}

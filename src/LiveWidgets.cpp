#include "LiveWidgets.h"

#include <algorithm>

LiveWidgets::~LiveWidgets() {
    for (Evas_Object* widget : _widgets)
        evas_object_event_callback_del_full(widget, EVAS_CALLBACK_DEL, _deletedCb, this);
}

void LiveWidgets::add(Evas_Object* widget) {
    if (!widget)
        return;
    evas_object_event_callback_add(widget, EVAS_CALLBACK_DEL, _deletedCb, this);
    _widgets.push_back(widget);
    _outdated = false;
}

Evas_Object* LiveWidgets::reusable(Evas_Object* widget) const {
    return widget == newest() && !_outdated ? widget : nullptr;
}

void LiveWidgets::_deletedCb(void* data, Evas*, Evas_Object* widget, void*) {
    auto& widgets = static_cast<LiveWidgets*>(data)->_widgets;
    widgets.erase(std::remove(widgets.begin(), widgets.end(), widget), widgets.end());
}

#include "ZoneField.h"

#include <utility>

#include <Elementary.h>

#include "ControlWidgets.h"
#include "ZoneNames.h"

namespace simulator::control {
namespace {

constexpr std::size_t MOST_NAMES = 5;
constexpr short LAYER = 10;

} // namespace

ZoneField::ZoneField(Evas_Object* row, std::function<void(const std::string&)> chosen)
    : _field(addField(row, "Europe/Berlin", "Time zone")), _chosen(std::move(chosen)) {
    evas_object_smart_callback_add(_field, "changed,user", _typedCb, this);
    evas_object_smart_callback_add(_field, "activated", _activatedCb, this);
    evas_object_smart_callback_add(_field, "unfocused", _unfocusedCb, this);
}

ZoneField::~ZoneField() {
    closeList();
    evas_object_smart_callback_del_full(_field, "changed,user", _typedCb, this);
    evas_object_smart_callback_del_full(_field, "activated", _activatedCb, this);
    evas_object_smart_callback_del_full(_field, "unfocused", _unfocusedCb, this);
}

void ZoneField::show(const std::string& zone) {
    showText(_field, zone);
}

void ZoneField::_typedCb(void* data, Evas_Object*, void*) {
    static_cast<ZoneField*>(data)->suggest();
}

void ZoneField::_activatedCb(void* data, Evas_Object* field, void*) {
    const std::string typed = textOf(field);
    const auto fitting = zonesMatching(typed, 1);
    static_cast<ZoneField*>(data)->choose(fitting.empty() ? typed : fitting.front());
}

void ZoneField::_unfocusedCb(void* data, Evas_Object*, void*) {
    static_cast<ZoneField*>(data)->closeList();
}

void ZoneField::suggest() {
    closeList();
    const auto names = zonesMatching(textOf(_field), MOST_NAMES);
    if (names.empty())
        return;
    Evas_Object* top = elm_object_top_widget_get(_field);
    _list = elm_layout_add(top);
    elm_layout_theme_set(_list, "simulator", "control", "suggestions");
    Evas_Object* column = addColumn(_list);
    for (const std::string& name : names) {
        Evas_Object* button = addButton(addRow(column), name.c_str(), name);
        // The field keeps the keys: the list goes with it.
        elm_object_focus_allow_set(button, EINA_FALSE);
        onEvent(button, "clicked", [this, name] { choose(name); });
    }
    elm_object_part_content_set(_list, "suggestions.content", column);
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;
    evas_object_geometry_get(_field, &x, &y, &width, &height);
    const int rows = static_cast<int>(names.size()) * (height + 4) - 4;
    evas_object_geometry_set(_list, x, y + height + 8, width, rows);
    evas_object_layer_set(_list, LAYER);
    evas_object_show(_list);
}

// A copy: the name may belong to a button of the list.
// NOLINTNEXTLINE(performance-unnecessary-value-param)
void ZoneField::choose(std::string zone) {
    closeList();
    confirm(_field);
    _chosen(zone);
    // The next name is typed in its place.
    elm_entry_select_all(_field);
}

void ZoneField::closeList() {
    if (Evas_Object* list = std::exchange(_list, nullptr))
        evas_object_del(list);
}

} // namespace simulator::control

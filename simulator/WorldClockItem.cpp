#include "WorldClockItem.h"

#include <cstring>
#include <ctime>
#include <string_view>
#include <utility>

#include "TimeText.h"
#include "WorldClockText.h"
#include "clock/ClockText.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {

WorldClockItem::WorldClockItem(ClockWorldClockDbData city, bool twelveHour,
                               SelectedFunction selected)
    : _city(std::move(city)), _twelveHour(twelveHour), _selected(std::move(selected)) {}

Elm_Genlist_Item_Class* WorldClockItem::getItemClassNew() {
    Elm_Genlist_Item_Class* itemClass = elm_genlist_item_class_new();
    itemClass->item_style = "simulator.time";
    itemClass->func.text_get = _textGetCb;
    itemClass->func.del = deleteCb;
    return itemClass;
}

void WorldClockItem::onSelect(Elm_Object_Item* item) {
    elm_genlist_item_selected_set(item, EINA_FALSE);
    onHold();
}

void WorldClockItem::onHold() {
    if (_selected)
        _selected(_city);
}

char* WorldClockItem::_textGetCb(void* data, Evas_Object*, const char* part) {
    const auto* self = static_cast<WorldClockItem*>(data);
    if (self == nullptr || part == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return nullptr;
    }
    const std::string_view name(part);
    if (name == "row.time") {
        return strdup(
            cityTimeText(std::time(nullptr), self->_city.tzPath, self->_twelveHour).c_str());
    }
    if (name == "row.about")
        return strdup(self->aboutMarkup().c_str());
    return nullptr;
}

std::string WorldClockItem::aboutMarkup() const {
    return "<label>" + markupOf(clockText(_city.city.c_str())) + "</label><br>" +
           markupOf(cityOffsetText(std::time(nullptr), _city.tzPath));
}

} // namespace simulator

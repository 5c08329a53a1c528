#include "CityRows.h"

#include <algorithm>
#include <utility>

namespace {
// More than the face shows, also after the first flick.
constexpr std::size_t FIRST_ROWS = 48;
// Few enough that a key press in between does not wait.
constexpr std::size_t ROWS_PER_TURN = 48;
// Seconds. Jobs would come before the frame with the first rows, and leave no turn to other events.
constexpr double UNTIL_DRAWN = 0.016;
constexpr double BETWEEN_TURNS = 0.001;
} // namespace

CityRows::CityRows(std::function<void()> filled) : _filled(std::move(filled)) {}

CityRows::~CityRows() {
    stop();
}

void CityRows::show(Evas_Object* genlist, Elm_Genlist_Item_Class* itemClass,
                    std::vector<ClockWorldClockDbData*> cities) {
    stop();
    _genlist = genlist;
    _itemClass = itemClass;
    elm_genlist_item_class_ref(_itemClass);
    evas_object_event_callback_add(_genlist, EVAS_CALLBACK_DEL, _genlistDeletedCb, this);
    _cities = std::move(cities);
    _items.reserve(_cities.size());
    appendUpTo(FIRST_ROWS);
    if (_items.size() < _cities.size())
        _timer = ecore_timer_add(UNTIL_DRAWN, _nextRowsCb, this);
}

void CityRows::link(Elm_Object_Item* indexItem, std::size_t place) {
    _links.push_back({indexItem, place});
    linkAppended();
}

void CityRows::complete() {
    appendUpTo(_cities.size());
}

void CityRows::stop() {
    if (_timer)
        ecore_timer_del(_timer);
    _timer = nullptr;
    if (_genlist)
        evas_object_event_callback_del_full(_genlist, EVAS_CALLBACK_DEL, _genlistDeletedCb, this);
    _genlist = nullptr;
    if (_itemClass)
        elm_genlist_item_class_unref(_itemClass);
    _itemClass = nullptr;
    _cities.clear();
    _items.clear();
    _links.clear();
}

Eina_Bool CityRows::_nextRowsCb(void* data) {
    auto* self = static_cast<CityRows*>(data);
    if (self->_items.size() < self->_cities.size()) {
        ecore_timer_interval_set(self->_timer, BETWEEN_TURNS);
        self->appendUpTo(self->_items.size() + ROWS_PER_TURN);
        return ECORE_CALLBACK_RENEW;
    }
    self->_timer = nullptr;
    if (self->_filled)
        self->_filled();
    return ECORE_CALLBACK_CANCEL;
}

void CityRows::_genlistDeletedCb(void* data, Evas*, Evas_Object*, void*) {
    static_cast<CityRows*>(data)->stop();
}

void CityRows::appendUpTo(std::size_t end) {
    end = std::min(end, _cities.size());
    for (std::size_t place = _items.size(); place < end; ++place)
        _items.push_back(elm_genlist_item_append(_genlist, _itemClass, _cities[place], nullptr,
                                                 ELM_GENLIST_ITEM_NONE, nullptr, nullptr));
    linkAppended();
}

void CityRows::linkAppended() {
    std::erase_if(_links, [this](const Link& link) {
        const bool there = link.place < _items.size();
        if (there)
            elm_object_item_data_set(link.indexItem, _items[link.place]);
        return there;
    });
}

#include "ListDisposal.h"

#include <algorithm>
#include <utility>

namespace {
constexpr int ROWS_PER_TURN = 48;
// Seconds. What takes the list's place is drawn first.
constexpr double UNTIL_DRAWN = 0.05;
constexpr double BETWEEN_TURNS = 0.001;
} // namespace

ListDisposal::~ListDisposal() {
    stopTimer();
    for (Evas_Object* genlist : std::exchange(_lists, {})) {
        evas_object_event_callback_del_full(genlist, EVAS_CALLBACK_DEL, _genlistDeletedCb, this);
        evas_object_del(genlist);
    }
}

void ListDisposal::add(Evas_Object* genlist) {
    if (!genlist)
        return;
    evas_object_hide(genlist);
    evas_object_event_callback_add(genlist, EVAS_CALLBACK_DEL, _genlistDeletedCb, this);
    _lists.push_back(genlist);
    stopTimer();
    _timer = ecore_timer_add(UNTIL_DRAWN, _nextRowsCb, this);
}

void ListDisposal::stopTimer() {
    if (_timer)
        ecore_timer_del(_timer);
    _timer = nullptr;
}

Eina_Bool ListDisposal::_nextRowsCb(void* data) {
    auto* self = static_cast<ListDisposal*>(data);
    if (!self->_lists.empty()) {
        ecore_timer_interval_set(self->_timer, BETWEEN_TURNS);
        self->deleteSomeRows();
        return ECORE_CALLBACK_RENEW;
    }
    self->_timer = nullptr;
    return ECORE_CALLBACK_CANCEL;
}

void ListDisposal::_genlistDeletedCb(void* data, Evas*, Evas_Object* genlist, void*) {
    auto& lists = static_cast<ListDisposal*>(data)->_lists;
    lists.erase(std::remove(lists.begin(), lists.end(), genlist), lists.end());
}

void ListDisposal::deleteSomeRows() {
    Evas_Object* genlist = _lists.back();
    for (int row = 0; row < ROWS_PER_TURN; ++row) {
        Elm_Object_Item* last = elm_genlist_last_item_get(genlist);
        if (!last) {
            evas_object_del(genlist);
            return;
        }
        elm_object_item_del(last);
    }
}

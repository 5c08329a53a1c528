#include "ListDisposal.h"

#include <algorithm>
#include <utility>

namespace {
constexpr int ROWS_PER_TURN = 96;
}

ListDisposal::~ListDisposal() {
    if (_job)
        ecore_job_del(_job);
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
    if (!_job)
        _job = ecore_job_add(_nextRowsCb, this);
}

void ListDisposal::_nextRowsCb(void* data) {
    auto* self = static_cast<ListDisposal*>(data);
    self->_job = nullptr;
    if (!self->_lists.empty())
        self->deleteSomeRows();
    if (!self->_lists.empty())
        self->_job = ecore_job_add(_nextRowsCb, self);
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

#include "TonePage.h"

#include <cstring>
#include <string_view>
#include <utility>

#include <libintl.h>

#include "device/eext.h"

namespace tone_picker {
namespace {

constexpr const char* TITLE = "IDS_ALM_HEADER_TONE";
constexpr const char* NO_TONES = "IDS_ALM_BODY_NO_TONES";
constexpr const char* CANCEL = "IDS_TPLATFORM_ACBUTTON_CANCEL_ABB";
constexpr const char* DONE = "IDS_TPLATFORM_ACBUTTON_DONE_ABB";
constexpr const char* ROW_TEXT = "elm.text.main.left";
constexpr const char* ROW_MARK = "elm.icon.2";
constexpr const char* MARK_HOLDER = "elm.swallow.content";

void expand(Evas_Object* object) {
    evas_object_size_hint_weight_set(object, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_set(object, EVAS_HINT_FILL, EVAS_HINT_FILL);
}

void writeEmptyText(void*, Evas_Object* text, void*) {
    const std::string centred =
        std::string("<align=center>") + dgettext(nullptr, NO_TONES) + "</align>";
    elm_object_text_set(text, centred.c_str());
}

/** In place of the list. */
Evas_Object* createEmptyText(Evas_Object* parent) {
    Evas_Object* text = elm_label_add(parent);
    elm_label_line_wrap_set(text, ELM_WRAP_MIXED);
    writeEmptyText(nullptr, text, nullptr);
    evas_object_smart_callback_add(text, "language,changed", writeEmptyText, nullptr);
    evas_object_show(text);
    return text;
}

} // namespace

TonePage::TonePage(std::vector<Tone> tones, int marked, Actions actions)
    : _tones(std::move(tones)), _marked(marked), _actions(std::move(actions)) {}

void TonePage::show(Evas_Object* window) {
    Evas_Object* pages = elm_naviframe_add(window);
    elm_naviframe_prev_btn_auto_pushed_set(pages, EINA_FALSE);
    eext_object_event_callback_add(pages, EEXT_EVENT_BACK, _cancelCb, this);
    expand(pages);
    elm_win_resize_object_add(window, pages);
    Evas_Object* content = _tones.empty() ? createEmptyText(pages) : createList(pages);
    Elm_Object_Item* page =
        elm_naviframe_item_push(pages, nullptr, nullptr, nullptr, content, nullptr);
    elm_object_item_domain_translatable_part_text_set(page, "elm.text.title", nullptr, TITLE);
    addButton(page, "title_left", CANCEL, _cancelCb);
    _done = addButton(page, "title_right", DONE, _doneCb);
    elm_object_disabled_set(_done, _marked < 0);
    evas_object_show(pages);
}

Evas_Object* TonePage::addButton(Elm_Object_Item* page, const char* side, const char* textId,
                                 Evas_Smart_Cb clicked) {
    Evas_Object* button = elm_button_add(elm_object_item_widget_get(page));
    elm_object_style_set(button, (std::string("naviframe/") + side).c_str());
    elm_object_domain_translatable_text_set(button, nullptr, textId);
    evas_object_smart_callback_add(button, "clicked", clicked, this);
    elm_object_item_part_content_set(page, (std::string(side) + "_btn").c_str(), button);
    return button;
}

Evas_Object* TonePage::createList(Evas_Object* parent) {
    _list = elm_genlist_add(parent);
    elm_genlist_mode_set(_list, ELM_LIST_COMPRESS);
    elm_genlist_homogeneous_set(_list, EINA_TRUE);
    expand(_list);
    // Never shown: it keeps the marks of all rows together.
    _group = elm_radio_add(_list);
    elm_radio_state_value_set(_group, -1);
    elm_radio_value_set(_group, _marked);
    fill();
    evas_object_show(_list);
    return _list;
}

void TonePage::fill() {
    Elm_Genlist_Item_Class* rowClass = elm_genlist_item_class_new();
    rowClass->item_style = "1line";
    rowClass->func.text_get = _textGetCb;
    rowClass->func.content_get = _contentGetCb;
    _rows.reserve(_tones.size());
    for (int position = 0; position < static_cast<int>(_tones.size()); ++position) {
        _rows.push_back({this, position});
        _items.push_back(elm_genlist_item_append(_list, rowClass, &_rows.back(), nullptr,
                                                 ELM_GENLIST_ITEM_NONE, _rowTappedCb,
                                                 &_rows.back()));
    }
    elm_genlist_item_class_free(rowClass);
    if (_marked >= 0)
        elm_genlist_item_show(_items.at(static_cast<std::size_t>(_marked)),
                              ELM_GENLIST_ITEM_SCROLLTO_MIDDLE);
}

char* TonePage::_textGetCb(void* data, Evas_Object*, const char* part) {
    const auto* row = static_cast<Row*>(data);
    if (std::string_view(part) != ROW_TEXT)
        return nullptr;
    return strdup(row->page->_tones.at(static_cast<std::size_t>(row->position)).title.c_str());
}

Evas_Object* TonePage::_contentGetCb(void* data, Evas_Object* list, const char* part) {
    const auto* row = static_cast<Row*>(data);
    if (std::string_view(part) != ROW_MARK)
        return nullptr;
    Evas_Object* layout = elm_layout_add(list);
    elm_layout_theme_set(layout, "layout", "list/C/type.2", "default");
    expand(layout);
    Evas_Object* radio = elm_radio_add(layout);
    elm_object_style_set(radio, "list");
    elm_radio_state_value_set(radio, row->position);
    elm_radio_group_add(radio, row->page->_group);
    expand(radio);
    // The row is touched as a whole.
    elm_object_signal_emit(radio, "elm,event,pass,enabled", "elm");
    elm_object_part_content_set(layout, MARK_HOLDER, radio);
    return layout;
}

void TonePage::_rowTappedCb(void* data, Evas_Object*, void* info) {
    const auto* row = static_cast<Row*>(data);
    elm_genlist_item_selected_set(static_cast<Elm_Object_Item*>(info), EINA_FALSE);
    row->page->mark(row->position);
}

void TonePage::mark(int position) {
    if (position != _marked) {
        turnMark(_marked, false);
        turnMark(position, true);
    }
    _marked = position;
    elm_radio_value_set(_group, position);
    elm_object_disabled_set(_done, EINA_FALSE);
    _actions.marked(position);
}

/** Lets the mark of a row move to its new state, if the row is in sight. */
void TonePage::turnMark(int position, bool on) {
    if (position < 0)
        return;
    Evas_Object* layout =
        elm_object_item_part_content_get(_items.at(static_cast<std::size_t>(position)), ROW_MARK);
    Evas_Object* radio = layout ? elm_object_part_content_get(layout, MARK_HOLDER) : nullptr;
    if (radio)
        elm_object_signal_emit(radio, on ? "elm,activate,check,on" : "elm,activate,check,off",
                               "elm");
}

void TonePage::_doneCb(void* data, Evas_Object*, void*) {
    const auto* self = static_cast<TonePage*>(data);
    self->_actions.done(self->_marked);
}

void TonePage::_cancelCb(void* data, Evas_Object*, void*) {
    static_cast<TonePage*>(data)->_actions.cancelled();
}

} // namespace tone_picker

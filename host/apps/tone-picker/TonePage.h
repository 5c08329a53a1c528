/**
 * @file
 * @brief The page on which a person picks a tone.
 */
#pragma once

#include <functional>
#include <string>
#include <vector>

#include <Elementary.h>

#include "ToneList.h"

namespace tone_picker {

/** A list of tones, one of which is marked, below Cancel and Done. */
class TonePage {
public:
    /** What the person does; positions count from 0. */
    struct Actions {
        std::function<void(int position)> marked;
        std::function<void(int position)> done;
        std::function<void()> cancelled;
    };

    /** @param marked Position of the tone that is marked at first, or -1. */
    TonePage(std::vector<Tone> tones, int marked, Actions actions);
    TonePage(const TonePage&) = delete;
    TonePage& operator=(const TonePage&) = delete;

    /** Fills a window, which must go before this object does. */
    void show(Evas_Object* window);

private:
    struct Row {
        TonePage* page;
        int position;
    };

    static char* _textGetCb(void* data, Evas_Object* list, const char* part);
    static Evas_Object* _contentGetCb(void* data, Evas_Object* list, const char* part);
    static void _rowTappedCb(void* data, Evas_Object* list, void* info);
    static void _doneCb(void* data, Evas_Object* button, void* info);
    static void _cancelCb(void* data, Evas_Object* object, void* info);

    Evas_Object* createList(Evas_Object* parent);
    void fill();
    Evas_Object* addButton(Elm_Object_Item* page, const char* side, const char* textId,
                           Evas_Smart_Cb clicked);
    void mark(int position);
    void turnMark(int position, bool on);

    std::vector<Tone> _tones;
    int _marked;
    Actions _actions;
    std::vector<Row> _rows;
    std::vector<Elm_Object_Item*> _items;
    Evas_Object* _list = nullptr;
    Evas_Object* _group = nullptr;
    Evas_Object* _done = nullptr;
};

} // namespace tone_picker

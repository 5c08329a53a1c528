#include "PickerFace.h"

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <cstring>

#include <sys/select.h>

#include <Ecore_Evas.h>
#include <Ecore_Input.h>

#include "app_assist/WContentViewController.h"
#include "clock/ClockWorldClockDbData.h"
#include "device/uxt.h"

namespace {

constexpr int FACE_SIZE = 360;
constexpr double TOO_LATE = 10; // Seconds.

/** Of the run under way. */
Work work;
double awakeSince = 0;

/** Lists take shorter pauses than this while they change. */
constexpr double PAUSE = 0.06; // Seconds.

/** The main loop asks here for news at each turn; with a timeout when it has nothing to do. */
int selectUnlessAsleep(int count, fd_set* readable, fd_set* writable, fd_set* odd,
                       timeval* timeout) {
    work.longestTurn = std::max(work.longestTurn, millisecondsNow() - awakeSince);
    ++work.turns;
    timeval none{};
    if (timeout == nullptr ||
        static_cast<double>(timeout->tv_sec) + static_cast<double>(timeout->tv_usec) / 1e6 >
            PAUSE) {
        ecore_main_loop_quit();
        timeout = &none;
    }
    const int ready = select(count, readable, writable, odd, timeout);
    awakeSince = millisecondsNow();
    return ready;
}

class PageBelow : public app_assist::WContentViewController {
protected:
    Evas_Object* onCreateView(Evas_Object* parent, void*) override { return elm_label_add(parent); }
};

Eina_Bool quitCb(void*) {
    ecore_main_loop_quit();
    return ECORE_CALLBACK_CANCEL;
}

} // namespace

double millisecondsNow() {
    using namespace std::chrono;
    return duration<double, std::milli>(steady_clock::now().time_since_epoch()).count();
}

Work runUntilAsleep() {
    work = Work();
    awakeSince = millisecondsNow();
    ecore_main_loop_select_func_set(selectUnlessAsleep);
    ecore_main_loop_begin();
    ecore_main_loop_select_func_set(select);
    return work;
}

void runFor(double seconds) {
    ecore_timer_add(seconds, quitCb, nullptr);
    ecore_main_loop_begin();
}

PickerFace::PickerFace() : _window("bench", FACE_SIZE, FACE_SIZE) {
    _window.create(nullptr, nullptr);
    _pages = new app_assist::WNaviframeController();
    _window.setBaseController(_pages);
    _pages->push(new PageBelow);
    Evas* canvas = evas_object_evas_get(window());
    evas_event_callback_add(canvas, EVAS_CALLBACK_RENDER_FLUSH_POST, renderedCb, this);
    // A window of the buffer engine has the focus for the toolkit only after it was without it.
    ecore_evas_focus_set(ecore_evas_ecore_evas_get(canvas), EINA_FALSE);
    runFor(0.1);
    ecore_evas_focus_set(ecore_evas_ecore_evas_get(canvas), EINA_TRUE);
    runFor(0.1);
}

PickerFace::~PickerFace() {
    evas_event_callback_del_full(evas_object_evas_get(window()), EVAS_CALLBACK_RENDER_FLUSH_POST,
                                 renderedCb, this);
}

void PickerFace::rest() {
    // Longer than a page slides: it is deaf meanwhile.
    runFor(0.4);
    runUntilAsleep();
}

double PickerFace::drawFrame() {
    Evas* canvas = evas_object_evas_get(window());
    const double start = millisecondsNow();
    evas_damage_rectangle_add(canvas, 0, 0, FACE_SIZE, FACE_SIZE);
    ecore_evas_manual_render(ecore_evas_ecore_evas_get(canvas));
    return millisecondsNow() - start;
}

double PickerFace::open() {
    _awaited.clear();
    _start = millisecondsNow();
    _picker = new WorldClockAddCityViewController(0);
    _picker->setCityDataReturnFunc([](ClockWorldClockDbData&) {});
    _pages->push(_picker);
    return timeToCities();
}

void PickerFace::tapEntry() {
    Evas* canvas = evas_object_evas_get(window());
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;
    evas_object_geometry_get(entry(), &x, &y, &width, &height);
    evas_event_feed_mouse_in(canvas, ++_stamp, nullptr);
    evas_event_feed_mouse_move(canvas, x + width / 2, y + height / 2, ++_stamp, nullptr);
    evas_event_feed_mouse_down(canvas, 1, EVAS_BUTTON_NONE, ++_stamp, nullptr);
    evas_event_feed_mouse_up(canvas, 1, EVAS_BUTTON_NONE, ++_stamp, nullptr);
}

void PickerFace::close() {
    // The page slides away.
    _picker->popOut();
    _picker = nullptr;
    runFor(0.5);
    runUntilAsleep();
}

double PickerFace::press(const char* key, const std::string& text) {
    _awaited = text;
    _start = millisecondsNow();
    sendKey(ECORE_EVENT_KEY_DOWN, key);
    sendKey(ECORE_EVENT_KEY_UP, key);
    return timeToCities();
}

Work PickerFace::bringTo(const std::string& text) {
    // As often as there are letters: a field that is not focused keeps them.
    for (auto left = this->text().size(); left > 0 && !text.starts_with(this->text()); --left) {
        sendKey(ECORE_EVENT_KEY_DOWN, "BackSpace");
        sendKey(ECORE_EVENT_KEY_UP, "BackSpace");
        runUntilAsleep();
    }
    for (std::size_t place = this->text().size(); place < text.size(); ++place) {
        const char key[] = {text[place], '\0'};
        sendKey(ECORE_EVENT_KEY_DOWN, key);
        sendKey(ECORE_EVENT_KEY_UP, key);
        runUntilAsleep();
    }
    return runUntilAsleep();
}

std::string PickerFace::text() {
    const char* text = entry() ? elm_entry_entry_get(entry()) : nullptr;
    return text ? text : "";
}

int PickerFace::rowCount() {
    return genlist() ? static_cast<int>(elm_genlist_items_count(genlist())) : 0;
}

void PickerFace::renderedCb(void* data, Evas*, void*) {
    const double time = millisecondsNow();
    auto* self = static_cast<PickerFace*>(data);
    ++self->_frames;
    if (!self->_waiting || !self->showsCities())
        return;
    self->_waiting = false;
    self->_shown = time - self->_start;
    ecore_main_loop_quit();
}

Eina_Bool PickerFace::tooLateCb(void*) {
    ecore_main_loop_quit();
    return ECORE_CALLBACK_RENEW;
}

Evas_Object* PickerFace::part(const std::vector<const char*>& path) {
    Evas_Object* object = _picker ? _picker->getEvasObj() : nullptr;
    for (const char* name : path)
        object = object ? elm_object_part_content_get(object, name) : nullptr;
    return object;
}

Evas_Object* PickerFace::genlist() {
    return part({"elm.swallow.content", "elm.swallow.content", "elm.swallow.content"});
}

Evas_Object* PickerFace::entry() {
    return uxt_edit_field_layout_get_entry(
        part({"elm.swallow.content", "searchbar", "entry.part"}));
}

void PickerFace::sendKey(int type, const char* key) {
    const bool isLetter = std::strlen(key) == 1;
    // The event's strings live in the block that is freed with it.
    auto* event = static_cast<Ecore_Event_Key*>(
        std::calloc(1, sizeof(Ecore_Event_Key) + std::strlen(key) + 1));
    auto* name = reinterpret_cast<char*>(event + 1);
    std::memcpy(name, key, std::strlen(key));
    event->keyname = event->key = name;
    event->string = event->compose = isLetter ? name : nullptr;
    event->timestamp = ++_stamp;
    event->window = event->event_window =
        ecore_evas_window_get(ecore_evas_ecore_evas_get(evas_object_evas_get(window())));
    ecore_event_add(type, event, nullptr, nullptr);
}

double PickerFace::timeToCities() {
    _shown = -1;
    _waiting = true;
    Ecore_Timer* guard = ecore_timer_add(TOO_LATE, tooLateCb, this);
    ecore_main_loop_begin();
    ecore_timer_del(guard);
    _waiting = false;
    return _shown;
}

/** True when the first row that is drawn is the first of the awaited cities. */
bool PickerFace::showsCities() {
    if (text() != _awaited || !genlist())
        return false;
    const Elm_Object_Item* first = elm_genlist_first_item_get(genlist());
    if (!first)
        return false;
    const auto* city = static_cast<ClockWorldClockDbData*>(elm_object_item_data_get(first));
    Eina_List* drawn = elm_genlist_realized_items_get(genlist());
    const bool isDrawn = eina_list_data_find(drawn, first) != nullptr;
    eina_list_free(drawn);
    return isDrawn && city->searchKeyword == _awaited;
}

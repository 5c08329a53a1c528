#include "FocusNavigator.h"

#include <algorithm>
#include <cstdlib>
#include <iterator>
#include <string_view>
#include <utility>
#include <vector>

#include <Ecore_Evas.h>
#include <Ecore_Input.h>
#include <Elementary.h>

#include "Accessible.h"
#include "FocusActions.h"
#include "FocusList.h"
#include "FocusRing.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace host {

namespace {

constexpr const char* REALIZED = "realized";
constexpr const char* HEARD_KEY = "device.focus.heard";
constexpr int MIDDLE_BUTTON = 2;

struct KeyName {
    std::string_view name;
    FocusInput input;
};

constexpr KeyName KEY_NAMES[] = {
    {"Tab", FocusInput::Tab},        {"ISO_Left_Tab", FocusInput::BackTab},
    {"Up", FocusInput::Up},          {"KP_Up", FocusInput::Up},
    {"Down", FocusInput::Down},      {"KP_Down", FocusInput::Down},
    {"Left", FocusInput::Left},      {"KP_Left", FocusInput::Left},
    {"Right", FocusInput::Right},    {"KP_Right", FocusInput::Right},
    {"Return", FocusInput::Enter},   {"KP_Enter", FocusInput::Enter},
    {"space", FocusInput::Space},    {"Delete", FocusInput::Hold},
    {"KP_Delete", FocusInput::Hold},
};

std::optional<FocusInput> inputOf(const Ecore_Event_Key& event) {
    const std::string_view name = event.key ? event.key : "";
    if (name == "Tab" && (event.modifiers & ECORE_EVENT_MODIFIER_SHIFT))
        return FocusInput::BackTab;
    const auto* found = std::find_if(std::begin(KEY_NAMES), std::end(KEY_NAMES),
                                     [name](const KeyName& key) { return key.name == name; });
    return found == std::end(KEY_NAMES) ? std::nullopt : std::optional(found->input);
}

bool isBezel(FocusInput input) {
    return input == FocusInput::StepForth || input == FocusInput::StepBack ||
           input == FocusInput::Press;
}

std::vector<FocusNavigator*>& navigators() {
    static std::vector<FocusNavigator*> all;
    return all;
}

Ecore_Event_Handler*& keyHandler() {
    static Ecore_Event_Handler* handler = nullptr;
    return handler;
}

/** What lies below must not answer as well. */
template <typename Event>
void keepFromBelow(Event& event) {
    event.event_flags = static_cast<Evas_Event_Flags>(event.event_flags | EVAS_EVENT_FLAG_ON_HOLD);
}

} // namespace

void FocusNavigator::install(Evas_Object* window) {
    if (!window)
        return;
    navigators().push_back(new FocusNavigator(window));
    if (!keyHandler())
        keyHandler() = ecore_event_handler_prepend(ECORE_EVENT_KEY_DOWN, _keyDownCb, nullptr);
}

FocusNavigator::FocusNavigator(Evas_Object* window)
    : _window(window), _catcher(evas_object_rectangle_add(evas_object_evas_get(window))) {
    evas_object_color_set(_catcher, 0, 0, 0, 0);
    evas_object_layer_set(_catcher, EVAS_LAYER_MAX);
    // Everything goes on to what lies below, unless it is for the focus.
    evas_object_repeat_events_set(_catcher, EINA_TRUE);
    evas_object_event_callback_add(_catcher, EVAS_CALLBACK_MOUSE_WHEEL, _wheelCb, this);
    evas_object_event_callback_add(_catcher, EVAS_CALLBACK_MOUSE_DOWN, _mouseDownCb, this);
    evas_object_event_callback_add(_catcher, EVAS_CALLBACK_MOUSE_UP, _mouseUpCb, this);
    evas_object_event_callback_add(_window, EVAS_CALLBACK_RESIZE, _windowResizedCb, this);
    evas_object_event_callback_add(_window, EVAS_CALLBACK_DEL, _windowDeletedCb, this);
    evas_object_show(_catcher);
}

// Pages go with their window, some of them before it: they cannot be touched any more.
FocusNavigator::~FocusNavigator() {
    endPress();
    if (_idle)
        ecore_idle_enterer_del(_idle);
    std::erase(navigators(), this);
    if (navigators().empty() && keyHandler())
        ecore_event_handler_del(std::exchange(keyHandler(), nullptr));
}

FocusNavigator* FocusNavigator::of(const Evas* canvas) {
    for (FocusNavigator* navigator : navigators())
        if (evas_object_evas_get(navigator->_window) == canvas)
            return navigator;
    return nullptr;
}

FocusNavigator* FocusNavigator::ofKeys(Ecore_Window window) {
    for (FocusNavigator* navigator : navigators()) {
        const Ecore_Evas* ee = ecore_evas_ecore_evas_get(evas_object_evas_get(navigator->_window));
        if (ee && ecore_evas_window_get(ee) == window)
            return navigator;
    }
    return nullptr;
}

bool FocusNavigator::stopTurning(const Evas_Object* object) {
    FocusNavigator* navigator = of(evas_object_evas_get(object));
    if (!navigator || !navigator->_turning || !navigator->_idle)
        return false;
    navigator->startTurning(false);
    return true;
}

void FocusNavigator::reach(Elm_Object_Item* row) {
    Evas_Object* list = elm_object_item_widget_get(row);
    FocusNavigator* navigator = of(evas_object_evas_get(list));
    if (!navigator || !navigator->enterPage())
        return;
    navigator->lead(true);
    navigator->take({FocusKind::Row, list, list, row, 0, {}}, true);
}

std::optional<bool> FocusNavigator::hasFocus(const Elm_Object_Item* row) {
    const FocusNavigator* navigator = of(evas_object_evas_get(elm_object_item_widget_get(row)));
    if (!navigator || !navigator->_idle || !navigator->_root)
        return std::nullopt;
    const auto& thing = navigator->_memories.at(navigator->_root).thing;
    return thing && thing->kind == FocusKind::Row && thing->item == row;
}

void FocusNavigator::_windowDeletedCb(void* data, Evas*, Evas_Object*, void*) {
    delete static_cast<FocusNavigator*>(data);
}

void FocusNavigator::_windowResizedCb(void* data, Evas*, Evas_Object* window, void*) {
    int width = 0;
    int height = 0;
    evas_object_geometry_get(window, nullptr, nullptr, &width, &height);
    evas_object_resize(static_cast<FocusNavigator*>(data)->_catcher, width, height);
}

void FocusNavigator::_rootDeletedCb(void* data, const Efl_Event* event) {
    auto* self = static_cast<FocusNavigator*>(data);
    Evas_Object* root = event->object;
    // A page may go after the window.
    if (std::find(navigators().begin(), navigators().end(), self) == navigators().end())
        return;
    self->_memories.erase(root);
    if (self->_root == root) {
        self->_root = nullptr;
        self->_turning = false;
    }
}

Eina_Bool FocusNavigator::_keyDownCb(void*, int, void* info) {
    const auto& event = *static_cast<Ecore_Event_Key*>(info);
    const auto input = inputOf(event);
    FocusNavigator* navigator = input ? ofKeys(event.event_window) : nullptr;
    return navigator && navigator->handle(*input) ? ECORE_CALLBACK_DONE : ECORE_CALLBACK_PASS_ON;
}

void FocusNavigator::_wheelCb(void* data, Evas*, Evas_Object*, void* info) {
    auto& event = *static_cast<Evas_Event_Mouse_Wheel*>(info);
    if (event.direction != 0)
        return;
    bool handled = false;
    const FocusInput input = event.z > 0 ? FocusInput::StepForth : FocusInput::StepBack;
    for (int step = std::abs(event.z); step > 0; --step)
        handled = static_cast<FocusNavigator*>(data)->handle(input) || handled;
    if (handled)
        keepFromBelow(event);
}

void FocusNavigator::_mouseDownCb(void* data, Evas*, Evas_Object*, void* info) {
    auto* self = static_cast<FocusNavigator*>(data);
    auto& event = *static_cast<Evas_Event_Mouse_Down*>(info);
    if (event.button == MIDDLE_BUTTON) {
        keepFromBelow(event);
        if (!self->startPress())
            self->handle(FocusInput::Press);
    } else {
        self->lead(false);
    }
}

void FocusNavigator::_mouseUpCb(void* data, Evas*, Evas_Object*, void* info) {
    auto* self = static_cast<FocusNavigator*>(data);
    auto& event = *static_cast<Evas_Event_Mouse_Up*>(info);
    if (event.button == MIDDLE_BUTTON) {
        keepFromBelow(event);
        if (self->endPress() && self->isStillPressed())
            self->handle(FocusInput::Press);
    } else {
        self->touched(event.canvas.x, event.canvas.y);
    }
}

bool FocusNavigator::startPress() {
    endPress();
    if (!enterPage() || evas_object_freeze_events_get(_root))
        return false;
    const auto thing = found(FocusView(_root));
    if (!thing || thing->kind != FocusKind::Row)
        return false;
    _pressed = *thing;
    _press = ecore_timer_add(elm_config_longpress_timeout_get(), _heldCb, this);
    return true;
}

bool FocusNavigator::endPress() {
    if (!_press)
        return false;
    ecore_timer_del(std::exchange(_press, nullptr));
    return true;
}

Eina_Bool FocusNavigator::_heldCb(void* data) {
    auto* self = static_cast<FocusNavigator*>(data);
    self->_press = nullptr;
    if (self->isStillPressed())
        self->handle(FocusInput::Hold);
    return ECORE_CALLBACK_CANCEL;
}

/** While the bezel is pressed its page may go, and the focus may move on. */
bool FocusNavigator::isStillPressed() {
    const auto thing = enterPage() ? found(FocusView(_root)) : std::nullopt;
    return thing && isSame(*thing, _pressed);
}

/** What is turned by hand is what the bezel turns next. */
void FocusNavigator::touched(int x, int y) {
    if (!enterPage())
        return;
    const auto thing = FocusView(_root).under(x, y);
    Memory& memory = _memories[_root];
    memory = {};
    _turning = thing && canTurn(thing->kind);
    if (_turning || (thing && thing->kind == FocusKind::Field))
        memory.thing = thing;
}

bool FocusNavigator::enterPage() {
    Evas_Object* root = focusRoot(_window);
    if (root != _root) {
        hideRings();
        _root = root;
        _turning = false;
    }
    if (root && !_memories.contains(root)) {
        _memories[root];
        // The canvas says nothing of a page that goes while it takes no input.
        efl_event_callback_add(root, EFL_EVENT_DEL, _rootDeletedCb, this);
    }
    return root != nullptr;
}

std::optional<FocusThing> FocusNavigator::found(const FocusView& view) const {
    const auto& thing = _memories.at(_root).thing;
    if (!thing)
        return std::nullopt;
    const auto same = view.find(*thing);
    return same ? same : remade(view);
}

/** A list that is filled anew has other rows in the same places. */
std::optional<FocusThing> FocusNavigator::remade(const FocusView& view) const {
    const Memory& memory = _memories.at(_root);
    return memory.index < 0 ? std::nullopt : view.inRow(memory.index, memory.thing->place);
}

bool FocusNavigator::handle(FocusInput input) {
    if (!enterPage())
        return false;
    const FocusView view(_root);
    if (view.empty() || evas_object_freeze_events_get(_root))
        return false;
    const auto thing = found(view);
    FocusState state;
    if (thing)
        state.kind = thing->kind;
    state.turning = _turning;
    state.mirrored = view.mirrored();
    state.typing = thing && thing->kind == FocusKind::Field && elm_object_focus_get(thing->object);
    _endsTyping = state.typing && thing && input == FocusInput::Enter;
    return act(view, respond(state, input), input);
}

bool FocusNavigator::act(const FocusView& view, const FocusResponse& response, FocusInput input) {
    switch (response.action) {
    case FocusAction::PassOn:
        return false;
    case FocusAction::First:
    case FocusAction::Last:
    case FocusAction::Nearest:
    case FocusAction::Next:
    case FocusAction::Previous:
        focus(destination(view, response.action), !isBezel(input));
        return true;
    default:
        lead(true);
        use(*found(view), response);
        return true;
    }
}

/** Where a move leads. */
std::optional<FocusThing> FocusNavigator::destination(const FocusView& view,
                                                      FocusAction move) const {
    switch (move) {
    case FocusAction::First:
        return view.first();
    case FocusAction::Last:
        return view.last();
    case FocusAction::Next:
        return besideOrSame(view, 1);
    case FocusAction::Previous:
        return besideOrSame(view, -1);
    default:
        return view.nearest();
    }
}

/** At an end the focus stays, but shows where it is. */
std::optional<FocusThing> FocusNavigator::besideOrSame(const FocusView& view, int direction) const {
    const auto thing = found(view);
    const auto next = view.beside(*thing, direction);
    return next ? next : thing;
}

/** Whatever is pressed may close the window: nothing comes after it. */
void FocusNavigator::use(const FocusThing& thing, const FocusResponse& response) {
    switch (response.action) {
    case FocusAction::Activate:
        activate(thing);
        return;
    case FocusAction::Hold:
        hold(thing);
        return;
    case FocusAction::StartTyping:
        giveToolkitFocus(thing);
        return;
    case FocusAction::Turn:
        turnInSight(thing, response.turn);
        return;
    default:
        startTurning(response.action == FocusAction::StartTurning);
    }
}

void FocusNavigator::turnInSight(const FocusThing& thing, int steps) {
    bringToMiddle(thing);
    turn(thing, steps);
    if (const auto still = enterPage() ? found(FocusView(_root)) : std::nullopt)
        showRing(*still, _turning);
}

void FocusNavigator::focus(const std::optional<FocusThing>& thing, bool byKeyboard) {
    lead(true);
    if (!thing)
        return;
    bringToMiddle(*thing);
    take(*thing, byKeyboard);
}

void FocusNavigator::take(const FocusThing& thing, bool byKeyboard) {
    Memory& memory = _memories[_root];
    const auto before = memory.thing ? FocusView(_root).seen(*memory.thing) : std::nullopt;
    if (before && !isSame(*before, thing))
        hideRing(*before);
    _turning = false;
    memory.thing = thing;
    memory.index = thing.item ? elm_genlist_item_index_get(thing.item) - 1 : -1;
    showRing(thing, false);
    // The bezel only passes over a field: the keypad opens when it is pressed. A calendar would
    // ring a day of its own.
    // It may not have been drawn yet.
    if (thing.item)
        nameControlsInRow(thing.item);
    const bool keepsKeys = thing.kind == FocusKind::Row || thing.kind == FocusKind::Calendar ||
                           (thing.kind == FocusKind::Field && !byKeyboard);
    if (keepsKeys)
        dropToolkitFocus(_window, FocusView(_root).button());
    else
        giveToolkitFocus(thing);
    if (thing.kind == FocusKind::Row)
        tellFocus(thing.item);
    if (thing.list && !evas_object_data_get(thing.list, HEARD_KEY)) {
        evas_object_data_set(thing.list, HEARD_KEY, thing.list);
        evas_object_smart_callback_add(thing.list, REALIZED, _rowRealizedCb, nullptr);
    }
}

/** A row that is drawn anew has lost its ring. */
void FocusNavigator::_rowRealizedCb(void*, Evas_Object* list, void* item) {
    const FocusNavigator* self = of(evas_object_evas_get(list));
    if (!self || !self->_idle)
        return;
    for (const auto& [root, memory] : self->_memories)
        if (memory.thing && memory.thing->kind == FocusKind::Row && memory.thing->item == item)
            showRing(*memory.thing, false);
}

void FocusNavigator::startTurning(bool turning) {
    _turning = turning;
    if (const auto thing = found(FocusView(_root)))
        showRing(*thing, turning);
}

/** Shows or hides the ring: it is seen only while keys lead. */
void FocusNavigator::lead(bool keys) {
    if (keys == (_idle != nullptr))
        return;
    if (keys) {
        _idle = ecore_idle_enterer_add(_idleCb, this);
        if (const auto thing = enterPage() ? found(FocusView(_root)) : std::nullopt)
            showRing(*thing, _turning);
        return;
    }
    ecore_idle_enterer_del(std::exchange(_idle, nullptr));
    hideRings();
    for (auto& [root, memory] : _memories)
        memory = {};
    _turning = false;
}

/** Only the page that keys are for has a ring. */
void FocusNavigator::hideRings() const {
    for (const auto& [root, memory] : _memories)
        if (const auto thing = memory.thing ? FocusView(root).seen(*memory.thing) : std::nullopt)
            hideRing(*thing);
}

/** A page that comes back shows where its focus was. */
Eina_Bool FocusNavigator::_idleCb(void* data) {
    auto* self = static_cast<FocusNavigator*>(data);
    // The field has had its Return by now.
    if (std::exchange(self->_endsTyping, false) && self->_root)
        dropToolkitFocus(self->_window, FocusView(self->_root).button());
    if (focusRoot(self->_window) != self->_root)
        self->_returns = self->enterPage();
    if (self->_returns && self->_root)
        self->showReturned();
    return ECORE_CALLBACK_RENEW;
}

/** A page that slides in hides what it has at first. */
void FocusNavigator::showReturned() {
    Memory& memory = _memories.at(_root);
    const auto thing = found(FocusView(_root));
    _returns = memory.thing && !thing;
    if (!thing)
        return;
    memory.thing = thing;
    showRing(*thing, false);
    tellFocus(thing->kind == FocusKind::Row ? thing->item : thing->object);
}

} // namespace host

#include "TimeWheel.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <utility>

#include <Edje.h>

#include "../Motion.h"
#include "Accessible.h"
#include "ThemeNames.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace host {

namespace {

/** The value in the middle and two on either side: what can show at once while it moves. */
constexpr int DRAWN_VALUES = 5;

constexpr const char* WHEEL_KEY = "device.timewheel";
constexpr const char* OBJECT_KEY = "device.timewheel.object";

/** A plain container: its members share one clip and move with it. */
Evas_Object* addContainer(Evas* canvas, void (*calculate)(Evas_Object*)) {
    static Evas_Smart* const smart = [calculate] {
        static Evas_Smart_Class container =
            EVAS_SMART_CLASS_INIT_NAME_VERSION("DeviceTimeWheelValues");
        evas_object_smart_clipped_smart_set(&container);
        container.calculate = calculate;
        return evas_smart_class_new(&container);
    }();
    return evas_object_smart_add(canvas, smart);
}

int dataNumber(Evas_Object* layout, const char* key) {
    const char* text = edje_object_data_get(elm_layout_edje_get(layout), key);
    return text ? static_cast<int>(std::strtol(text, nullptr, 10)) : 0;
}

} // namespace

std::unique_ptr<TimeWheel> TimeWheel::create(Evas_Object* parent) {
    Evas_Object* object = elm_layout_add(parent);
    std::unique_ptr<TimeWheel> wheel(new TimeWheel(object));
    if (!elm_layout_theme_set(object, theme::LAYOUT_CLASS, theme::PICKER_GROUP,
                              theme::STYLE_WHEEL) ||
        !wheel->addArea()) {
        LOG_ERROR("The theme has no wheel of a time picker");
        evas_object_del(object);
        return nullptr;
    }
    wheel->listen();
    return wheel;
}

TimeWheel* TimeWheel::of(const Evas_Object* object) {
    return object ? static_cast<TimeWheel*>(evas_object_data_get(object, OBJECT_KEY)) : nullptr;
}

TimeWheel::TimeWheel(Evas_Object* object) : _object(object) {
    evas_object_data_set(_object, OBJECT_KEY, this);
    evas_object_event_callback_add(_object, EVAS_CALLBACK_DEL, _deletedCb, this);
}

TimeWheel::~TimeWheel() {
    stop();
    if (!_object)
        return;
    endPress();
    evas_object_data_del(_object, OBJECT_KEY);
    evas_object_event_callback_del_full(_object, EVAS_CALLBACK_DEL, _deletedCb, this);
    evas_object_event_callback_del_full(_object, EVAS_CALLBACK_MOUSE_DOWN, _mouseDownCb, this);
    evas_object_event_callback_del_full(_object, EVAS_CALLBACK_MOUSE_MOVE, _mouseMoveCb, this);
    evas_object_event_callback_del_full(_object, EVAS_CALLBACK_MOUSE_UP, _mouseUpCb, this);
    evas_object_event_callback_del_full(_object, EVAS_CALLBACK_MOUSE_WHEEL, _mouseWheelCb, this);
    elm_object_event_callback_del(_object, _keyCb, this);
    if (_area) {
        evas_object_event_callback_del_full(_area, EVAS_CALLBACK_RESIZE, _areaResizedCb, this);
        evas_object_data_del(_area, WHEEL_KEY);
    }
}

bool TimeWheel::addArea() {
    _stepHeight = dataNumber(_object, theme::DATA_STEP);
    _valueHeight = dataNumber(_object, theme::DATA_VALUE_HEIGHT);
    if (_stepHeight <= 0 || _valueHeight <= 0)
        return false;
    _area = addContainer(evas_object_evas_get(_object), _calculateCb);
    evas_object_data_set(_area, WHEEL_KEY, this);
    evas_object_pass_events_set(_area, EINA_TRUE);
    elm_object_part_content_set(_object, theme::PART_VALUES, _area);
    return true;
}

void TimeWheel::addValueObjects() {
    const char* file = nullptr;
    edje_object_file_get(elm_layout_edje_get(_object), &file, nullptr);
    const char* group = _values.words ? theme::GROUP_WORD : theme::GROUP_NUMBER;
    for (int i = 0; i < DRAWN_VALUES; ++i) {
        Evas_Object* value = edje_object_add(evas_object_evas_get(_area));
        edje_object_file_set(value, file, group);
        evas_object_smart_member_add(value, _area);
        evas_object_show(value);
        _drawn.push_back({value, std::nullopt, -1});
    }
}

void TimeWheel::dropValueObjects() {
    for (const Value& value : _drawn)
        evas_object_del(value.object);
    _drawn.clear();
}

void TimeWheel::listen() {
    elm_object_focus_allow_set(_object, EINA_TRUE);
    setReadAsSpinner(_object);
    evas_object_event_callback_add(_object, EVAS_CALLBACK_MOUSE_DOWN, _mouseDownCb, this);
    evas_object_event_callback_add(_object, EVAS_CALLBACK_MOUSE_MOVE, _mouseMoveCb, this);
    evas_object_event_callback_add(_object, EVAS_CALLBACK_MOUSE_UP, _mouseUpCb, this);
    evas_object_event_callback_add(_object, EVAS_CALLBACK_MOUSE_WHEEL, _mouseWheelCb, this);
    evas_object_event_callback_add(_area, EVAS_CALLBACK_RESIZE, _areaResizedCb, this);
    elm_object_event_callback_add(_object, _keyCb, this);
}

void TimeWheel::setValues(Values values) {
    stop();
    endPress();
    _values = std::move(values);
    dropValueObjects();
    setValue(0);
}

void TimeWheel::setValue(int index) {
    stop();
    endPress();
    _reached = count() > 0 ? wrapped(index, count()) : 0;
    moveTo(static_cast<double>(_reached));
    describe();
}

int TimeWheel::value() const {
    return count() > 0 ? wrapped(_reached, count()) : 0;
}

void TimeWheel::setName(const std::string& name) {
    _name = name;
    describe();
}

void TimeWheel::_mouseDownCb(void* data, Evas*, Evas_Object*, void* info) {
    auto* wheel = static_cast<TimeWheel*>(data);
    const auto* event = static_cast<Evas_Event_Mouse_Down*>(info);
    if (event->button != 1 || (event->event_flags & EVAS_EVENT_FLAG_ON_HOLD) || wheel->_press ||
        wheel->count() == 0 || elm_object_disabled_get(wheel->_object))
        return;
    const bool caught = wheel->_glide.has_value();
    wheel->stop();
    wheel->_press = Press{event->canvas.x, event->canvas.y, wheel->_position, false, caught};
    wheel->_speed.reset();
    wheel->_speed.add(event->timestamp, wheel->_position);
    // The list underneath must not take the drag for its own.
    elm_object_scroll_freeze_push(wheel->_object);
}

void TimeWheel::_mouseMoveCb(void* data, Evas*, Evas_Object*, void* info) {
    auto* wheel = static_cast<TimeWheel*>(data);
    if (wheel->_press)
        wheel->finger(*static_cast<Evas_Event_Mouse_Move*>(info));
}

void TimeWheel::finger(const Evas_Event_Mouse_Move& event) {
    const int dx = event.cur.canvas.x - _press->x;
    const int dy = event.cur.canvas.y - _press->y;
    const int threshold = static_cast<int>(elm_config_scroll_thumbscroll_threshold_get());
    if (!_press->moved && std::abs(dx) > threshold && std::abs(dx) > std::abs(dy)) {
        // A sideways move is not for the wheel: the list may have it.
        endPress();
        glideTo(_reached, 0);
        return;
    }
    _press->moved = _press->moved || std::abs(dy) > threshold;
    double position = _press->position - static_cast<double>(dy) / _stepHeight;
    if (!_values.wraps)
        position = resisting(position, count());
    _speed.add(event.timestamp, position);
    moveTo(position);
    reach(kept(std::lround(position)));
}

void TimeWheel::_mouseUpCb(void* data, Evas*, Evas_Object*, void* info) {
    auto* wheel = static_cast<TimeWheel*>(data);
    auto* event = static_cast<Evas_Event_Mouse_Up*>(info);
    if (!wheel->_press || event->button != 1)
        return;
    // The row below must not take a turn of the wheel for a tap on itself.
    event->event_flags =
        static_cast<Evas_Event_Flags>(event->event_flags | EVAS_EVENT_FLAG_ON_HOLD);
    // A list takes the focus of a touch for its row.
    elm_object_focus_set(wheel->_object, EINA_TRUE);
    wheel->letGo(*event);
}

void TimeWheel::letGo(const Evas_Event_Mouse_Up& event) {
    const Press press = *_press;
    endPress();
    if (!press.moved && !press.caught) {
        tapped(event.canvas.y);
        return;
    }
    const double speed = _speed.at(event.timestamp);
    glideTo(kept(restingPlace(_position, speed)), speed);
}

void TimeWheel::tapped(int y) {
    Evas_Coord top = 0;
    Evas_Coord height = 0;
    evas_object_geometry_get(_area, nullptr, &top, nullptr, &height);
    const int fromMiddle = y - (top + height / 2);
    if (std::abs(fromMiddle) <= _valueHeight / 2)
        glideTo(_reached, 0);
    else
        step(fromMiddle > 0 ? 1 : -1);
}

void TimeWheel::_mouseWheelCb(void* data, Evas*, Evas_Object*, void* info) {
    auto* event = static_cast<Evas_Event_Mouse_Wheel*>(info);
    auto* wheel = static_cast<TimeWheel*>(data);
    if (event->direction != 0 || event->z == 0 || (event->event_flags & EVAS_EVENT_FLAG_ON_HOLD) ||
        elm_object_disabled_get(wheel->_object))
        return;
    event->event_flags =
        static_cast<Evas_Event_Flags>(event->event_flags | EVAS_EVENT_FLAG_ON_HOLD);
    wheel->step(event->z);
}

Eina_Bool TimeWheel::_keyCb(void* data, Evas_Object*, Evas_Object*, Evas_Callback_Type type,
                            void* info) {
    if (type != EVAS_CALLBACK_KEY_DOWN)
        return EINA_FALSE;
    auto* event = static_cast<Evas_Event_Key_Down*>(info);
    if (event->event_flags & EVAS_EVENT_FLAG_ON_HOLD)
        return EINA_FALSE;
    std::string key = event->key;
    if (key == "Tab" && evas_key_modifier_is_set(event->modifiers, "Shift"))
        key = "ISO_Left_Tab";
    if (!static_cast<TimeWheel*>(data)->keyPressed(key))
        return EINA_FALSE;
    event->event_flags =
        static_cast<Evas_Event_Flags>(event->event_flags | EVAS_EVENT_FLAG_ON_HOLD);
    return EINA_TRUE;
}

bool TimeWheel::isInSight() const {
    Evas_Coord x = 0;
    Evas_Coord y = 0;
    Evas_Coord width = 0;
    Evas_Coord height = 0;
    evas_object_geometry_get(_object, &x, &y, &width, &height);
    for (const Evas_Object* clip = evas_object_clip_get(_object); clip;
         clip = evas_object_clip_get(clip)) {
        Eina_Rectangle view;
        evas_object_geometry_get(clip, &view.x, &view.y, &view.w, &view.h);
        if (!eina_rectangle_coords_inside(&view, x + width / 2, y + height / 2))
            return false;
    }
    return true;
}

bool TimeWheel::keyPressed(const std::string& key) {
    // A wheel that was scrolled away may have the focus still; nobody would see it turn.
    if (!isInSight())
        return false;
    if (key == "Up" || key == "KP_Up")
        return step(-1), true;
    if (key == "Down" || key == "KP_Down")
        return step(1), true;
    if (key == "Left" || key == "KP_Left" || key == "ISO_Left_Tab")
        return _focusMoved && _focusMoved(-1);
    if (key == "Right" || key == "KP_Right" || key == "Tab")
        return _focusMoved && _focusMoved(1);
    return false;
}

void TimeWheel::step(int values) {
    if (_press || count() == 0)
        return;
    const long to = kept(_reached + values);
    stop();
    const double from = _position;
    if (!reach(to))
        return;
    // Someone may have set another value on hearing of this one.
    if (_reached == to) {
        moveTo(from);
        glideTo(to, 0);
    }
}

void TimeWheel::glideTo(long to, double speed) {
    if (_position == static_cast<double>(to))
        return;
    _glide = glideFrom(_position, to, speed, ecore_loop_time_get());
    if (!isMotionOn()) {
        _glide->duration = 0;
        _frameCb(this);
        return;
    }
    if (!_animator)
        _animator = ecore_animator_add(_frameCb, this);
}

Eina_Bool TimeWheel::_frameCb(void* data) {
    auto* wheel = static_cast<TimeWheel*>(data);
    // The toolkit may free an animator that is deleted within its own call: stop() must not see it.
    Ecore_Animator* const own = std::exchange(wheel->_animator, nullptr);
    const double now = ecore_loop_time_get();
    const bool ended = wheel->_glide->endedAt(now);
    // A step is the value from the start; a flick makes each value current as it goes by.
    const bool flicked = wheel->_reached != wheel->_glide->to;
    wheel->moveTo(wheel->_glide->at(now));
    if (flicked && !wheel->reach(wheel->kept(std::lround(wheel->_position))))
        return ECORE_CALLBACK_CANCEL;
    const bool replaced = wheel->_animator || !wheel->_glide;
    if (replaced || ended) {
        if (!replaced)
            wheel->_glide.reset();
        return ECORE_CALLBACK_CANCEL;
    }
    wheel->_animator = own;
    return ECORE_CALLBACK_RENEW;
}

void TimeWheel::stop() {
    _glide.reset();
    if (_animator)
        ecore_animator_del(_animator);
    _animator = nullptr;
}

void TimeWheel::endPress() {
    if (_press && _object)
        elm_object_scroll_freeze_pop(_object);
    _press.reset();
}

long TimeWheel::kept(long value) const {
    return _values.wraps ? value : std::clamp(value, 0L, static_cast<long>(count()) - 1);
}

bool TimeWheel::reach(long value) {
    const std::weak_ptr<bool> alive = _alive;
    while (_reached != value) {
        const long next = _reached + (value > _reached ? 1 : -1);
        _reached = next;
        describe();
        if (_changed) {
            const auto changed = _changed;
            changed();
        }
        if (alive.expired())
            return false;
        if (_reached != next)
            break;
    }
    return true;
}

void TimeWheel::moveTo(double position) {
    _position = position;
    if (_area)
        evas_object_smart_changed(_area);
}

void TimeWheel::_calculateCb(Evas_Object* area) {
    // A list makes rows just to measure them: those are gone before anything is drawn.
    if (auto* wheel = static_cast<TimeWheel*>(evas_object_data_get(area, WHEEL_KEY)))
        wheel->draw();
}

void TimeWheel::draw() {
    if (!_object || count() == 0)
        return;
    if (_drawn.empty())
        addValueObjects();
    const long middle = std::lround(_position);
    for (int i = 0; i < DRAWN_VALUES; ++i) {
        const long index = middle + i - DRAWN_VALUES / 2;
        // Each object keeps its value while this one moves over the face.
        Value& value = _drawn[static_cast<std::size_t>(wrapped(index, DRAWN_VALUES))];
        drawValue(value, index, static_cast<double>(index) - _position);
    }
}

void TimeWheel::drawValue(Value& value, long index, double distance) {
    if (value.shown != index) {
        value.shown = index;
        const bool exists = _values.wraps || (index >= 0 && index < count());
        const std::size_t text = static_cast<std::size_t>(wrapped(index, count()));
        edje_object_part_text_set(value.object, theme::PART_VALUE,
                                  exists ? _values.texts[text].c_str() : "");
    }
    if (value.distance != std::abs(distance)) {
        value.distance = std::abs(distance);
        Edje_Message_Float message = {value.distance};
        edje_object_message_send(value.object, EDJE_MESSAGE_FLOAT, theme::MESSAGE_DISTANCE,
                                 &message);
        edje_object_message_signal_process(value.object);
    }
    Evas_Coord x = 0;
    Evas_Coord y = 0;
    Evas_Coord width = 0;
    Evas_Coord height = 0;
    evas_object_geometry_get(_area, &x, &y, &width, &height);
    const int top = y + height / 2 - _valueHeight / 2;
    evas_object_geometry_set(value.object, x,
                             top + static_cast<int>(std::lround(distance * _stepHeight)), width,
                             _valueHeight);
}

void TimeWheel::describe() {
    if (!_object || _name.empty() || count() == 0)
        return;
    const std::string& text = _values.texts[static_cast<std::size_t>(value())];
    setReadName(_object, _name + ", " + text);
}

void TimeWheel::_areaResizedCb(void*, Evas*, Evas_Object* area, void*) {
    evas_object_smart_changed(area);
}

void TimeWheel::_deletedCb(void* data, Evas*, Evas_Object*, void*) {
    auto* wheel = static_cast<TimeWheel*>(data);
    wheel->endPress();
    wheel->stop();
    evas_object_data_del(wheel->_object, OBJECT_KEY);
    if (wheel->_area)
        evas_object_data_del(wheel->_area, WHEEL_KEY);
    wheel->_object = nullptr;
    wheel->_area = nullptr;
    wheel->_drawn.clear();
}

} // namespace host

#include "TimePicker.h"

#include <cstring>

#include "ThemeNames.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace host {

namespace {

constexpr const char* OBJECT_KEY = "device.timepicker";

bool is12HourFormat(const char* format) {
    return std::strstr(format, "%I") || std::strstr(format, "%l") || std::strstr(format, "%p");
}

} // namespace

Evas_Object* TimePicker::create(Evas_Object* parent, const char* style) {
    Evas_Object* object = elm_layout_add(parent);
    if (!object)
        return nullptr;
    // The widget's deletion deletes its picker.
    auto* picker = new TimePicker(object);
    // A time is written from left to right in every language.
    elm_object_mirrored_automatic_set(object, EINA_FALSE);
    elm_object_mirrored_set(object, EINA_FALSE);
    if (!elm_layout_theme_set(object, theme::LAYOUT_CLASS, theme::PICKER_GROUP,
                              style ? style : theme::STYLE_24_HOURS) ||
        !picker->addWheels()) {
        LOG_ERROR("The theme has no time picker");
        evas_object_del(object);
        return nullptr;
    }
    picker->_is24Hours = std::strcmp(elm_object_style_get(object), theme::STYLE_12_HOURS) != 0;
    picker->_texts = timeTextsOf(nullptr);
    picker->_halfFirst = picker->_texts.halfFirst;
    picker->fillWheels();
    evas_object_smart_callback_add(object, "theme,changed", _themeChangedCb, picker);
    return object;
}

TimePicker* TimePicker::of(const Evas_Object* object) {
    return object ? static_cast<TimePicker*>(evas_object_data_get(object, OBJECT_KEY)) : nullptr;
}

TimePicker::TimePicker(Evas_Object* object) : _object(object) {
    evas_object_data_set(object, OBJECT_KEY, this);
    evas_object_event_callback_add(object, EVAS_CALLBACK_DEL, _deletedCb, this);
}

TimePicker::~TimePicker() = default;

bool TimePicker::addWheels() {
    const std::array<std::pair<std::unique_ptr<TimeWheel>*, const char*>, 3> wheels = {{
        {&_hour, theme::PART_HOUR},
        {&_minute, theme::PART_MINUTE},
        {&_half, theme::PART_HALF},
    }};
    for (const auto& [wheel, part] : wheels) {
        *wheel = TimeWheel::create(_object);
        if (!*wheel)
            return false;
        elm_object_part_content_set(_object, part, (*wheel)->object());
        (*wheel)->setChanged([this] { turned(); });
    }
    _hour->setFocusMoved([this](int direction) { return moveFocus(_hour.get(), direction); });
    _minute->setFocusMoved([this](int direction) { return moveFocus(_minute.get(), direction); });
    _half->setFocusMoved([this](int direction) { return moveFocus(_half.get(), direction); });
    return true;
}

bool TimePicker::setTime(const std::tm& time) {
    if (time.tm_hour < 0 || time.tm_hour > 23 || time.tm_min < 0 || time.tm_min > 59) {
        LOG_ERROR("No clock shows %d:%d", time.tm_hour, time.tm_min);
        return false;
    }
    _time = time;
    showTime();
    return true;
}

void TimePicker::setFormat(const char* format) {
    if (!format || !*format) {
        LOG_ERROR("An empty time format is ignored");
        return;
    }
    _format = format;
    const char* half = std::strstr(format, "%p");
    const char* hour = std::strstr(format, "%I");
    _halfFirst = half && hour && half < hour;
    setForm(!is12HourFormat(format));
}

const char* TimePicker::format() const {
    if (!_format.empty())
        return _format.c_str();
    if (_is24Hours)
        return "%H:%M";
    return _halfFirst ? "%p %I:%M" : "%I:%M %p";
}

void TimePicker::setLocale(const char* locale, bool is24Hours) {
    _texts = timeTextsOf(locale);
    _halfFirst = _texts.halfFirst;
    _format.clear();
    _is24Hours = is24Hours;
    fillWheels();
    setForm(is24Hours);
}

void TimePicker::setForm(bool is24Hours) {
    const char* style = is24Hours ? theme::STYLE_24_HOURS : theme::STYLE_12_HOURS;
    const char* current = elm_object_style_get(_object);
    if (current && std::strcmp(current, style) == 0)
        placeHalf();
    else
        elm_object_style_set(_object, style);
}

void TimePicker::_themeChangedCb(void* data, Evas_Object* object, void*) {
    auto* picker = static_cast<TimePicker*>(data);
    const bool is24Hours = std::strcmp(elm_object_style_get(object), theme::STYLE_12_HOURS) != 0;
    if (is24Hours != picker->_is24Hours) {
        picker->_is24Hours = is24Hours;
        // A format that says the opposite no longer holds.
        if (!picker->_format.empty() && is12HourFormat(picker->_format.c_str()) == is24Hours)
            picker->_format.clear();
        picker->fillWheels();
    }
    picker->placeHalf();
}

void TimePicker::fillWheels() {
    _hour->setValues({_texts.hours(_is24Hours), true, false});
    _minute->setValues({_texts.minutes(), true, false});
    _half->setValues({{_texts.am, _texts.pm}, false, true});
    _hour->setName(_texts.hour);
    _minute->setName(_texts.minute);
    _half->setName(_texts.half);
    elm_object_focus_allow_set(_half->object(), !_is24Hours);
    placeHalf();
    showTime();
}

void TimePicker::placeHalf() {
    elm_layout_signal_emit(_object, _halfFirst ? theme::SIGNAL_HALF_FIRST : theme::SIGNAL_HALF_LAST,
                           theme::SIGNAL_SOURCE);
}

void TimePicker::showTime() {
    _hour->setValue(_is24Hours ? _time.tm_hour : _time.tm_hour % 12);
    _minute->setValue(_time.tm_min);
    _half->setValue(_time.tm_hour / 12);
}

void TimePicker::turned() {
    _time.tm_hour = _hour->value() + (_is24Hours ? 0 : 12 * _half->value());
    _time.tm_min = _minute->value();
    // Last: whoever hears it may delete the picker.
    evas_object_smart_callback_call(_object, "changed", nullptr);
}

std::vector<TimeWheel*> TimePicker::wheels() const {
    std::vector<TimeWheel*> order = {_hour.get(), _minute.get()};
    if (!_is24Hours)
        order.insert(_halfFirst ? order.begin() : order.end(), _half.get());
    return order;
}

bool TimePicker::moveFocus(const TimeWheel* from, int direction) const {
    const std::vector<TimeWheel*> order = wheels();
    for (std::size_t i = 0; i < order.size(); ++i) {
        const std::size_t to = i + static_cast<std::size_t>(direction);
        if (order[i] == from && to < order.size()) {
            elm_object_focus_set(order[to]->object(), EINA_TRUE);
            return true;
        }
    }
    return false;
}

void TimePicker::_deletedCb(void* data, Evas*, Evas_Object* object, void*) {
    evas_object_data_del(object, OBJECT_KEY);
    delete static_cast<TimePicker*>(data);
}

} // namespace host

/**
 * @file
 * @brief One column of a time picker.
 */
#pragma once

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include <Ecore.h>
#include <Elementary.h>

#include "WheelMotion.h"

namespace host {

/**
 * @brief A column of values that a person turns.
 *
 * It follows a finger pixel by pixel, runs on after a flick and always comes to rest on a value.
 * The mouse wheel, where nothing else takes it, the up and down keys and a tap on a neighbour step
 * by one value; Up goes to the value drawn above. It draws nothing and runs nothing while it stands
 * still.
 */
class TimeWheel {
public:
    struct Values {
        std::vector<std::string> texts;
        bool wraps = true;
        bool words = false; ///< Drawn smaller than numbers.
    };

    /** @return Null when the theme has no wheel. */
    static std::unique_ptr<TimeWheel> create(Evas_Object* parent);
    /** The wheel of a widget; null for any other object. */
    static TimeWheel* of(const Evas_Object* object);
    ~TimeWheel();
    TimeWheel(const TimeWheel&) = delete;
    TimeWheel& operator=(const TimeWheel&) = delete;

    Evas_Object* object() const { return _object; }
    /** Replaces the values; the wheel stands on the first one. */
    void setValues(Values values);
    /** Stands on a value, without motion and without telling anyone. */
    void setValue(int index);
    int value() const;
    /** Glides on by some values, as far as there are any. */
    void step(int values);
    /** What can be turned to. */
    const Values& values() const { return _values; }
    /** Pixels from one value to the next. */
    int stepHeight() const { return _stepHeight; }
    /**
     * @brief Sets who hears of each value that a person lands on or passes.
     *
     * The function may delete the wheel.
     */
    void setChanged(std::function<void()> changed) { _changed = std::move(changed); }
    /** Sets who moves the focus sideways; true when it did. */
    void setFocusMoved(std::function<bool(int)> moved) { _focusMoved = std::move(moved); }
    /** What a screen reader calls the wheel. */
    void setName(const std::string& name);

private:
    struct Press {
        int x = 0;
        int y = 0;
        double position = 0;
        bool moved = false;
        bool caught = false; ///< The wheel was moving.
    };
    struct Value {
        Evas_Object* object = nullptr;
        std::optional<long> shown;
        double distance = -1;
    };

    explicit TimeWheel(Evas_Object* object);
    bool addArea();
    void addValueObjects();
    void dropValueObjects();
    void listen();

    static void _mouseDownCb(void* data, Evas*, Evas_Object*, void* info);
    static void _mouseMoveCb(void* data, Evas*, Evas_Object*, void* info);
    static void _mouseUpCb(void* data, Evas*, Evas_Object*, void* info);
    static void _mouseWheelCb(void* data, Evas*, Evas_Object*, void* info);
    static void _areaResizedCb(void* data, Evas*, Evas_Object* area, void* info);
    static void _calculateCb(Evas_Object* area);
    static void _deletedCb(void* data, Evas*, Evas_Object*, void* info);
    static Eina_Bool _keyCb(void* data, Evas_Object*, Evas_Object*, Evas_Callback_Type type,
                            void* info);
    static Eina_Bool _frameCb(void* data);

    void finger(const Evas_Event_Mouse_Move& event);
    void letGo(const Evas_Event_Mouse_Up& event);
    void tapped(int y);
    /** True when the value in the middle is within every view around it. */
    bool isInSight() const;
    bool keyPressed(const std::string& key);
    void glideTo(long to, double speed);
    void stop();
    void endPress();
    /** Moves the picture; without telling anyone. */
    void moveTo(double position);
    /** Makes a value the current one, through those on the way. False when the wheel is gone. */
    bool reach(long value);
    long kept(long value) const;
    int count() const { return static_cast<int>(_values.texts.size()); }
    void draw();
    void drawValue(Value& value, long index, double distance);
    void describe();

    Evas_Object* _object;
    Evas_Object* _area = nullptr;
    Ecore_Animator* _animator = nullptr;
    Values _values;
    std::vector<Value> _drawn;
    std::function<void()> _changed;
    std::function<bool(int)> _focusMoved;
    std::string _name;
    FingerSpeed _speed;
    std::optional<Press> _press;
    std::optional<Glide> _glide;
    double _position = 0;
    long _reached = 0; ///< Counts turns: 24 is 0 after one turn of the hours.
    int _stepHeight = 0;
    int _valueHeight = 0;
    std::shared_ptr<bool> _alive = std::make_shared<bool>(true);
};

} // namespace host

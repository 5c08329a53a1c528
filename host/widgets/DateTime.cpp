#include "DateTime.h"

#include <dlfcn.h>

#include <Elementary.h>

#include "TimePicker.h"
#include "device/export.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

// The toolkit's date-time widget only displays the running clock. These functions come before the
// toolkit's own: they serve the device's pickers and hand every other object on.

namespace {

using host::TimePicker;

/** The toolkit's function of the same name and type; null when there is none. */
template <typename Function>
Function* stock(const char* name, Function*) {
    return reinterpret_cast<Function*>(dlsym(RTLD_NEXT, name));
}

/** Calls the toolkit's own function for an object that is not a picker. */
template <typename Function, typename Object, typename... Arguments>
auto forward(const char* name, Function* self, Object* object, Arguments... arguments) {
    using Result = decltype(self(object, arguments...));
    Function* function = object ? stock(name, self) : nullptr;
    if (!function) {
        LOG_ERROR("%s: %s", name, object ? "the toolkit has no such function" : "no object");
        return Result();
    }
    return function(object, arguments...);
}

bool isTimeField(Elm_Datetime_Field_Type field) {
    return field == ELM_DATETIME_HOUR || field == ELM_DATETIME_MINUTE || field == ELM_DATETIME_AMPM;
}

bool showsField(const TimePicker& picker, Elm_Datetime_Field_Type field) {
    return isTimeField(field) && (field != ELM_DATETIME_AMPM || !picker.is24Hours());
}

} // namespace

DEVICE_EXTERN_C_BEGIN

DEVICE_API Eina_Bool elm_datetime_value_set(Evas_Object* obj, const Efl_Time* newtime) {
    TimePicker* picker = TimePicker::of(obj);
    if (!picker)
        return forward(__func__, &elm_datetime_value_set, obj, newtime);
    if (!newtime) {
        LOG_ERROR("no time to set");
        return EINA_FALSE;
    }
    return picker->setTime(*newtime);
}

DEVICE_API Eina_Bool elm_datetime_value_get(const Evas_Object* obj, Efl_Time* currtime) {
    const TimePicker* picker = TimePicker::of(obj);
    if (!picker)
        return forward(__func__, &elm_datetime_value_get, obj, currtime);
    if (!currtime) {
        LOG_ERROR("no place for the time");
        return EINA_FALSE;
    }
    *currtime = picker->time();
    return EINA_TRUE;
}

DEVICE_API void elm_datetime_format_set(Evas_Object* obj, const char* fmt) {
    if (TimePicker* picker = TimePicker::of(obj))
        picker->setFormat(fmt);
    else
        forward(__func__, &elm_datetime_format_set, obj, fmt);
}

DEVICE_API const char* elm_datetime_format_get(const Evas_Object* obj) {
    if (const TimePicker* picker = TimePicker::of(obj))
        return picker->format();
    return forward(__func__, &elm_datetime_format_get, obj);
}

DEVICE_API void elm_datetime_field_visible_set(Evas_Object* obj, Elm_Datetime_Field_Type fieldtype,
                                               Eina_Bool visible) {
    const TimePicker* picker = TimePicker::of(obj);
    if (!picker)
        forward(__func__, &elm_datetime_field_visible_set, obj, fieldtype, visible);
    else if (showsField(*picker, fieldtype) != static_cast<bool>(visible))
        LOG_WARNING("A time picker's style decides that field %d is %s", fieldtype,
                    visible ? "hidden" : "visible");
}

DEVICE_API Eina_Bool elm_datetime_field_visible_get(const Evas_Object* obj,
                                                    Elm_Datetime_Field_Type fieldtype) {
    if (const TimePicker* picker = TimePicker::of(obj))
        return showsField(*picker, fieldtype);
    return forward(__func__, &elm_datetime_field_visible_get, obj, fieldtype);
}

DEVICE_API void elm_datetime_field_limit_set(Evas_Object* obj, Elm_Datetime_Field_Type type,
                                             int min, int max) {
    if (TimePicker::of(obj))
        LOG_WARNING("A time picker has no limits: field %d stays whole", type);
    else
        forward(__func__, &elm_datetime_field_limit_set, obj, type, min, max);
}

DEVICE_API void elm_datetime_field_limit_get(const Evas_Object* obj,
                                             Elm_Datetime_Field_Type fieldtype, int* min,
                                             int* max) {
    if (!TimePicker::of(obj)) {
        forward(__func__, &elm_datetime_field_limit_get, obj, fieldtype, min, max);
        return;
    }
    const int last[] = {0, 0, 0, 23, 59, 1};
    const auto field = static_cast<unsigned>(fieldtype);
    if (min)
        *min = 0;
    if (max)
        *max = field < std::size(last) ? last[field] : 0;
}

DEVICE_API Eina_Bool elm_datetime_value_min_set(Evas_Object* obj, const Efl_Time* mintime) {
    if (!TimePicker::of(obj))
        return forward(__func__, &elm_datetime_value_min_set, obj, mintime);
    LOG_WARNING("A time picker has no earliest time");
    return EINA_FALSE;
}

DEVICE_API Eina_Bool elm_datetime_value_min_get(const Evas_Object* obj, Efl_Time* mintime) {
    if (!TimePicker::of(obj))
        return forward(__func__, &elm_datetime_value_min_get, obj, mintime);
    return EINA_FALSE;
}

DEVICE_API Eina_Bool elm_datetime_value_max_set(Evas_Object* obj, const Efl_Time* maxtime) {
    if (!TimePicker::of(obj))
        return forward(__func__, &elm_datetime_value_max_set, obj, maxtime);
    LOG_WARNING("A time picker has no latest time");
    return EINA_FALSE;
}

DEVICE_API Eina_Bool elm_datetime_value_max_get(const Evas_Object* obj, Efl_Time* maxtime) {
    if (!TimePicker::of(obj))
        return forward(__func__, &elm_datetime_value_max_get, obj, maxtime);
    return EINA_FALSE;
}

DEVICE_EXTERN_C_END

bool host::dateTimeIsInterposed() {
    Dl_info mine = {};
    Dl_info called = {};
    void* first = dlsym(RTLD_DEFAULT, "elm_datetime_value_get");
    if (!first || !dladdr(first, &called) ||
        !dladdr(reinterpret_cast<void*>(&host::dateTimeIsInterposed), &mine))
        return false;
    return called.dli_fbase == mine.dli_fbase;
}

// The toolkit still calls its interface for screen readers a beta.
#define EFL_BETA_API_SUPPORT
#define EFL_ACCESS_OBJECT_PROTECTED
#define EFL_ACCESS_WIDGET_ACTION_PROTECTED
#include <Elementary.h>

#include <string>
#include <string_view>

#include <dlfcn.h>

#include "Accessible.h"
#include "FocusActions.h"
#include "FocusList.h"
#include "FocusNavigator.h"
#include "ReadableRow.h"
#include "RowParts.h"
#include "device/export.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

// Screen readers press buttons, but the toolkit gives them nothing to press a row with, and names
// a row only while it is drawn. The function below comes before the toolkit's own: rows of lists
// are made of a class that has all this. The toolkit itself goes on to know them by the class that
// it is derived from.

extern "C" const Efl_Class* elm_genlist_item_class_get(void);

namespace {

const Efl_Class* readableRowClass();

/** Whether keys could reach it: a popup covers what lies below. */
bool isInReach(const Elm_Object_Item* row) {
    const Evas_Object* list = elm_object_item_widget_get(row);
    const Evas_Object* root = host::focusRoot(elm_object_top_widget_get(list));
    const Evas_Object* object = list;
    while (object && object != root)
        object = elm_object_parent_widget_get(object);
    return !root || object;
}

Eina_Bool pressRow(Evas_Object* row, const char*) {
    if (!host::canPressRow(row) || !isInReach(row))
        return EINA_FALSE;
    host::FocusNavigator::reach(row);
    host::activate({host::FocusKind::Row, nullptr, nullptr, row, 0, {}});
    return EINA_TRUE;
}

const Efl_Access_Action_Data* actionsOf(const Eo* row, void*) {
    static const Efl_Access_Action_Data pressable[] = {{"click", "click", nullptr, pressRow},
                                                       {nullptr, nullptr, nullptr, nullptr}};
    return host::canPressRow(row) ? pressable : pressable + 1;
}

/** What a row is called that has only controls. */
std::string namesIn(const Elm_Object_Item* row) {
    std::string all;
    for (Evas_Object* control : host::controlsOfRow(row)) {
        const std::string name = host::readName(control);
        if (!name.empty())
            all += (all.empty() ? "" : ", ") + name;
    }
    return all;
}

/** Whoever asks for a name does not free it. */
struct RowData {
    Eina_Stringshare* name;
};

/** What it says, or what its screen calls it, or else what is in it. */
const char* nameOf(const Eo* row, void* data) {
    if (!elm_object_item_data_get(row))
        return "";
    std::string name = host::textsOfRow(row);
    if (name.empty()) {
        const char* given = efl_access_object_i18n_name_get(efl_super(row, readableRowClass()));
        name = given && *given ? given : namesIn(row);
    }
    auto* kept = static_cast<RowData*>(data);
    eina_stringshare_replace(&kept->name, name.c_str());
    return kept->name;
}

void destroy(Eo* row, void* data) {
    eina_stringshare_del(static_cast<RowData*>(data)->name);
    efl_destructor(efl_super(row, readableRowClass()));
}

Efl_Access_Role roleOf(const Eo* row, void*) {
    return elm_object_item_data_get(row)
               ? efl_access_object_role_get(efl_super(row, readableRowClass()))
               : EFL_ACCESS_ROLE_FILLER;
}

bool isMarked(const Elm_Object_Item* row) {
    for (const Evas_Object* control : host::controlsOfRow(row)) {
        const std::string_view type = elm_object_widget_type_get(control);
        if (host::actsForItself(control))
            continue;
        if (type == "Elm_Check" || type == "Elm_Radio")
            return STATE_TYPE_GET(efl_access_object_state_set_get(control),
                                  EFL_ACCESS_STATE_TYPE_CHECKED);
    }
    return false;
}

Efl_Access_State_Set statesOf(const Eo* row, void*) {
    Efl_Access_State_Set states =
        efl_access_object_state_set_get(efl_super(row, readableRowClass()));
    if (isMarked(row))
        STATE_TYPE_SET(states, EFL_ACCESS_STATE_TYPE_CHECKED);
    // The toolkit goes on to call a row focused that keys have left.
    if (const auto hasFocus = host::FocusNavigator::hasFocus(row)) {
        if (*hasFocus)
            STATE_TYPE_SET(states, EFL_ACCESS_STATE_TYPE_FOCUSED);
        else
            STATE_TYPE_UNSET(states, EFL_ACCESS_STATE_TYPE_FOCUSED);
    }
    return states;
}

Eina_Bool fillClass(Efl_Class* rowClass) {
    EFL_OPS_DEFINE(functions, EFL_OBJECT_OP_FUNC(efl_destructor, destroy),
                   EFL_OBJECT_OP_FUNC(efl_access_object_i18n_name_get, nameOf),
                   EFL_OBJECT_OP_FUNC(efl_access_object_role_get, roleOf),
                   EFL_OBJECT_OP_FUNC(efl_access_object_state_set_get, statesOf),
                   EFL_OBJECT_OP_FUNC(efl_access_widget_action_elm_actions_get, actionsOf));
    return efl_class_functions_set(rowClass, &functions, nullptr);
}

constexpr Efl_Class_Description ROW_CLASS = {
    EO_VERSION, "Device.Row", EFL_CLASS_TYPE_REGULAR, sizeof(RowData), fillClass, nullptr, nullptr};
EFL_DEFINE_CLASS(readableRowClass, &ROW_CLASS, elm_genlist_item_class_get(),
                 EFL_ACCESS_WIDGET_ACTION_MIXIN, nullptr)

bool& hasLists() {
    static bool has = false;
    return has;
}

} // namespace

void host::makeRowsReadable() {
    hasLists() = true;
}

DEVICE_EXTERN_C_BEGIN

DEVICE_API Eo* _efl_add_internal_start(const char* file, int line, const Efl_Class* objectClass,
                                       Eo* parent, Eina_Bool ref, Eina_Bool isFallback) {
    static const auto stock = reinterpret_cast<decltype(&_efl_add_internal_start)>(
        dlsym(RTLD_NEXT, "_efl_add_internal_start"));
    if (!stock) {
        LOG_ERROR("_efl_add_internal_start: the toolkit has no such function");
        return nullptr;
    }
    // Asked before the toolkit has started, it would make the class too early.
    const bool isRow = hasLists() && objectClass == elm_genlist_item_class_get();
    return stock(file, line, isRow ? readableRowClass() : objectClass, parent, ref, isFallback);
}

DEVICE_EXTERN_C_END

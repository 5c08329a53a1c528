// The toolkit still calls its interface for screen readers a beta.
#define EFL_BETA_API_SUPPORT
#define EFL_ACCESS_OBJECT_PROTECTED
#include <Elementary.h>

#include <array>
#include <string_view>

#include <libintl.h>

#include "Accessible.h"
#include "EvasLists.h"
#include "RowParts.h"
#include "TimeWheel.h"

namespace host {

namespace {

constexpr std::array<std::string_view, 3> NAMELESS = {"Elm_Check", "Elm_Radio", "Elm_Entry"};
constexpr std::array<std::string_view, 5> CONTROLS = {"Elm_Check", "Elm_Radio", "Elm_Entry",
                                                      "Elm_Slider", "Elm_Button"};

template <std::size_t N>
bool isOneOf(const std::array<std::string_view, N>& types, const Evas_Object* object) {
    const char* type =
        elm_object_widget_check(object) ? elm_object_widget_type_get(object) : nullptr;
    return type && std::find(types.begin(), types.end(), type) != types.end();
}

void collectControls(Evas_Object* object, std::vector<Evas_Object*>& controls) {
    if (isOneOf(CONTROLS, object) || TimeWheel::of(object)) {
        if (evas_object_visible_get(object))
            controls.push_back(object);
        return;
    }
    for (Evas_Object* member : membersOf(object))
        collectControls(member, controls);
}

/** What is in a row is there once the row is drawn. */
void drawn(void* list, Evas*, void*) {
    if (!elm_config_atspi_mode_get())
        return;
    auto* object = static_cast<Evas_Object*>(list);
    for (Elm_Object_Item* row : takeList<Elm_Object_Item>(elm_genlist_realized_items_get(object)))
        nameControlsInRow(row);
}

void listDeleted(void*, Evas* canvas, Evas_Object* list, void*) {
    evas_event_callback_del_full(canvas, EVAS_CALLBACK_RENDER_POST, drawn, list);
}

} // namespace

std::vector<Evas_Object*> controlsOfRow(const Elm_Object_Item* row) {
    std::vector<Evas_Object*> controls;
    for (Evas_Object* content : contentsOfRow(row))
        collectControls(content, controls);
    return controls;
}

void nameControlsInRow(const Elm_Object_Item* row) {
    const std::string name = textsOfRow(row);
    if (name.empty())
        return;
    for (Evas_Object* control : controlsOfRow(row))
        if (isOneOf(NAMELESS, control) && readName(control) != name)
            setReadName(control, name);
}

void setReadName(Evas_Object* widget, const std::string& name) {
    efl_access_object_i18n_name_set(widget, name.c_str());
    // The toolkit's own macro for it is C.
    static char property[] = "i18n_name";
    if (elm_config_atspi_mode_get())
        efl_access_object_event_emit(widget, EFL_ACCESS_OBJECT_EVENT_PROPERTY_CHANGED, property);
}

std::string readName(const Evas_Object* widget) {
    const char* name = efl_access_object_i18n_name_get(widget);
    return name ? name : "";
}

void setReadTextId(Evas_Object* widget, const char* textId) {
    efl_access_object_translation_domain_set(widget, textdomain(nullptr));
    efl_access_object_i18n_name_set(widget, textId);
}

void setReadAsSpinner(Evas_Object* widget) {
    efl_access_object_role_set(widget, EFL_ACCESS_ROLE_SPIN_BUTTON);
}

void tellFocus(Eo* thing) {
    if (elm_config_atspi_mode_get())
        efl_access_state_changed_signal_emit(thing, EFL_ACCESS_STATE_TYPE_FOCUSED, EINA_TRUE);
}

void focusSilently(Evas_Object* widget) {
    const Efl_Access_Type type = efl_access_object_access_type_get(widget);
    efl_access_object_access_type_set(widget, EFL_ACCESS_TYPE_DISABLED);
    elm_object_focus_set(widget, EINA_TRUE);
    efl_access_object_access_type_set(widget, type);
}

void nameControlsInRows(Evas_Object* list) {
    evas_event_callback_add(evas_object_evas_get(list), EVAS_CALLBACK_RENDER_POST, drawn, list);
    evas_object_event_callback_add(list, EVAS_CALLBACK_DEL, listDeleted, nullptr);
}

} // namespace host

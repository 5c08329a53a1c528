// The toolkit still calls its interface for screen readers a beta.
#define EFL_BETA_API_SUPPORT
#define EFL_ACCESS_OBJECT_PROTECTED
#define EFL_ACCESS_ACTION_PROTECTED
#include <Elementary.h>

#include "support/ScreenReader.h"

#include <set>
#include <utility>

#include <gtest/gtest.h>

namespace {

/** Roles of what only holds other things, or decorates them. */
bool isPlain(const std::string& role) {
    static const std::set<std::string> roles = {
        "filler", "image", "list", "notification", "panel", "page tab", "page tab list", "window"};
    return roles.contains(role);
}

std::string text(const char* text) {
    return text == nullptr ? "" : text;
}

bool hasAction(const Eo* object) {
    if (!efl_isa(object, EFL_ACCESS_ACTION_MIXIN)) {
        return false;
    }
    Eina_List* const actions = efl_access_action_actions_get(object);
    const bool some = actions != nullptr;
    eina_list_free(actions);
    return some;
}

/** Whether a person can see it: the toolkit calls shown what a list has put aside. */
bool isDrawn(const Evas_Object* object) {
    for (const Evas_Object* o = object; o != nullptr; o = evas_object_smart_parent_get(o)) {
        for (const Evas_Object* clip = o; clip != nullptr; clip = evas_object_clip_get(clip)) {
            if (evas_object_visible_get(clip) == EINA_FALSE) {
                return false;
            }
        }
    }
    return true;
}

void collect(Eo* object, std::vector<ReadThing>& things) {
    const Efl_Access_State_Set states = efl_access_object_state_set_get(object);
    const auto is = [states](Efl_Access_State_Type state) {
        return STATE_TYPE_GET(states, state) != 0;
    };
    if (!is(EFL_ACCESS_STATE_TYPE_VISIBLE)) {
        return;
    }
    const std::string role = text(efl_access_object_role_name_get(object));
    const bool isRow = role == "list item";
    const bool isSeen = is(EFL_ACCESS_STATE_TYPE_SHOWING) &&
                        (!efl_isa(object, EFL_CANVAS_OBJECT_CLASS) || isDrawn(object));
    if (!isPlain(role) && (isRow || isSeen)) {
        things.push_back({object, role, text(efl_access_object_i18n_name_get(object)),
                          is(EFL_ACCESS_STATE_TYPE_CHECKED), is(EFL_ACCESS_STATE_TYPE_FOCUSED),
                          !is(EFL_ACCESS_STATE_TYPE_SENSITIVE), hasAction(object)});
    }
    Eina_List* children = efl_access_object_access_children_get(object);
    while (children != nullptr) {
        collect(static_cast<Eo*>(eina_list_data_get(children)), things);
        children = eina_list_remove_list(children, children);
    }
}

} // namespace

std::string ReadThing::line() const {
    return role + " | " + name + (checked ? " | checked" : "") + (disabled ? " | disabled" : "");
}

ScreenReader::ScreenReader() : _handler(efl_access_object_event_handler_add(stateChangedCb, this)) {
    elm_config_atspi_mode_set(EINA_TRUE);
}

ScreenReader::~ScreenReader() {
    efl_access_object_event_handler_del(static_cast<Efl_Access_Event_Handler*>(_handler));
    elm_config_atspi_mode_set(EINA_FALSE);
}

void ScreenReader::stateChangedCb(void* data, const Efl_Event* event) {
    if (event->desc != EFL_ACCESS_OBJECT_EVENT_STATE_CHANGED) {
        return;
    }
    const auto* change = static_cast<const Efl_Access_Event_State_Changed_Data*>(event->info);
    if (change->type == EFL_ACCESS_STATE_TYPE_FOCUSED && change->new_value != EINA_FALSE) {
        static_cast<ScreenReader*>(data)->_focusTold.push_back(
            text(efl_access_object_role_name_get(event->object)) + " | " +
            text(efl_access_object_i18n_name_get(event->object)));
    }
}

std::vector<std::string> ScreenReader::takeFocusTold() {
    return std::exchange(_focusTold, {});
}

std::vector<ReadThing> ScreenReader::things(Eo* root) {
    std::vector<ReadThing> all;
    if (root == nullptr) {
        ADD_FAILURE() << "there is nothing to read";
        return all;
    }
    collect(root, all);
    return all;
}

std::vector<std::string> ScreenReader::lines(Eo* root) {
    std::vector<std::string> all;
    for (const ReadThing& thing : things(root)) {
        all.push_back(thing.line());
    }
    return all;
}

std::vector<std::string> ScreenReader::announced(Eo* window) {
    std::vector<std::string> texts;
    Eina_List* children = efl_access_object_access_children_get(window);
    while (children != nullptr) {
        auto* const child = static_cast<Eo*>(eina_list_data_get(children));
        const std::string name = text(efl_access_object_i18n_name_get(child));
        if (text(efl_access_object_role_name_get(child)) == "notification" && !name.empty()) {
            texts.push_back(name);
        }
        children = eina_list_remove_list(children, children);
    }
    return texts;
}

bool ScreenReader::press(Eo* root, const std::string& role, const std::string& name) {
    for (const ReadThing& thing : things(root)) {
        if (thing.role == role && thing.name == name) {
            return thing.pressable && efl_access_action_do(thing.object, 0) != EINA_FALSE;
        }
    }
    ADD_FAILURE() << "there is no " << role << " \"" << name << "\"";
    return false;
}

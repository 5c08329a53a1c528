// The toolkit still calls its interface for screen readers a beta.
#define EFL_BETA_API_SUPPORT
#define EFL_ACCESS_OBJECT_PROTECTED
#include <libintl.h>

#include <Elementary.h>

#include "app_assist/WAccessible.h"

namespace app_assist {

void setAccessibleName(Evas_Object* widget, const std::string& name) {
    if (widget == nullptr) {
        return;
    }
    efl_access_object_i18n_name_set(widget, name.c_str());
    // The toolkit's own macro for it is C.
    static char property[] = "i18n_name";
    if (elm_config_atspi_mode_get()) {
        efl_access_object_event_emit(widget, EFL_ACCESS_OBJECT_EVENT_PROPERTY_CHANGED, property);
    }
}

void setAccessibleTextId(Evas_Object* widget, const char* textId) {
    if (widget == nullptr) {
        return;
    }
    efl_access_object_translation_domain_set(widget, textdomain(nullptr));
    efl_access_object_i18n_name_set(widget, textId);
}

void prepareAnnouncements(Evas_Object* widget) {
    if (widget != nullptr) {
        efl_access_object_role_set(widget, EFL_ACCESS_ROLE_NOTIFICATION);
    }
}

void announce(Evas_Object* widget, const std::string& text) {
    if (widget == nullptr) {
        return;
    }
    setAccessibleName(widget, text);
    if (elm_config_atspi_mode_get()) {
        efl_access_state_changed_signal_emit(widget, EFL_ACCESS_STATE_TYPE_SHOWING, EINA_TRUE);
    }
}

void endAnnouncement(Evas_Object* widget) {
    if (widget == nullptr) {
        return;
    }
    setAccessibleName(widget, "");
    if (elm_config_atspi_mode_get()) {
        efl_access_state_changed_signal_emit(widget, EFL_ACCESS_STATE_TYPE_SHOWING, EINA_FALSE);
    }
}

} // namespace app_assist

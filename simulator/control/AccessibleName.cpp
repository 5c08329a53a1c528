#include "AccessibleName.h"

// The toolkit offers names to programs only in the part that it calls beta.
#define EFL_BETA_API_SUPPORT
#include <Elementary.h>
#include <efl_access_object.eo.h>

namespace simulator::control {

void setAccessibleName(Evas_Object* widget, const std::string& name) {
    efl_access_object_i18n_name_set(widget, name.c_str());
}

std::string accessibleName(const Evas_Object* widget) {
    const char* name = efl_access_object_i18n_name_get(widget);
    return name == nullptr ? "" : name;
}

} // namespace simulator::control

#include "FaceWindow.h"

#include <cstring>

namespace host {

namespace {

/** A program may have a window beside the face. */
bool isFace(const Ecore_Evas* window) {
    constexpr int FACE_SIZE = 360;
    int width = 0;
    int height = 0;
    ecore_evas_geometry_get(window, nullptr, nullptr, &width, &height);
    return width == FACE_SIZE && height == FACE_SIZE;
}

} // namespace

Ecore_Evas* faceWindow() {
    Ecore_Evas* found = nullptr;
    Eina_List* const all = ecore_evas_ecore_evas_list_get();
    for (const Eina_List* at = all; at; at = eina_list_next(at)) {
        auto* ee = static_cast<Ecore_Evas*>(eina_list_data_get(at));
        if (ecore_evas_visibility_get(ee) && isFace(ee) && (!found || ecore_evas_focus_get(ee)))
            found = ee;
    }
    eina_list_free(all);
    return found;
}

bool isInMemory(const Ecore_Evas* window) {
    return std::strcmp(ecore_evas_engine_name_get(window), "buffer") == 0;
}

} // namespace host

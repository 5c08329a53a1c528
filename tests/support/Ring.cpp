// The toolkit still calls its interface for screen readers a beta.
#define EFL_BETA_API_SUPPORT
#define EFL_ACCESS_OBJECT_PROTECTED
#include <Elementary.h>

#include "support/Ring.h"

#include <algorithm>
#include <functional>
#include <set>
#include <string_view>

#include <gtest/gtest.h>

namespace {

using Visitor = std::function<void(Evas_Object*)>;

void walk(Evas_Object* object, const Visitor& visit) {
    visit(object);
    static const std::set<std::string_view> drawn = {
        "rectangle", "line",    "polygon", "text",     "textblock",       "textgrid",
        "image",     "vectors", "vg",      "snapshot", "efl.canvas.image"};
    if (drawn.contains(evas_object_type_get(object))) {
        return;
    }
    Eina_List* const members = evas_object_smart_members_get(object);
    for (const Eina_List* l = members; l != nullptr; l = eina_list_next(l)) {
        walk(static_cast<Evas_Object*>(eina_list_data_get(l)), visit);
    }
    eina_list_free(members);
}

bool isOn(const Evas_Object* edje, const char* part, std::string_view state) {
    double value = 0;
    const char* const now = edje_object_part_exists(edje, part)
                                ? edje_object_part_state_get(edje, part, &value)
                                : nullptr;
    return now != nullptr && now == state &&
           evas_object_visible_get(edje_object_part_object_get(edje, part));
}

Evas_Object* partObject(const Evas_Object* edje, const char* part) {
    // The toolkit hands it out for looking only.
    return const_cast<Evas_Object*>(edje_object_part_object_get(edje, part));
}

/** What draws the ring; a calendar rings one of its days, an index says in the middle where it is.
 */
Evas_Object* ringOf(const Evas_Object* edje) {
    if (isOn(edje, "focus", "focused") || isOn(edje, "focus", "turning")) {
        const bool isSeen = !edje_object_part_exists(edje, "said") || isOn(edje, "said", "active");
        return isSeen ? partObject(edje, "focus") : nullptr;
    }
    for (int day = 0; day < 42 && edje_object_part_exists(edje, "cit_0_focus"); ++day) {
        const std::string part = "cit_" + std::to_string(day) + "_focus";
        if (isOn(edje, part.c_str(), "focused")) {
            return partObject(edje, part.c_str());
        }
    }
    return nullptr;
}

std::string textOf(const Stage& stage, Evas_Object* edje) {
    std::vector<Evas_Object*> inside;
    walk(edje, [&](Evas_Object* object) { inside.push_back(object); });
    for (const FoundText& text : stage.texts()) {
        if (std::ranges::find(inside, text.object) != inside.end()) {
            return text.text;
        }
    }
    return {};
}

Evas_Object* widgetOf(Evas_Object* object) {
    while (object != nullptr && !elm_object_widget_check(object)) {
        object = evas_object_smart_parent_get(object);
    }
    return object;
}

std::string nameOf(const Stage& stage, Evas_Object* edje, const std::string& type) {
    const std::string text = textOf(stage, edje);
    const char* const read = type == "Elm_Button" && text.empty()
                                 ? efl_access_object_i18n_name_get(widgetOf(edje))
                                 : nullptr;
    if (read != nullptr && *read != '\0') {
        return read;
    }
    return text.empty() ? type : text;
}

} // namespace

std::vector<Ringed> ringed(const Stage& stage) {
    std::vector<Ringed> found;
    for (Evas_Object* object = evas_object_bottom_get(stage.canvas()); object != nullptr;
         object = evas_object_above_get(object)) {
        if (evas_object_smart_parent_get(object) != nullptr) {
            continue;
        }
        walk(object, [&](Evas_Object* inner) {
            Evas_Object* const ring =
                std::string_view(evas_object_type_get(inner)) == "edje" ? ringOf(inner) : nullptr;
            if (ring == nullptr || !stage.canBeSeen(inner)) {
                return;
            }
            Evas_Object* const widget = widgetOf(inner);
            const std::string type = widget == nullptr ? "" : elm_object_widget_type_get(widget);
            found.push_back({nameOf(stage, inner, type), type, inner, ring, Stage::area(inner)});
        });
    }
    return found;
}

Ringed theRinged(const Stage& stage) {
    const auto found = ringed(stage);
    EXPECT_EQ(found.size(), 1U);
    return found.empty() ? Ringed{"-", "", nullptr, nullptr, {}} : found.front();
}

std::string ringedName(const Stage& stage) {
    const auto found = ringed(stage);
    return found.empty() ? "-" : found.front().name;
}

#include <algorithm>
#include <cmath>
#include <memory>
#include <sstream>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include <dlfcn.h>

#include <Elementary.h>

#include "Accessible.h"
#include "EvasLists.h"
#include "ReadableRow.h"
#include "RowRim.h"
#include "ThemeNames.h"
#include "device/export.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

// The toolkit's lists know of no round face. This function comes before the toolkit's own: rows of
// its lists shrink toward the rim, so that the rim cuts none of them. What is drawn smaller is also
// touched where it is drawn.

namespace {

/** Between the rim and what must be seen. */
constexpr double MARGIN = 2;
/** So far a list is scrolled when its upper end has become soft. */
constexpr double FADE_WAY = 16;
/** So long a list stands before the row in the middle may show what it has no room for. */
constexpr double REST_SECONDS = 1.0;
constexpr const char* ROW_KEY = "device-host.genlist.row";
constexpr const char* LIST_KEY = "device-host.genlist.rest";

struct Area {
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;

    bool operator==(const Area&) const = default;
};

Area areaOf(const Evas_Object* object) {
    Area area;
    evas_object_geometry_get(object, &area.x, &area.y, &area.width, &area.height);
    return area;
}

/** How a row is drawn, and what is known of it apart from its place. */
struct RimRow {
    std::vector<Area> parts; ///< Within the row.
    bool known = false;
    Area area; ///< Where it is drawn, and how.
    host::RimLook look;
    Ecore_Job* job = nullptr;
};

/** Where the face is: all of the canvas, moved along with a page that slides. */
struct Face {
    double middleX = 0;
    double middleY = 0;
    double radius = 0;
};

const Evas_Object* listOf(const Evas_Object* row) {
    const Evas_Object* list = evas_object_smart_parent_get(row);
    while (list && !elm_object_widget_check(list))
        list = evas_object_smart_parent_get(list);
    return list;
}

Face faceOf(const Evas_Object* list) {
    int width = 0;
    int height = 0;
    evas_output_viewport_get(evas_object_evas_get(list), nullptr, nullptr, &width, &height);
    Face face{width / 2.0, height / 2.0, std::min(width, height) / 2.0 - MARGIN};
    for (const Evas_Object* o = list; o; o = evas_object_smart_parent_get(o)) {
        const Area area = areaOf(o);
        if (area.width >= width) {
            face.middleX += area.x;
            break;
        }
    }
    return face;
}

/** The parts that the theme names for the rim, or else all that the row is filled with. */
std::string namesOfParts(const Evas_Object* row) {
    if (const char* named = edje_object_data_get(row, host::theme::DATA_RIM))
        return named;
    std::string names;
    for (const char* kind : {"texts", "contents"})
        if (const char* filled = edje_object_data_get(row, kind))
            names.append(filled).append(" ");
    return names;
}

void measure(const Evas_Object* row, RimRow& rim) {
    rim.parts.clear();
    std::istringstream names(namesOfParts(row));
    for (std::string name; names >> name;) {
        Area part;
        if (edje_object_part_geometry_get(row, name.c_str(), &part.x, &part.y, &part.width,
                                          &part.height) &&
            part.width > 0 && part.height > 0)
            rim.parts.push_back(part);
    }
    rim.known = true;
}

std::vector<host::RimBox> boxesOf(const RimRow& rim, const Area& row, const Face& face) {
    std::vector<host::RimBox> boxes;
    for (const Area& part : rim.parts) {
        const double left = row.x + part.x - face.middleX;
        const double top = row.y + part.y - face.middleY;
        boxes.push_back(
            {std::max(std::abs(left), std::abs(left + part.width)), top, top + part.height});
    }
    return boxes;
}

host::RimEdges edgesOf(const Evas_Object* list, const Face& face) {
    const Area seen = areaOf(list);
    const double top = seen.y - face.middleY;
    return {top, top + seen.height, face.radius};
}

void draw(Evas_Object* row, const host::RimLook& look, const Face& face) {
    if (look.scale >= 1) {
        evas_object_map_enable_set(row, EINA_FALSE);
        return;
    }
    Evas_Map* map = evas_map_new(4);
    evas_map_util_points_populate_from_object(map, row);
    evas_map_util_zoom(map, look.scale, look.scale, static_cast<Evas_Coord>(face.middleX),
                       static_cast<Evas_Coord>(std::lround(face.middleY + look.anchor)));
    const int light = static_cast<int>(std::lround(255 * look.opacity));
    evas_map_util_points_color_set(map, light, light, light, light);
    evas_map_smooth_set(map, EINA_TRUE);
    evas_map_alpha_set(map, EINA_TRUE);
    evas_object_map_set(row, map);
    evas_object_map_enable_set(row, EINA_TRUE);
    evas_map_free(map);
}

RimRow* rimOf(const Evas_Object* row) {
    return static_cast<RimRow*>(evas_object_data_get(row, ROW_KEY));
}

void place(Evas_Object* row, RimRow& rim) {
    const Area area = areaOf(row);
    const Evas_Object* list = listOf(row);
    if (!list || area.width <= 0 || area.height <= 0)
        return;
    if (!rim.known)
        measure(row, rim);
    const Face face = faceOf(list);
    const double top = area.y - face.middleY;
    const auto look =
        host::rimLook(top, top + area.height, boxesOf(rim, area, face), edgesOf(list, face));
    // A map moves its row, as callbacks see it.
    if (rim.area == area && rim.look == look)
        return;
    rim.area = area;
    rim.look = look;
    draw(row, look, face);
}

void rowMoved(void* rim, Evas*, Evas_Object* row, void*) {
    place(row, *static_cast<RimRow*>(rim));
}

void placeLater(void* data) {
    auto* row = static_cast<Evas_Object*>(data);
    RimRow* rim = rimOf(row);
    rim->job = nullptr;
    rim->known = false;
    rim->area = {};
    place(row, *rim);
}

/** A row hears of its new size before its parts do. */
void rowResized(void* data, Evas*, Evas_Object* row, void*) {
    auto* rim = static_cast<RimRow*>(data);
    rim->known = false;
    if (!rim->job)
        rim->job = ecore_job_add(placeLater, row);
}

void rowDeleted(void* data, Evas*, Evas_Object* row, void*) {
    const std::unique_ptr<RimRow> rim(static_cast<RimRow*>(data));
    evas_object_event_callback_del_full(row, EVAS_CALLBACK_MOVE, rowMoved, data);
    evas_object_event_callback_del_full(row, EVAS_CALLBACK_RESIZE, rowResized, data);
    evas_object_data_del(row, ROW_KEY);
    if (rim->job)
        ecore_job_del(rim->job);
}

void adopt(Evas_Object* row) {
    if (rimOf(row))
        return;
    auto rim = std::make_unique<RimRow>();
    rim->job = ecore_job_add(placeLater, row);
    evas_object_data_set(row, ROW_KEY, rim.get());
    evas_object_event_callback_add(row, EVAS_CALLBACK_MOVE, rowMoved, rim.get());
    evas_object_event_callback_add(row, EVAS_CALLBACK_RESIZE, rowResized, rim.get());
    evas_object_event_callback_add(row, EVAS_CALLBACK_DEL, rowDeleted, rim.release());
}

bool isRow(const Evas_Object* object) {
    const char* group = nullptr;
    if (std::string_view(evas_object_type_get(object)) == "edje")
        edje_object_file_get(object, nullptr, &group);
    return group && std::string_view(group).starts_with("elm/genlist/item");
}

/** Hands each row of a list to `visit`. The toolkit itself keeps them to itself. */
template <typename Visit>
void eachRow(const Evas_Object* list, const Visit& visit) {
    const Evas_Object* edje = elm_layout_edje_get(list);
    const Evas_Object* pan =
        edje ? edje_object_part_swallow_get(edje, host::theme::PART_LIST_ROWS) : nullptr;
    Eina_List* members = pan ? evas_object_smart_members_get(pan) : nullptr;
    for (const Eina_List* l = members; l; l = eina_list_next(l)) {
        auto* member = static_cast<Evas_Object*>(eina_list_data_get(l));
        if (isRow(member))
            visit(member);
    }
    eina_list_free(members);
}

/** Whether a list stands. */
struct ListRest {
    Evas_Object* list = nullptr;
    Ecore_Timer* timer = nullptr;
    bool isTold = false;
};

bool isInTheMiddle(const Evas_Object* row, double middle) {
    const Area area = areaOf(row);
    return area.y <= middle && middle < area.y + area.height;
}

Eina_Bool listRests(void* data) {
    auto* rest = static_cast<ListRest*>(data);
    const Area seen = areaOf(rest->list);
    const double middle = std::clamp(faceOf(rest->list).middleY, 1.0 * seen.y,
                                     std::max(1.0 * seen.y, seen.y + seen.height - 1.0));
    rest->timer = nullptr;
    rest->isTold = true;
    eachRow(rest->list, [&](Evas_Object* row) {
        if (isInTheMiddle(row, middle))
            edje_object_signal_emit(row, host::theme::SIGNAL_ROW_CENTRED,
                                    host::theme::SIGNAL_SOURCE);
    });
    return ECORE_CALLBACK_CANCEL;
}

void listMoves(const Evas_Object* list) {
    auto* rest = static_cast<ListRest*>(evas_object_data_get(list, LIST_KEY));
    if (!rest)
        return;
    if (std::exchange(rest->isTold, false))
        eachRow(list, [](Evas_Object* row) {
            edje_object_signal_emit(row, host::theme::SIGNAL_ROW_MOVED, host::theme::SIGNAL_SOURCE);
        });
    if (rest->timer)
        ecore_timer_reset(rest->timer);
    else
        rest->timer = ecore_timer_add(REST_SECONDS, listRests, rest);
}

void listDeleted(void* data, Evas*, Evas_Object* list, void*) {
    const std::unique_ptr<ListRest> rest(static_cast<ListRest*>(data));
    evas_object_data_del(list, LIST_KEY);
    if (rest->timer)
        ecore_timer_del(rest->timer);
}

void watchRest(Evas_Object* list) {
    auto rest = std::make_unique<ListRest>();
    rest->list = list;
    evas_object_data_set(list, LIST_KEY, rest.get());
    evas_object_event_callback_add(list, EVAS_CALLBACK_DEL, listDeleted, rest.release());
}

/** Rows end softly below what stands above a list, once there are some there. */
void soften(const Evas_Object* list) {
    int y = 0;
    elm_scroller_region_get(list, nullptr, &y, nullptr, nullptr);
    Edje_Message_Float message = {std::clamp(y / FADE_WAY, 0.0, 1.0)};
    Evas_Object* edje = elm_layout_edje_get(list);
    edje_object_message_send(edje, EDJE_MESSAGE_FLOAT, host::theme::MESSAGE_FADE, &message);
    edje_object_message_signal_process(edje);
}

void listScrolled(void*, Evas_Object* list, void*) {
    listMoves(list);
    soften(list);
}

/** What changed in a row behind a popup or another page would stay as it was drawn before. */
void drawAnew(const Evas_Object* list) {
    eachRow(list, [](Evas_Object* row) {
        RimRow* rim = rimOf(row);
        if (!rim)
            return;
        // Without being switched off first, the next map is clipped by the list before it shrinks.
        evas_object_map_enable_set(row, EINA_FALSE);
        evas_object_map_set(row, nullptr);
        rim->area = {};
        place(row, *rim);
    });
}

/** Texts of several lines begin where the first letter's script does, unless they are told. */
void beginWhereRowsDo(const Evas_Object* row, Evas_BiDi_Direction direction) {
    for (Evas_Object* member : host::membersOf(row))
        if (std::string_view(evas_object_type_get(member)) == "textblock")
            evas_object_paragraph_direction_set(member, direction);
}

/** Also when a row is filled anew, with what it was drawn in before. */
void rowRealized(void*, Evas_Object* list, void*) {
    const Evas_BiDi_Direction direction =
        elm_object_mirrored_get(list) ? EVAS_BIDI_DIRECTION_RTL : EVAS_BIDI_DIRECTION_INHERIT;
    eachRow(list, [direction](Evas_Object* row) {
        beginWhereRowsDo(row, direction);
        adopt(row);
    });
    drawAnew(list);
    // A list that was turned round has forgotten how soft it was.
    soften(list);
    listMoves(list);
}

void listChanged(void*, Evas*, Evas_Object* list, void*) {
    drawAnew(list);
}

} // namespace

DEVICE_EXTERN_C_BEGIN

DEVICE_API Evas_Object* elm_genlist_add(Evas_Object* parent) {
    static const auto stock =
        reinterpret_cast<decltype(&elm_genlist_add)>(dlsym(RTLD_NEXT, "elm_genlist_add"));
    Evas_Object* list = stock && parent ? stock(parent) : nullptr;
    if (!list) {
        LOG_ERROR("A list needs a parent");
        return nullptr;
    }
    host::makeRowsReadable();
    host::nameControlsInRows(list);
    watchRest(list);
    evas_object_smart_callback_add(list, "realized", rowRealized, nullptr);
    evas_object_smart_callback_add(list, "scroll", listScrolled, nullptr);
    evas_object_event_callback_add(list, EVAS_CALLBACK_MOVE, listChanged, nullptr);
    evas_object_event_callback_add(list, EVAS_CALLBACK_RESIZE, listChanged, nullptr);
    return list;
}

DEVICE_API void elm_genlist_item_fields_update(Elm_Object_Item* item, const char* parts,
                                               Elm_Genlist_Item_Field_Type types) {
    static const auto stock = reinterpret_cast<decltype(&elm_genlist_item_fields_update)>(
        dlsym(RTLD_NEXT, "elm_genlist_item_fields_update"));
    if (!stock || !item) {
        LOG_ERROR("A row is needed");
        return;
    }
    stock(item, parts, types);
    drawAnew(elm_object_item_widget_get(item));
}

DEVICE_EXTERN_C_END

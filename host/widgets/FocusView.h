/**
 * @file
 * @brief What of a page can have the focus, in the order of reading.
 */
#pragma once

#include <optional>
#include <vector>

#include <Elementary.h>

#include "FocusRules.h"

namespace host {

/** Something that can have the focus. Its pointers are good until the main loop turns. */
struct FocusThing {
    FocusKind kind = FocusKind::Button;
    Evas_Object* object = nullptr;   ///< The widget, or the list of a row.
    Evas_Object* list = nullptr;     ///< The list that it is in; null outside of lists.
    Elm_Object_Item* item = nullptr; ///< The row that it is or is in.
    int place = 0;                   ///< Among the things of its row.
    FocusBox box;
};

/** @brief True when both are the same thing, perhaps made anew. */
bool isSame(const FocusThing& a, const FocusThing& b);

FocusBox boxOf(const Evas_Object* object);
/** @brief Where a row is; nothing while it has no picture. */
std::optional<FocusBox> boxOfRow(Elm_Object_Item* item);

/** @brief What can have the focus in and below some objects, in the order of reading. */
std::vector<FocusThing> thingsIn(const std::vector<Evas_Object*>& objects, bool mirrored);

/** @brief The page or popup of a window that keys are for; null when there is none. */
Evas_Object* focusRoot(const Evas_Object* window);

/** @brief A look at a page or popup as it is now. */
class FocusView {
public:
    explicit FocusView(Evas_Object* root);

    bool empty() const { return _parts.empty(); }
    bool mirrored() const;
    std::optional<FocusThing> first() const { return edge(0, 1); }
    std::optional<FocusThing> last() const;
    /** What lies nearest to the middle of the face. */
    std::optional<FocusThing> nearest() const;
    /** The next one in a direction; a row out of sight comes into sight. */
    std::optional<FocusThing> beside(const FocusThing& thing, int direction) const;
    /** The same thing as it is now, brought into sight. */
    std::optional<FocusThing> find(const FocusThing& thing) const { return find(thing, true); }
    /** The same thing as it is now, if it is in sight. */
    std::optional<FocusThing> seen(const FocusThing& thing) const { return find(thing, false); }
    /** A thing of a row by the row's place in its list. */
    std::optional<FocusThing> inRow(int index, int place) const;
    std::optional<FocusThing> under(int x, int y) const;
    /** A button that is always in sight; null when there is none. */
    Evas_Object* button() const;

private:
    /** A list, or things that stand together. */
    struct Part {
        Evas_Object* list = nullptr;
        std::vector<FocusThing> things;
        FocusBox box;
    };
    friend class FocusCollector;

    std::optional<FocusThing> edge(std::size_t part, int direction) const;
    std::optional<FocusThing> find(const FocusThing& thing, bool scroll) const;
    std::vector<FocusThing> inSight() const;

    Evas_Object* _root;
    std::vector<Part> _parts;
};

} // namespace host

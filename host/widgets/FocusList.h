/**
 * @file
 * @brief What of a list can have the focus.
 */
#pragma once

#include <optional>
#include <vector>

#include "FocusView.h"

namespace host {

/**
 * @brief A look at a list as it is now.
 *
 * A row with controls in it has the focus through them. Switches and marks are no controls of their
 * own here: their row does the same. Where it does not, the theme says so, and the row comes before
 * them. A row without data only takes room.
 */
class FocusList {
public:
    explicit FocusList(Evas_Object* list) : _list(list) {}

    /** The first thing in sight, seen in a direction. */
    std::optional<FocusThing> edge(int direction) const;
    std::optional<FocusThing> beside(const FocusThing& thing, int direction) const;
    /** @param scroll Brings its row into sight; else one out of sight is not found. */
    std::optional<FocusThing> find(const FocusThing& thing, bool scroll) const;
    std::optional<FocusThing> inRow(int index, int place) const;
    /** Everything whose middle is in sight, from the top. */
    std::vector<FocusThing> inSight() const;

private:
    std::vector<FocusThing> inItem(Elm_Object_Item* item) const;
    bool isInSight(const FocusThing& thing) const;

    Evas_Object* _list;
};

/** @brief False for a switch or a mark that does what its row does; the row's theme tells. */
bool actsForItself(const Evas_Object* mark);

/** @brief True for a row that does something when it is tapped. */
bool canPressRow(const Elm_Object_Item* item);

/** @brief Scrolls the list of a thing so that the thing comes to its middle. */
void bringToMiddle(const FocusThing& thing);

} // namespace host

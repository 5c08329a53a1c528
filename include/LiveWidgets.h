/**
 * @file
 * @brief Widgets of a row that come and go with its realisations.
 */
#pragma once

#include <vector>

#include <Evas.h>

#include "ClockUiExport.h"

/**
 * @brief The living widgets of one kind that a row has made.
 *
 * A list asks a row for its content whenever it likes: to measure it, after an update, when it
 * scrolls back into view. So a row may have none, one or several widgets of a kind for a while.
 */
class CLOCK_UI_EXPORT LiveWidgets {
public:
    LiveWidgets() = default;
    ~LiveWidgets();
    LiveWidgets(const LiveWidgets&) = delete;
    LiveWidgets& operator=(const LiveWidgets&) = delete;

    /** @brief Adds a widget; it leaves by itself when it dies. */
    void add(Evas_Object* widget);
    /** @brief The living widget that was added last; null when there is none. */
    Evas_Object* newest() const { return _widgets.empty() ? nullptr : _widgets.back(); }
    /**
     * @brief Whether a list may show a widget again instead of asking for a new one.
     * @param widget What the list has kept; may be null.
     * @return The widget, or null when it is not the newest one or renew() was called since.
     */
    Evas_Object* reusable(Evas_Object* widget) const;
    /** @brief Lets no widget made so far be shown again. */
    void renew() { _outdated = true; }
    /** @brief Every living widget, the newest last. */
    const std::vector<Evas_Object*>& all() const { return _widgets; }

private:
    static void _deletedCb(void* data, Evas* evas, Evas_Object* widget, void* info);

    std::vector<Evas_Object*> _widgets;
    bool _outdated = false;
};

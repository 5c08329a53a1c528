// The rows of the city list, filled in over several turns of the main loop.
#pragma once

#include <cstddef>
#include <functional>
#include <vector>

#include <Elementary.h>

#include <clock/ClockWorldClockDbData.h>

/**
 * A list of thousands of rows takes longer to fill than a person waits for a key press. The rows
 * that can be seen are appended at once, the rest a few at a time once those have been drawn.
 */
class CityRows {
public:
    /** @param filled Called once the rows are there, if that took more than one turn. */
    explicit CityRows(std::function<void()> filled = nullptr);
    ~CityRows();
    CityRows(const CityRows&) = delete;
    CityRows& operator=(const CityRows&) = delete;

    /** Shows cities in an empty list. The cities must outlive the list's rows. */
    void show(Evas_Object* genlist, Elm_Genlist_Item_Class* itemClass,
              std::vector<ClockWorldClockDbData*> cities);
    /** Makes an index item lead to the row of a city, as soon as that is there. */
    void link(Elm_Object_Item* indexItem, std::size_t place);
    /** Appends what is missing, at once. */
    void complete();
    /** Leaves the list as it is; index items that lead nowhere yet stay so. */
    void stop();

private:
    struct Link {
        Elm_Object_Item* indexItem;
        std::size_t place;
    };

    static Eina_Bool _nextRowsCb(void* data);
    static void _genlistDeletedCb(void* data, Evas* evas, Evas_Object* genlist, void* info);

    void appendUpTo(std::size_t end);
    void linkAppended();

    Evas_Object* _genlist = nullptr;
    Elm_Genlist_Item_Class* _itemClass = nullptr;
    std::vector<ClockWorldClockDbData*> _cities;
    std::vector<Elm_Object_Item*> _items;
    std::vector<Link> _links;
    Ecore_Timer* _timer = nullptr;
    std::function<void()> _filled;
};

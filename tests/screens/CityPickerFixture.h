/**
 * @file
 * @brief The city picker on the face, over a plain page.
 */
#pragma once

#include <initializer_list>
#include <string>
#include <vector>

#include <app_assist/WContentViewController.h>
#include <clock/ClockWorldClockDbData.h>

#include "WorldClockAddCityViewController.h"
#include "support/ScreenTest.h"

class CityPickerFixture : public ScreenTest {
protected:
    void SetUp() override;
    void TearDown() override;

    /** Leaves only these cities in the world, before the picker opens. */
    void worldOf(const std::vector<std::string>& cityIds);
    /** Takes the city database away, before the picker opens. */
    void loseWorld();

    /** Opens the picker for the clock's own list. */
    void openPicker(int position = 0);
    /** Opens the picker for another application. */
    void openPickerFor(app_control_h request);

    bool isOpen() const { return static_cast<bool>(_alive); }
    WorldClockAddCityViewController& picker() { return *_picker; }
    /** The list; null while it is replaced by the words that nothing was found.
     */
    Evas_Object* genlist();
    Evas_Object* index();
    Evas_Object* entry();
    Evas_Object* locationButton();

    /** Taps the entry and types. */
    void search(const std::string& text);
    /** Empties the entry as a person does with the delete key. */
    void eraseSearch();
    void locate() { stage().tap(locationButton()); }

    /** Waits until every row is there. */
    void fill();
    std::vector<Elm_Object_Item*> items();
    static ClockWorldClockDbData& cityOf(Elm_Object_Item* item);
    /** The identifiers of the listed cities. */
    std::vector<std::string> cities();
    /** A text of a row, with its markup. */
    static std::string markupOf(Elm_Object_Item* item, const char* part);
    Elm_Object_Item* rowOf(const std::string& cityId);
    /** Scrolls to the row of a city and taps it. */
    void tapCity(const std::string& cityId);

    /** The labels of the index. */
    std::vector<std::string> hours();
    /** Where an hour of the index leads. */
    std::string firstCityOf(const std::string& hour);
    bool showsFastScroll();

    /** The city's record as it is stored. */
    static ClockWorldClockDbData stored(const std::string& cityId);
    /** Error lines without those that say what the picker does. */
    std::vector<std::string> failures();

    std::vector<ClockWorldClockDbData> returned;

private:
    void open(WorldClockAddCityViewController* picker);
    Evas_Object* part(std::initializer_list<const char*> path);
    Evas_Object* fastScroll();
    std::string ownResources();

    WorldClockAddCityViewController* _picker = nullptr;
    app_assist::WWeakPtr<app_assist::WViewController> _alive;
    std::string _resources;
};

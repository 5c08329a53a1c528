/**
 * @file
 * @brief The city picker of the world clock.
 */
#pragma once

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include <Elementary.h>

#include <app_assist/WContentViewController.h>
#include <clock/ClockEventListener.h>
#include <clock/ClockWorldClockDbData.h>
#include <device/app_control.h>

#include "ClockUiExport.h"
#include "WorldClockAddCityCallerType.h"

class CityRows;
class ListDisposal;
class WorldClockAddCityItem;

namespace rules {
class CitySearch;
}

/**
 * @brief The page on which a city is chosen from all cities of the world.
 *
 * Cities are in the order of their GMT offsets. A search text, or the country of the mobile
 * network, narrows the list. The chosen city goes to the clock application's list or to the
 * application that asked for it, and the page closes.
 */
class CLOCK_UI_EXPORT WorldClockAddCityViewController : public app_assist::WContentViewController,
                                                        public ClockEventListener {
public:
    /** @param position Place that the chosen city gets in the list of the world clock. */
    explicit WorldClockAddCityViewController(int position);
    /**
     * @param callerType Who opened the picker.
     * @param request The request that is answered; not owned, may be null.
     */
    WorldClockAddCityViewController(WorldClockAddCityCallerType callerType, app_control_s* request);
    ~WorldClockAddCityViewController() override;

    /**
     * @brief Sets what gets the city that was added to the world clock. Replaces the earlier
     * function.
     *
     * Choosing a city while there is none raises std::bad_function_call.
     */
    void setCityDataReturnFunc(const std::function<void(ClockWorldClockDbData&)>& func);

    const char* getClassName() const override;
    Elm_Object_Item* onPushToNaviframe(Evas_Object* naviframe) override;
    /** @brief Adds the back button and the title. */
    void onPushed(Elm_Object_Item* naviItem) override;
    void onEvent(ClockEventListener::EventType event) override;

    /** @brief Sends a city to the application that asked for one. */
    void _sendReplyToCaller(const ClockWorldClockDbData& city);

    /** @name Widget callbacks; data is the picker.
     *  @{ */
    static void _searchEntryChangedCb(void* data, Evas_Object* entry, void* info);
    static void _searchIconActivatedCb(void* data, Evas_Object* entry, void* info);
    static void _searchEntryMaxLengthReachtedCb(void* data, Evas_Object* entry, void* info);
    static void _locationBtnClickedCb(void* data, Evas_Object* button, void* info);
    static void _indexSelectedCb(void* data, Evas_Object* index, void* item);
    static void _indexChangedCb(void* data, Evas_Object* index, void* item);
    static void _genlistSelectedCb(void* data, Evas_Object* genlist, void* item);
    static void _genlistScrolledCb(void* data, Evas_Object* genlist, void* info);
    /** @} */

    /** @name Which cities are shown, and in which order.
     *  @{ */
    /** @brief True when a's offset is smaller, or the same and a's name is not after b's. */
    static bool _cityItemCompareByGmtOffset(const ClockWorldClockDbData& a,
                                            const ClockWorldClockDbData& b);
    /** @brief True unless a's translated name comes after b's. */
    static bool _cityItemCompareByName(const ClockWorldClockDbData& a,
                                       const ClockWorldClockDbData& b);
    /** @brief The number in "GMT+05:30", with minutes as a decimal fraction: 5.3. */
    static float _getGmtOffset(const char* timezone);
    /** @brief Whether a text is found in "<city>, <country>" of one city. */
    static bool _isIncludeSearchText(const ClockWorldClockDbData& city,
                                     const std::string& searchText);
    /** @brief Whether a list of mobile country codes holds a code. */
    static bool _isMccValueMatched(const char* code, const char* list);
    /** @} */

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void* param) override;

private:
    static void _backBtnClickedCb(void* data, Evas_Object* button, void* info);
    static void _genlistDeletedCb(void* data, Evas* evas, Evas_Object* genlist, void* info);

    void prepare();
    Evas_Object* addLayout(Evas_Object* parent, const char* theme, const char* group,
                           const char* style);

    // Search bar, index and list.
    void _createSearchBar(Evas_Object* parent);
    void createSearchEntry(Evas_Object* layout);
    void setGuideText();
    void _createIndex(Evas_Object* parent);
    void _createGenlist(Evas_Object* parent);
    void _hideKeypad();
    void showIndexed(Elm_Object_Item* indexItem);

    // Which cities are shown.
    void loadCities();
    void _updateGenlist(const std::string& searchText);
    void emptyGenlist();
    std::vector<ClockWorldClockDbData*> chooseCities(const std::string& searchText);
    std::vector<ClockWorldClockDbData*> findCities(const std::string& searchText);
    std::vector<ClockWorldClockDbData*> citiesOfCountry();
    void fillIndex(const std::vector<ClockWorldClockDbData*>& cities);
    void showResults(std::size_t count);
    void showNoContents();
    rules::CitySearch& citySearch();

    // Locating.
    void _showLocationErrorToast();

    // Returning a city.
    bool addToWorldClock(ClockWorldClockDbData& city);

    Evas_Object* _fastscrollLayout = nullptr;
    Evas_Object* _editField = nullptr;
    Evas_Object* _searchEntry = nullptr;
    Evas_Object* _index = nullptr;
    Evas_Object* _genlist = nullptr;
    Evas_Object* _noContentsLayout = nullptr;
    int _newCityPosition = 0;
    /** Country code that the list is narrowed to; empty for all countries. */
    std::string _mcc;
    /** Text whose cities are shown; none while the list is narrowed to a country. */
    std::optional<std::string> _shownText;
    std::vector<ClockWorldClockDbData> _cityList;
    WorldClockAddCityCallerType _callerType = ADD_CITY_CALLER_WORLD_CLOCK;
    app_control_s* _appControl = nullptr;
    std::function<void(ClockWorldClockDbData&)> _cityDataReturnFunc;
    std::unique_ptr<WorldClockAddCityItem> _cityItem;
    std::unique_ptr<rules::CitySearch> _search;
    std::unique_ptr<CityRows> _rows;
    std::unique_ptr<ListDisposal> _oldLists;
};

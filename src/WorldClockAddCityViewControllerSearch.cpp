// Which cities the picker shows: all, those of a search, or those of a country.
#define LOG_TAG "WORLDCLOCK"
#include "WorldClockAddCityViewController.h"

#include <array>
#include <cstdlib>
#include <memory>
#include <optional>

#include <base/Log.h>
#include <clock/ClockText.h>
#include <device/i18n.h>

#include "CityRows.h"
#include "ItemClass.h"
#include "ListDisposal.h"
#include "NullData.h"
#include "WorldClockAddCityItem.h"
#include "rules/CitySearch.h"
#include "rules/GmtOffset.h"
#include "rules/NetworkCode.h"

namespace {

constexpr std::int32_t MAX_SEARCH_UNITS = 20;
constexpr std::size_t SEARCH_BUFFER_UNITS = 1024;
// With no more rows than this there is nothing to scroll fast.
constexpr std::size_t FEW_ROWS = 10;
// Longer lists are not emptied but replaced.
constexpr unsigned QUICKLY_EMPTIED_ROWS = 128;

using Text = std::unique_ptr<char, decltype(&std::free)>;

} // namespace

void WorldClockAddCityViewController::_searchEntryChangedCb(void* data, Evas_Object* entry, void*) {
    RETURN_IF_NULL(data);
    if (!elm_object_focus_get(entry)) {
        LOG_ERROR("do not work changed callback :: this changed signal is come "
                  "from locatio button "
                  "clicked event");
        return;
    }
    const Text utf8(elm_entry_markup_to_utf8(elm_entry_entry_get(entry)), &std::free);
    const std::string text = utf8 ? utf8.get() : "";
    std::array<i18n_uchar, SEARCH_BUFFER_UNITS + 1> units{};
    i18n_ustring_copy_ua_n(units.data(), text.c_str(), SEARCH_BUFFER_UNITS);
    if (i18n_ustring_get_length(units.data()) > MAX_SEARCH_UNITS) {
        LOG_ERROR("length is exceeded max");
        return;
    }
    auto* self = static_cast<WorldClockAddCityViewController*>(data);
    self->_mcc.clear();
    // A key press that ends a composition changes both texts.
    if (self->_shownText != text)
        self->_updateGenlist(text);
}

void WorldClockAddCityViewController::_updateGenlist(const std::string& searchText) {
    if (!_index) {
        LOG_ERROR("index or genlist is not created yet. please create before call "
                  "update function");
        return;
    }
    if (!_searchEntry) {
        LOG_ERROR("entry is not created yet");
        return;
    }
    if (_mcc.empty())
        _shownText = searchText;
    else
        _shownText.reset();
    emptyGenlist();
    elm_index_item_clear(_index);
    _cityItem = std::make_unique<WorldClockAddCityItem>();
    const ItemClass itemClass(_cityItem->getItemClassNew());
    const std::vector<ClockWorldClockDbData*> cities = chooseCities(searchText);
    _rows->show(_genlist, itemClass.get(), cities);
    fillIndex(cities);
    showResults(cities.size());
}

void WorldClockAddCityViewController::emptyGenlist() {
    _rows->stop();
    if (!_genlist) {
        LOG_ERROR("create genlist");
        if (_noContentsLayout) {
            evas_object_del(
                elm_object_part_content_unset(_fastscrollLayout, "elm.swallow.content"));
            _noContentsLayout = nullptr;
        }
        _createGenlist(_fastscrollLayout);
    } else if (elm_genlist_items_count(_genlist) <= QUICKLY_EMPTIED_ROWS) {
        elm_genlist_clear(_genlist);
    } else {
        _oldLists->add(elm_object_part_content_unset(_fastscrollLayout, "elm.swallow.content"));
        _createGenlist(_fastscrollLayout);
    }
}

std::vector<ClockWorldClockDbData*>
WorldClockAddCityViewController::chooseCities(const std::string& searchText) {
    if (!_mcc.empty())
        return citiesOfCountry();
    if (!searchText.empty())
        return findCities(searchText);
    std::vector<ClockWorldClockDbData*> all;
    all.reserve(_cityList.size());
    for (ClockWorldClockDbData& city : _cityList) {
        city.searchKeyword.clear();
        all.push_back(&city);
    }
    return all;
}

std::vector<ClockWorldClockDbData*>
WorldClockAddCityViewController::findCities(const std::string& searchText) {
    std::vector<ClockWorldClockDbData*> found;
    for (const std::size_t place : citySearch().find(searchText)) {
        ClockWorldClockDbData& city = _cityList.at(place);
        city.searchKeyword = searchText;
        found.push_back(&city);
    }
    return found;
}

std::vector<ClockWorldClockDbData*> WorldClockAddCityViewController::citiesOfCountry() {
    std::vector<ClockWorldClockDbData*> inCountry;
    for (ClockWorldClockDbData& city : _cityList) {
        if (!_isMccValueMatched(_mcc.c_str(), city.mcc.c_str()))
            continue;
        city.searchKeyword.clear();
        inCountry.push_back(&city);
    }
    return inCountry;
}

rules::CitySearch& WorldClockAddCityViewController::citySearch() {
    std::string locale = rules::searchLocale();
    if (!_search || _search->locale() != locale)
        _search = std::make_unique<rules::CitySearch>(_cityList, locale);
    return *_search;
}

void WorldClockAddCityViewController::fillIndex(const std::vector<ClockWorldClockDbData*>& cities) {
    rules::IndexHours hours;
    for (std::size_t place = 0; place < cities.size(); ++place) {
        const std::optional<int> hour = hours.next(cities[place]->timezone.c_str());
        if (!hour)
            continue;
        const std::string label = std::to_string(*hour);
        _rows->link(elm_index_item_append(_index, label.c_str(), nullptr, nullptr), place);
    }
}

void WorldClockAddCityViewController::showResults(std::size_t count) {
    if (count > FEW_ROWS) {
        elm_layout_signal_emit(_fastscrollLayout, "elm,state,fastscroll,show", "");
        elm_index_level_go(_index, 0);
        return;
    }
    elm_layout_signal_emit(_fastscrollLayout, "elm,state,fastscroll,hide", "");
    if (count == 0)
        showNoContents();
}

void WorldClockAddCityViewController::showNoContents() {
    evas_object_del(elm_object_part_content_unset(_fastscrollLayout, "elm.swallow.content"));
    _genlist = nullptr;
    _noContentsLayout = addLayout(_fastscrollLayout, "layout", "nocontents", "search");
    elm_object_domain_translatable_part_text_set(_noContentsLayout, "elm.text", CLOCK_TEXT_DOMAIN,
                                                 "IDS_CLOCK_NPBODY_NO_SEARCH_RESULTS");
    elm_object_part_content_set(_fastscrollLayout, "elm.swallow.content", _noContentsLayout);
}

float WorldClockAddCityViewController::_getGmtOffset(const char* timezone) {
    return rules::gmtOffset(timezone);
}

bool WorldClockAddCityViewController::_isIncludeSearchText(const ClockWorldClockDbData& city,
                                                           const std::string& searchText) {
    return rules::isIncludeSearchText(city, searchText);
}

bool WorldClockAddCityViewController::_isMccValueMatched(const char* code, const char* list) {
    return rules::isMccValueMatched(code, list);
}

#include "WorldClockViewController.h"

#include <algorithm>
#include <iterator>
#include <utility>

#include "TimeText.h"
#include "WorldClockAddCityViewController.h"
#include "WorldClockItem.h"
#include "app_assist/WNaviframeController.h"
#include "clock/ClockText.h"
#include "clock/ClockWorldClockDbModel.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {
namespace {

constexpr ListPageTexts TEXTS{.title = "IDS_WCL_HEADER_WORLD_CLOCK",
                              .other = "IDS_ALM_HEADER_ALARM",
                              .add = "IDS_WCL_OPT_ADDCITY",
                              .empty = "IDS_WCL_BODY_NO_CITIES"};

} // namespace

WorldClockViewController::WorldClockViewController(std::string theme)
    : ListPage(std::move(theme), TEXTS) {}

WorldClockViewController::~WorldClockViewController() = default;

const char* WorldClockViewController::getClassName() const {
    return "WorldClockViewController";
}

void WorldClockViewController::onOtherTapped() {
    popOut();
}

void WorldClockViewController::addCity() {
    if (!isOnTop())
        return;
    auto* picker =
        new WorldClockAddCityViewController(ClockWorldClockDbModel().getWorldClockNextPosition());
    // The picker lies above this page and cannot outlive it. The page refreshes when it is on top.
    picker->setCityDataReturnFunc([this](ClockWorldClockDbData& city) { _shownKey = city.index; });
    getNaviframeController()->push(picker);
}

void WorldClockViewController::askToRemove(const ClockWorldClockDbData& city) {
    ListPage::askToRemove({.title = [city] { return clockText(city.city.c_str()); },
                           .name = "",
                           .textId = "IDS_WCL_POP_REMOVE_CITY_FROM_LIST"},
                          [this, city] { remove(city); });
}

void WorldClockViewController::remove(const ClockWorldClockDbData& city) {
    std::vector<int> keys;
    std::transform(_cities.begin(), _cities.end(), std::back_inserter(keys),
                   [](const ClockWorldClockDbData& other) { return other.index; });
    // The model tells why it cannot.
    ClockWorldClockDbModel().removeWorldClockDbRecord(city);
    _shownKey = neighbourOf(keys, city.index).value_or(NONE);
    scheduleRefresh();
}

Elm_Object_Item* WorldClockViewController::appendRows() {
    ClockWorldClockDbModel().getWorldClockSelectedCityList(_cities);
    const bool twelveHour = isTwelveHour();
    const int shownKey = std::exchange(_shownKey, NONE);
    Elm_Object_Item* shown = nullptr;
    for (const ClockWorldClockDbData& city : _cities) {
        Elm_Object_Item* item = append(
            new WorldClockItem(city, twelveHour, [this](const ClockWorldClockDbData& tapped) {
                askToRemove(tapped);
            }));
        if (city.index == shownKey)
            shown = item;
    }
    return shown;
}

} // namespace simulator

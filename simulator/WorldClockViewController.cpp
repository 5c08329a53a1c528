#include "WorldClockViewController.h"

#include <algorithm>
#include <ctime>
#include <utility>

#include "TimeText.h"
#include "WorldClockAddCityViewController.h"
#include "WorldClockItem.h"
#include "app_assist/WNaviframeController.h"
#include "app_assist/WPopupController.h"
#include "clock/ClockText.h"
#include "clock/ClockWorldClockDbModel.h"
#include "rules/RingDay.h"

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

void WorldClockViewController::onCreated() {
    ListPage::onCreated();
    waitForNextMinute();
}

void WorldClockViewController::onDestroy() {
    _minuteTimer.reset();
    ListPage::onDestroy();
}

void WorldClockViewController::onOtherTapped() {
    popOut();
}

void WorldClockViewController::waitForNextMinute() {
    _minuteTimer.reset(
        ecore_timer_add(rules::secondsToNextMinute(std::time(nullptr)), _minuteCb, this));
}

Eina_Bool WorldClockViewController::_minuteCb(void* data) {
    auto* self = static_cast<WorldClockViewController*>(data);
    if (self == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return ECORE_CALLBACK_CANCEL;
    }
    self->updateRows();
    // The main loop deletes the timer of a callback that cancels.
    static_cast<void>(self->_minuteTimer.release());
    self->waitForNextMinute();
    return ECORE_CALLBACK_CANCEL;
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
    if (!isOnTop())
        return;
    auto* popup = new app_assist::WPopupController();
    popup->setOnAddProperties([](Evas_Object* o) {
        elm_popup_align_set(o, ELM_NOTIFY_ALIGN_FILL, 1.0);
        elm_object_domain_translatable_part_text_set(o, nullptr, nullptr,
                                                     "IDS_WCL_POP_REMOVE_CITY_FROM_LIST");
    });
    const auto labelled = [](const char* id) {
        return [id](Evas_Object* button) {
            elm_object_domain_translatable_text_set(button, nullptr, id);
        };
    };
    popup->addButton("", {}, labelled("IDS_COM_SK_CANCEL"));
    popup->addButton(
        "", [this, city](bool*) { remove(city); }, labelled("IDS_COM_SK_REMOVE"));
    attachPopup(popup);
    _question = popup->getWeakPtr();
    _questionedCity = city.city;
    nameCity();
}

void WorldClockViewController::nameCity() {
    elm_object_part_text_set(_question->getEvasObj(), "title,text",
                             markupOf(clockText(_questionedCity.c_str())).c_str());
}

void WorldClockViewController::onEvent(EventType type) {
    ListPage::onEvent(type);
    if (type == LANGUAGE_CHANGED && _question)
        nameCity();
}

void WorldClockViewController::remove(const ClockWorldClockDbData& city) {
    // The model tells why it cannot.
    ClockWorldClockDbModel().removeWorldClockDbRecord(city);
    _shownKey = neighbourOf(city);
    scheduleRefresh();
}

int WorldClockViewController::neighbourOf(const ClockWorldClockDbData& city) const {
    const auto place =
        std::find_if(_cities.begin(), _cities.end(), [&city](const ClockWorldClockDbData& other) {
            return other.index == city.index;
        });
    if (place == _cities.end() || _cities.size() == 1)
        return NONE;
    return place + 1 == _cities.end() ? (place - 1)->index : (place + 1)->index;
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

#define LOG_TAG "WORLDCLOCK"
#include "WorldClockAddCityItem.h"

#include <cstdlib>
#include <cstring>
#include <memory>
#include <string>
#include <string_view>

#include <base/Log.h>
#include <clock/ClockText.h>
#include <clock/ClockWorldClockDbData.h>
#include <device/ea.h>

#include "rules/CityHighlight.h"

namespace {

using Text = std::unique_ptr<char, decltype(&std::free)>;

Text highlighted(const std::string& id, const std::string& keyword) {
    return {WorldClockAddCityItem::_addTextHighLight(id.empty() ? "" : clockText(id.c_str()),
                                                     keyword.c_str()),
            &std::free};
}

std::string nameLine(const ClockWorldClockDbData& city) {
    const Text cityName = highlighted(city.city, city.searchKeyword);
    const Text countryName = highlighted(city.country, city.searchKeyword);
    return rules::cityLine(cityName ? cityName.get() : "", countryName ? countryName.get() : "",
                           city.cityOnly);
}

rules::TextColour highlightColour() {
    rules::TextColour colour;
    ea_theme_color_get("T1067", &colour.red, &colour.green, &colour.blue, &colour.alpha, nullptr,
                       nullptr, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr);
    return colour;
}

} // namespace

WorldClockAddCityItem::WorldClockAddCityItem() = default;

WorldClockAddCityItem::~WorldClockAddCityItem() = default;

Elm_Genlist_Item_Class* WorldClockAddCityItem::getItemClassNew() {
    Elm_Genlist_Item_Class* itemClass = elm_genlist_item_class_new();
    itemClass->item_style = "2line.top";
    itemClass->func.text_get = _getText;
    return itemClass;
}

char* WorldClockAddCityItem::_getText(void* data, Evas_Object*, const char* part) {
    if (!data) {
        LOG_ERROR("passed user data is nullptr");
        return nullptr;
    }
    const auto& city = *static_cast<ClockWorldClockDbData*>(data);
    const std::string_view name(part ? part : "");
    if (name == "elm.text.main.left.top")
        return strdup(nameLine(city).c_str());
    if (name == "elm.text.sub.left.bottom")
        return strdup(city.timezone.c_str());
    return nullptr;
}

char* WorldClockAddCityItem::_addTextHighLight(const char* text, const char* keyword) {
    if (!text) {
        LOG_ERROR("input text is nullptr");
        return nullptr;
    }
    return strdup(rules::highlight(text, keyword ? keyword : "", highlightColour).c_str());
}

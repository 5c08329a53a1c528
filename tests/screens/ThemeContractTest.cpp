#include <algorithm>
#include <fstream>
#include <iterator>
#include <regex>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include <Edje.h>
#include <gtest/gtest.h>

#include "../host/widgets/ThemeNames.h"
#include "support/ScreenTest.h"

namespace {

using namespace host::theme;

const std::string DEVICE = "device.edj";
const std::string ROWS = "AlarmCustomTheme.edj";
const std::string EDITOR = "AlarmEditViewController.edj";
const std::string CITIES = "WorldClockAddCityViewController.edj";
const std::string SIMULATOR = "simulator.edj";

std::string pathOf(const std::string& file) {
    return std::string(CLOCK_RESOURCE_DIR "/edje/") + file;
}

std::string pickerGroup(const std::string& style) {
    return std::string("elm/") + LAYOUT_CLASS + "/" + PICKER_GROUP + "/" + style;
}

std::vector<std::string> groupsOf(const std::string& file) {
    std::vector<std::string> names;
    Eina_List* list = edje_file_collection_list(pathOf(file).c_str());
    const Eina_List* node = nullptr;
    void* name = nullptr;
    EINA_LIST_FOREACH(list, node, name) {
        names.emplace_back(static_cast<const char*>(name));
    }
    edje_file_collection_list_free(list);
    return names;
}

/** What code asks of a theme: a group and the parts, signals aside, that it names. */
struct Contract {
    std::string file;
    std::string group;
    std::vector<std::string> parts;
};

using Contracts = std::vector<Contract>;

Contracts pages() {
    const std::vector<std::string> popupParts = {"elm.text.title", "elm.swallow.content",
                                                 "elm.swallow.action_area"};
    return {
        {ROWS, "elm/genlist/item/edit.theme.time/default", {"timepicker.area", "calendar.area"}},
        {ROWS,
         "elm/genlist/item_compress/edit.theme.time/default",
         {"timepicker.area", "calendar.area"}},
        {EDITOR, "edit.layout.calendar", {"date.text", "date.button"}},
        {EDITOR, "volume.normal.bg", {"icon"}},
        {EDITOR, "volume.vibrate.bg", {"icon"}},
        {EDITOR, "volume.mute.bg", {"icon"}},
        {DEVICE,
         "elm/naviframe/item/basic/default",
         {"title_left_btn", "title_right_btn", "more_btn", "elm.text.title", "elm.swallow.prev_btn",
          "elm.swallow.content"}},
        {DEVICE, "elm/button/base/default", {"elm.text", "elm.swallow.content"}},
        {DEVICE, "elm/button/base/naviframe/title_left", {"elm.text"}},
        {DEVICE, "elm/button/base/naviframe/title_right", {"elm.text"}},
        {DEVICE, "elm/button/base/naviframe/back_btn/default", {"elm.text", "arrow"}},
        {DEVICE, "elm/button/base/on_gradient_bg", {"elm.text"}},
        {DEVICE, "elm/button/base/popup", {"elm.text"}},
        {DEVICE, "elm/popup/base/default", popupParts},
        {DEVICE, "elm/popup/base/theme_bg", popupParts},
        {DEVICE, "elm/popup/base/theme,bg", popupParts},
        {DEVICE,
         "elm/popup/buttons2/popup/default",
         {"elm.swallow.content.button1", "elm.swallow.content.button2"}},
    };
}

Contracts searching() {
    return {
        {CITIES, "searchbar.layout", {"entry.part", "location.btn"}},
        {DEVICE, "elm/layout/application/default", {"elm.swallow.content"}},
        {DEVICE, "elm/layout/application/searchbar_base", {"searchbar", "elm.swallow.content"}},
        {DEVICE,
         "elm/layout/application/fastscroll",
         {"elm.swallow.fastscroll", "elm.swallow.content"}},
        {DEVICE, "elm/layout/nocontents/search", {"elm.text"}},
        {DEVICE,
         std::string("elm/") + LAYOUT_CLASS + "/" + FIELD_GROUP + "/" + STYLE_SEARCH,
         {PART_FIELD_ENTRY, PART_FIELD_BUTTON, "ring"}},
        {DEVICE, std::string("elm/button/base/") + STYLE_CLEAR_BUTTON, {"cross"}},
        {DEVICE, "elm/button/base/bg_animated", {"location"}},
        {DEVICE,
         "elm/index/base/vertical/default",
         {PART_INDEX_LABELS, "elm.swallow.event.0", "bubble", "elm.text"}},
        {DEVICE, "elm/index/item/vertical/default", {PART_INDEX_LABEL}},
    };
}

Contracts rowsAndControls() {
    return {
        {DEVICE, "elm/check/base/on&off", {"track", "knob"}},
        {DEVICE,
         "elm/slider/horizontal/default",
         {"elm.swallow.icon", "elm.swallow.bar", "elm.dragable.slider", "hold", "track", "level",
          "knob"}},
        {DEVICE, "elm/check/base/default", {"mark", "ring", "fill", "tick", "event"}},
        {DEVICE, "elm/radio/base/list", {"mark", "ring", "fill", "event"}},
        {DEVICE, "elm/layout/list/C/type.2/default", {"elm.swallow.content"}},
        {DEVICE,
         "elm/calendar/base/default",
         {"month_text", "elm,calendar,button,left", "elm,calendar,button,right"}},
        {DEVICE, "elm/button/base/calendar/decrease/default", {"arrow"}},
        {DEVICE, "elm/button/base/calendar/increase/default", {"arrow"}},
        {DEVICE, "elm/entry/base-single/default", {"elm.text", "elm.guide"}},
        {DEVICE, "elm/scroller/entry_single/default", {"elm.swallow.content", "line"}},
        {DEVICE,
         "elm/genlist/item_compress/entry.main/default",
         {"elm.text.main", "elm.icon.entry"}},
        {DEVICE,
         "elm/genlist/item_compress/2line.top/default",
         {"elm.text.main.left.top", "elm.text.sub.left.bottom"}},
        {DEVICE, "elm/genlist/item/1line/default", {"elm.text.main.left", "elm.icon.2"}},
        {DEVICE, "elm/genlist/item_compress/1icon/default", {"elm.icon"}},
        {DEVICE,
         "elm/genlist/item_compress/multiline_sub.main.1icon/default",
         {"elm.text.main", "elm.text.multiline", "elm.icon"}},
        {DEVICE, pickerGroup(STYLE_12_HOURS), {PART_HOUR, PART_MINUTE, PART_HALF, PART_SEPARATOR}},
        {DEVICE, pickerGroup(STYLE_24_HOURS), {PART_HOUR, PART_MINUTE, PART_HALF, PART_SEPARATOR}},
        {DEVICE, pickerGroup(STYLE_WHEEL), {PART_VALUES}},
        {DEVICE, GROUP_NUMBER, {PART_VALUE}},
        {DEVICE, GROUP_WORD, {PART_VALUE}},
    };
}

const Contracts& contracts() {
    static const Contracts all = [] {
        Contracts some = pages();
        for (const Contracts& more : {searching(), rowsAndControls()})
            some.insert(some.end(), more.begin(), more.end());
        return some;
    }();
    return all;
}

class ThemeContractTest : public ScreenTest {
protected:
    Evas_Object* open(const std::string& file, const std::string& group) {
        Evas_Object* edje = edje_object_add(stage().canvas());
        const bool opened =
            edje_object_file_set(edje, pathOf(file).c_str(), group.c_str()) != EINA_FALSE;
        EXPECT_TRUE(opened) << file << ": " << group << ": "
                            << edje_load_error_str(edje_object_load_error_get(edje));
        return edje;
    }
};

TEST_F(ThemeContractTest, EveryGroupAndPartThatCodeNamesExists) {
    for (const Contract& contract : contracts()) {
        Evas_Object* edje = open(contract.file, contract.group);
        for (const std::string& part : contract.parts) {
            EXPECT_TRUE(edje_object_part_exists(edje, part.c_str()))
                << contract.group << " has no part " << part;
        }
        evas_object_del(edje);
    }
}

TEST_F(ThemeContractTest, ASliderOpensNoWindowForItsValue) {
    Evas_Object* edje = open(DEVICE, "elm/slider/horizontal/default");
    EXPECT_FALSE(edje_object_part_exists(edje, "elm.track.slider"));
}

TEST_F(ThemeContractTest, EveryGroupOfEveryThemeOpens) {
    for (const std::string& file : {DEVICE, ROWS, EDITOR, CITIES, SIMULATOR}) {
        const auto groups = groupsOf(file);
        EXPECT_FALSE(groups.empty()) << file;
        for (const std::string& group : groups) {
            evas_object_del(open(file, group));
        }
    }
}

TEST_F(ThemeContractTest, EveryRowStyleExistsForBothKindsOfLists) {
    for (const std::string& file : {DEVICE, ROWS, SIMULATOR}) {
        const auto groups = groupsOf(file);
        for (const std::string& group : groups) {
            const std::string plain = "elm/genlist/item/";
            if (!group.starts_with(plain)) {
                continue;
            }
            const std::string compressed =
                "elm/genlist/item_compress/" + group.substr(plain.size());
            EXPECT_NE(std::find(groups.begin(), groups.end(), compressed), groups.end())
                << compressed;
        }
    }
}

TEST_F(ThemeContractTest, ACalendarHasSevenNamesAndSixWeeks) {
    Evas_Object* edje = open(DEVICE, "elm/calendar/base/default");
    for (int day = 0; day < 7; ++day) {
        const std::string name = "elm.ch_" + std::to_string(day) + ".text";
        EXPECT_TRUE(edje_object_part_exists(edje, name.c_str())) << name;
    }
    for (int cell = 0; cell < 42; ++cell) {
        const std::string name = "elm.cit_" + std::to_string(cell) + ".text";
        EXPECT_TRUE(edje_object_part_exists(edje, name.c_str())) << name;
    }
}

TEST_F(ThemeContractTest, TheContractIsWrittenForEveryGroup) {
    std::ifstream file(CLOCK_SOURCE_DIR "/docs/THEME.md");
    const std::string text((std::istreambuf_iterator<char>(file)), {});
    ASSERT_FALSE(text.empty());
    for (const Contract& contract : contracts()) {
        std::string group = contract.group;
        if (const auto at = group.find("item_compress"); at != std::string::npos) {
            group.replace(at, std::string("item_compress").size(), "item");
        }
        EXPECT_NE(text.find("`" + group + "`"), std::string::npos) << group;
        for (const std::string& part : contract.parts) {
            EXPECT_NE(text.find("`" + part + "`"), std::string::npos) << group << ": " << part;
        }
    }
}

/** As docs/THEME.md writes a group: one name for both kinds of lists, and for every side and style
 * of a popup. */
std::string documentedName(std::string group) {
    static const std::pair<std::regex, const char*> rules[] = {
        {std::regex("genlist/item_compress/"), "genlist/item/"},
        {std::regex("elm/notify/(?!block_events)\\w+/popup/.*"), "elm/notify/SIDE/popup/default"},
        {std::regex("(elm/popup/(?:content|buttons\\d)/popup|elm/notify/block_events/popup|"
                    "elm/label/base/popup)/.*"),
         "$1/default"},
        {std::regex("elm/button/base/popup/default"), "elm/button/base/popup"},
    };
    for (const auto& [form, name] : rules)
        group = std::regex_replace(group, form, name);
    return group;
}

std::string themePage() {
    std::ifstream file(CLOCK_SOURCE_DIR "/docs/THEME.md");
    return {std::istreambuf_iterator<char>(file), {}};
}

TEST_F(ThemeContractTest, EveryGroupIsDocumented) {
    const std::string page = themePage();
    for (const std::string& file : {DEVICE, ROWS, EDITOR, CITIES, SIMULATOR}) {
        for (const std::string& group : groupsOf(file))
            EXPECT_NE(page.find("`" + documentedName(group) + "`"), std::string::npos) << group;
    }
}

TEST_F(ThemeContractTest, EveryDocumentedGroupExists) {
    std::set<std::string> groups;
    for (const std::string& file : {DEVICE, ROWS, EDITOR, CITIES, SIMULATOR}) {
        for (const std::string& group : groupsOf(file))
            groups.insert({group, documentedName(group)});
    }
    // A word in capitals stands for several, and a slash at the end for what begins so.
    static const std::regex form("`((?:elm|device|simulator)/[^`A-Z]*[^`A-Z/])`");
    const std::string page = themePage();
    std::size_t count = 0;
    for (std::sregex_iterator match(page.begin(), page.end(), form), end; match != end; ++match) {
        const std::string name = (*match)[1];
        EXPECT_TRUE(groups.contains(name) || name.ends_with(".edc")) << name;
        ++count;
    }
    EXPECT_GT(count, 40U);
}

TEST_F(ThemeContractTest, TheColoursThatCodeNamesAreInTheTheme) {
    Evas_Object* edje = open(DEVICE, "elm/button/base/default");
    for (const char* name : {"accent", "warning", "ground", "text", "B0211", "T1067"}) {
        int r = -1;
        int g = -1;
        int b = -1;
        int a = 0;
        EXPECT_TRUE(edje_object_color_class_get(edje, name, &r, &g, &b, &a, nullptr, nullptr,
                                                nullptr, nullptr, nullptr, nullptr, nullptr,
                                                nullptr))
            << name;
        EXPECT_EQ(a, 255) << name;
    }
}

} // namespace

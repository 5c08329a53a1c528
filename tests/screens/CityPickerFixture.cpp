#include "screens/CityPickerFixture.h"

#include <algorithm>
#include <array>
#include <cstdlib>
#include <filesystem>
#include <initializer_list>
#include <memory>

#include <gmock/gmock.h>
#include <sqlite3.h>

#include <clock/ClockWorldClockDbModel.h>
#include <device/uxt.h>

namespace fs = std::filesystem;

namespace {

class PlainPage : public app_assist::WContentViewController {
protected:
    Evas_Object* onCreateView(Evas_Object* parent, void*) override {
        Evas_Object* const label = elm_label_add(parent);
        elm_object_text_set(label, "Page below");
        return label;
    }
};

void execute(const std::string& file, const std::string& sql) {
    sqlite3* database = nullptr;
    char* problem = nullptr;
    sqlite3_open(file.c_str(), &database);
    if (sqlite3_exec(database, sql.c_str(), nullptr, nullptr, &problem) != SQLITE_OK)
        ADD_FAILURE() << sql << ": " << (problem ? problem : "?");
    sqlite3_free(problem);
    sqlite3_close(database);
}

// The picker tells at error priority what it does.
constexpr std::array TOLD = {
    "create genlist",
    "Hide keyboard",
    "_callerType = ",
    "City selected :: ",
    "MCC from networ PLMN = ",
    "tapi handler2 is null",
    "do not work changed callback :: this changed signal is come from locatio "
    "button clicked event",
};

bool isTold(const std::string& line) {
    return std::any_of(TOLD.begin(), TOLD.end(),
                       [&](const char* told) { return line.starts_with(told); });
}

} // namespace

void CityPickerFixture::SetUp() {
    ScreenTest::SetUp();
    returned.clear();
}

void CityPickerFixture::TearDown() {
    takeStageDown();
    EXPECT_THAT(failures(), testing::IsEmpty());
    ScreenTest::TearDown();
    std::error_code ignored;
    if (!_resources.empty())
        fs::remove_all(_resources, ignored);
}

std::string CityPickerFixture::ownResources() {
    if (!_resources.empty())
        return _resources;
    _resources = (fs::temp_directory_path() / "resources-XXXXXX").string();
    if (!mkdtemp(_resources.data()))
        ADD_FAILURE() << "no temporary folder";
    for (const auto& entry : fs::directory_iterator(CLOCK_RESOURCE_DIR))
        if (entry.path().filename() != "data")
            fs::create_symlink(entry.path(), fs::path(_resources) / entry.path().filename());
    fs::create_directory(fs::path(_resources) / "data");
    device().setResourceRoot(_resources);
    return _resources;
}

void CityPickerFixture::worldOf(const std::vector<std::string>& cityIds) {
    const std::string file = ownResources() + "/data/world-clock.db";
    fs::copy_file(CLOCK_RESOURCE_DIR "/data/world-clock.db", file);
    fs::permissions(file, fs::perms::owner_write, fs::perm_options::add);
    std::string list;
    for (const std::string& id : cityIds)
        list += (list.empty() ? "'" : ", '") + id + "'";
    execute(file, "DELETE FROM city WHERE city NOT IN (" + list + ")");
}

void CityPickerFixture::loseWorld() {
    ownResources();
}

void CityPickerFixture::openPicker(int position) {
    auto* picker = new WorldClockAddCityViewController(position);
    picker->setCityDataReturnFunc(
        [this](ClockWorldClockDbData& city) { returned.push_back(city); });
    open(picker);
}

void CityPickerFixture::openPickerFor(app_control_h request) {
    open(new WorldClockAddCityViewController(ADD_CITY_CALLER_APP_CONTROL, request));
}

void CityPickerFixture::open(WorldClockAddCityViewController* picker) {
    if (!isOpen())
        stage().push(new PlainPage);
    _picker = picker;
    _alive = picker->getWeakPtr();
    stage().push(picker);
    fill();
}

Evas_Object* CityPickerFixture::part(std::initializer_list<const char*> path) {
    Evas_Object* object = _picker->getEvasObj();
    for (const char* name : path)
        object = object ? elm_object_part_content_get(object, name) : nullptr;
    return object;
}

Evas_Object* CityPickerFixture::fastScroll() {
    return part({"elm.swallow.content", "elm.swallow.content"});
}

Evas_Object* CityPickerFixture::genlist() {
    Evas_Object* content = elm_object_part_content_get(fastScroll(), "elm.swallow.content");
    const char* type = content ? elm_object_widget_type_get(content) : "";
    return std::string(type) == "Elm_Genlist" ? content : nullptr;
}

Evas_Object* CityPickerFixture::index() {
    return elm_object_part_content_get(fastScroll(), "elm.swallow.fastscroll");
}

Evas_Object* CityPickerFixture::entry() {
    return uxt_edit_field_layout_get_entry(
        part({"elm.swallow.content", "searchbar", "entry.part"}));
}

Evas_Object* CityPickerFixture::locationButton() {
    return part({"elm.swallow.content", "searchbar", "location.btn"});
}

void CityPickerFixture::search(const std::string& text) {
    stage().tap(entry());
    stage().type(text);
    fill();
}

void CityPickerFixture::eraseSearch() {
    stage().tap(entry());
    stage().key("End");
    const char* text = elm_entry_entry_get(entry());
    for (std::size_t characters = text ? std::string(text).size() : 0; characters > 0; --characters)
        stage().key("BackSpace");
    fill();
}

void CityPickerFixture::fill() {
    // Rows come a few at a time; the longest list is there after less than a
    // second.
    int count = -1;
    for (int turn = 0; turn < 100; ++turn) {
        const int before = count;
        Stage::frames(2);
        count = genlist() ? static_cast<int>(elm_genlist_items_count(genlist())) : 0;
        if (count == before)
            break;
    }
    stage().settle();
}

std::vector<Elm_Object_Item*> CityPickerFixture::items() {
    std::vector<Elm_Object_Item*> all;
    for (Elm_Object_Item* item = genlist() ? elm_genlist_first_item_get(genlist()) : nullptr; item;
         item = elm_genlist_item_next_get(item))
        all.push_back(item);
    return all;
}

ClockWorldClockDbData& CityPickerFixture::cityOf(Elm_Object_Item* item) {
    return *static_cast<ClockWorldClockDbData*>(elm_object_item_data_get(item));
}

std::vector<std::string> CityPickerFixture::cities() {
    std::vector<std::string> ids;
    for (Elm_Object_Item* item : items())
        ids.push_back(cityOf(item).city);
    return ids;
}

std::string CityPickerFixture::markupOf(Elm_Object_Item* item, const char* part) {
    const Elm_Genlist_Item_Class* itemClass = elm_genlist_item_item_class_get(item);
    char* text = itemClass->func.text_get(elm_object_item_data_get(item),
                                          elm_object_item_widget_get(item), part);
    std::string markup = text ? text : "(null)";
    std::free(text);
    return markup;
}

Elm_Object_Item* CityPickerFixture::rowOf(const std::string& cityId) {
    for (Elm_Object_Item* item : items())
        if (cityOf(item).city == cityId)
            return item;
    ADD_FAILURE() << cityId << " is not in the list";
    return nullptr;
}

void CityPickerFixture::tapCity(const std::string& cityId) {
    if (Elm_Object_Item* item = rowOf(cityId))
        stage().tapRow(item);
}

std::vector<std::string> CityPickerFixture::hours() {
    std::vector<std::string> labels;
    for (Elm_Object_Item* row : items())
        if (const Elm_Object_Item* label = elm_index_item_find(index(), row))
            labels.emplace_back(elm_index_item_letter_get(label));
    return labels;
}

std::string CityPickerFixture::firstCityOf(const std::string& hour) {
    for (Elm_Object_Item* row : items()) {
        const Elm_Object_Item* label = elm_index_item_find(index(), row);
        if (label && hour == elm_index_item_letter_get(label))
            return cityOf(row).city;
    }
    ADD_FAILURE() << "the index has no hour " << hour;
    return "";
}

bool CityPickerFixture::showsFastScroll() {
    return stage().canBeSeen(index());
}

ClockWorldClockDbData CityPickerFixture::stored(const std::string& cityId) {
    std::vector<ClockWorldClockDbData> all;
    ClockWorldClockDbModel().getWorldClockAllCityList(all);
    const auto found =
        std::find_if(all.begin(), all.end(), [&](const auto& city) { return city.city == cityId; });
    if (found == all.end()) {
        ADD_FAILURE() << cityId << " is not stored";
        return {};
    }
    return *found;
}

std::vector<std::string> CityPickerFixture::failures() {
    std::vector<std::string> lines = takeErrors();
    std::erase_if(lines, isTold);
    return lines;
}

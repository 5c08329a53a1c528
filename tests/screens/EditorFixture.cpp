#include "screens/EditorFixture.h"

#include <algorithm>
#include <optional>

#include <Elementary.h>

#include <app_assist/WGenlistItem.h>
#include <base/SqliteDatabase.h>
#include <clock/ClockAlarmDbModel.h>
#include <clock/ClockAlarmManagerModel.h>

#include "AlarmTypeItem.h"

namespace {

int exits = 0;

/** Something below the editor. */
class PlainPage : public app_assist::WContentViewController {
protected:
    Evas_Object* onCreateView(Evas_Object* parent, void*) override {
        Evas_Object* label = elm_label_add(parent);
        elm_object_text_set(label, "Plain page");
        return label;
    }
};

bool isNameLine(const std::string& line) {
    return line == "Alarm Name is NULL !!" || line == "Focus is not set for entry !!";
}

app_assist::WGenlistItem* rowBehind(Elm_Object_Item* item) {
    return static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(item));
}

} // namespace

// Comes before the toolkit's, which would end the main loop of every later test as well.
extern "C" __attribute__((visibility("default"))) void elm_exit() {
    ++exits;
}

int exitRequests() {
    return exits;
}

void forgetExitRequests() {
    exits = 0;
}

std::time_t at(const std::string& civil) {
    std::tm time{};
    strptime(civil.c_str(), "%Y-%m-%d %H:%M:%S", &time);
    time.tm_isdst = -1;
    return std::mktime(&time);
}

std::string civil(std::time_t instant) {
    std::tm time{};
    localtime_r(&instant, &time);
    char buffer[32];
    std::strftime(buffer, sizeof buffer, "%Y-%m-%d %H:%M:%S", &time);
    return buffer;
}

void EditorFixture::SetUp() {
    ScreenTest::SetUp();
    forgetExitRequests();
}

void EditorFixture::TearDown() {
    takeStageDown();
    EXPECT_EQ(device().openResourceManagers(), 0);
    for (const std::string& line : errorLines())
        ADD_FAILURE() << "unexpected error line: " << line;
    ScreenTest::TearDown();
}

void EditorFixture::openEditor(const ClockAlarmDbData& alarm, bool isCreate,
                               AlarmEditViewCallerType caller) {
    stage().naviframe().push(new PlainPage);
    _editor = new AlarmEditViewController(caller, alarm, isCreate);
    _editorAlive = _editor->getWeakPtr();
    stage().push(_editor);
}

ClockAlarmDbData EditorFixture::storedAlarm(int hour, int minute) {
    ClockAlarmDbData alarm{};
    alarm.hour = hour;
    alarm.min = minute;
    alarm.enable = 1;
    alarm.name = "Old";
    alarm.volume = 5;
    alarm.timeZone = "Europe/Berlin";
    alarm.repeatOnce = 0;
    alarm.repeatWeekly = 62;
    ClockAlarmManagerModel::registerAlarmToServer(alarm);
    ClockAlarmDbModel().insertAlarmData(alarm);
    device().postNotification(std::to_string(alarm.id), "Missed alarm");
    device().clearCalls();
    return alarm;
}

std::vector<ClockAlarmDbData> EditorFixture::storedAlarms() {
    std::vector<ClockAlarmDbData> alarms;
    ClockAlarmDbModel().getAllAlarmList(alarms);
    return alarms;
}

std::vector<std::string> EditorFixture::usageEvents() {
    base::SqliteDatabase database(device().dataPath() + "usage.db");
    std::vector<std::string> events;
    if (!database.open("usage", {"CREATE TABLE usage(number, application_id, feature, detail)"}))
        return events;
    auto rows = database.prepare(
        "SELECT feature || ' ' || detail FROM usage WHERE application_id = 'com.vendra.clock' "
        "ORDER BY number");
    while (rows.step())
        events.push_back(rows.text(0));
    return events;
}

Evas_Object* EditorFixture::genlist() {
    return _editor->getEvasObj();
}

AlarmTimePickerItem& EditorFixture::timePickerRow() {
    return *static_cast<AlarmTimePickerItem*>(rowBehind(elm_genlist_first_item_get(genlist())));
}

AlarmNameItem& EditorFixture::nameRow() {
    return *static_cast<AlarmNameItem*>(rowBehind(elm_genlist_last_item_get(genlist())));
}

std::string EditorFixture::dateText() {
    const char* text = elm_object_part_text_get(timePickerRow().getCalendarObj(), "date.text");
    return text ? text : "";
}

void EditorFixture::pick(int hour, int minute) {
    std::tm time{};
    elm_datetime_value_get(picker(), &time);
    time.tm_hour = hour;
    time.tm_min = minute;
    elm_datetime_value_set(picker(), &time);
    evas_object_smart_callback_call(picker(), "changed", nullptr);
}

void EditorFixture::typeName(const std::string& name) {
    stage().showRow(nameRow().getElmObjectItem());
    stage().tap(nameRow().getNameEntryObj());
    stage().settle();
    stage().type(name);
    stage().settle();
}

void EditorFixture::chooseType(const std::string& label) {
    tapRow<AlarmTypeItem>();
    stage().tapText(label);
    stage().settle();
}

void EditorFixture::tapTitle(const std::string& text) {
    stage().tapText(text);
    stage().settle();
}

void EditorFixture::tapQuestion(const std::string& text) {
    std::optional<FoundText> button;
    for (const FoundText& found : stage().texts()) {
        if (found.text == text)
            button = found;
    }
    ASSERT_TRUE(button) << text;
    stage().tap(button->area.middle());
}

std::vector<std::string> EditorFixture::errorLines() {
    std::vector<std::string> lines = takeErrors();
    std::erase_if(lines, isNameLine);
    return lines;
}

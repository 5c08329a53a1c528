#include "screens/PickerFixture.h"

#include <cstdio>
#include <utility>

void PickerFixture::TearDown() {
    takeStageDown();
    picker = nullptr;
    ScreenTest::TearDown();
}

Evas_Object* PickerFixture::addPicker(const char* style, int hour, int minute,
                                      Evas_Object* parent) {
    picker = uxt_date_time_add(parent != nullptr ? parent : stage().window(), style);
    if (picker == nullptr) {
        ADD_FAILURE() << "no picker";
        return nullptr;
    }
    show(hour, minute);
    evas_object_smart_callback_add(picker, "changed", changedCb, this);
    if (parent == nullptr) {
        evas_object_geometry_set(picker, 36, 84, 288, 152);
        evas_object_show(picker);
        stage().settle();
    }
    return picker;
}

void PickerFixture::show(int hour, int minute) {
    std::tm value{};
    value.tm_year = 126;
    value.tm_mon = 10;
    value.tm_mday = 18;
    value.tm_hour = hour;
    value.tm_min = minute;
    EXPECT_TRUE(elm_datetime_value_set(picker, &value));
}

std::string PickerFixture::time() const {
    std::tm value{};
    EXPECT_TRUE(elm_datetime_value_get(picker, &value));
    char text[32];
    std::snprintf(text, sizeof text, "%02d:%02d", value.tm_hour, value.tm_min);
    return text;
}

std::vector<std::string> PickerFixture::takeChanges() {
    return std::exchange(_changes, {});
}

Evas_Object* PickerFixture::wheel(const std::string& part) const {
    return elm_object_part_content_get(picker, part.c_str());
}

void PickerFixture::changedCb(void* data, Evas_Object*, void*) {
    auto* fixture = static_cast<PickerFixture*>(data);
    fixture->_changes.push_back(fixture->time());
}

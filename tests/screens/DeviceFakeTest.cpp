#include "support/DeviceFake.h"

#include <cstdlib>
#include <filesystem>
#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "clock/ClockNotificationModel.h"
#include "device/app_common.h"
#include "device/app_resource_manager.h"
#include "device/notification.h"
#include "device/uxt.h"

#define LOG_TAG "fake-test"
#include "base/Log.h"

using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

namespace {

class DeviceFakeTest : public testing::Test {
public:
    DeviceFakeTest() { device().reset(); }
    ~DeviceFakeTest() override { device().reset(); }
};

void countCb(keynode_t* /*node*/, void* data) {
    ++*static_cast<int*>(data);
}

} // namespace

TEST_F(DeviceFakeTest, CallsFromALibraryReachItAndNotTheDesktop) {
    device().postNotification("17", "Wake up");
    ClockNotificationModel::removeAlarmNotificationByTag("17");
    EXPECT_THAT(device().callsTo("notification_delete_by_tag"),
                ElementsAre(R"(notification_delete_by_tag("17"))"));
    EXPECT_THAT(device().notifications(), IsEmpty());
}

TEST_F(DeviceFakeTest, RecordsCallsInOrderWithTheirArguments) {
    vconf_set_int("memory/a", 1);
    notification_status_message_post("Alarm set.");
    sound_manager_set_volume(SOUND_TYPE_ALARM, 7);
    EXPECT_THAT(device().calls(), ElementsAre(R"(vconf_set_int("memory/a", 1))",
                                              R"(notification_status_message_post("Alarm set."))",
                                              "sound_manager_set_volume(SOUND_TYPE_ALARM, 7)"));
    EXPECT_THAT(device().toasts(), ElementsAre("Alarm set."));
    EXPECT_EQ(device().volume(SOUND_TYPE_ALARM), 7);
}

TEST_F(DeviceFakeTest, FailsAsLongAsItIsToldTo) {
    device().failOnce("vconf_set_int", -7);
    EXPECT_EQ(vconf_set_int("memory/a", 1), -7);
    EXPECT_EQ(device().setting("memory/a"), std::nullopt);
    EXPECT_EQ(vconf_set_int("memory/a", 1), VCONF_OK);
    device().fail("vconf_set_int");
    EXPECT_EQ(vconf_set_int("memory/a", 2), -1);
    EXPECT_EQ(vconf_set_int("memory/a", 2), -1);
    device().succeed("vconf_set_int");
    EXPECT_EQ(vconf_set_int("memory/a", 2), VCONF_OK);
}

TEST_F(DeviceFakeTest, AWidgetFunctionThatFailsGivesNoWidget) {
    device().failOnce("uxt_button_add");
    EXPECT_EQ(uxt_button_add(nullptr, "default"), nullptr);
    EXPECT_THAT(device().calls(), ElementsAre(R"(uxt_button_add(null, "default"))"));
}

TEST_F(DeviceFakeTest, SettingsHaveOneType) {
    device().setSetting("db/a", "twelve");
    int value = 42;
    EXPECT_EQ(vconf_get_int("db/a", &value), VCONF_ERROR_WRONG_TYPE);
    EXPECT_EQ(vconf_get_bool("db/a", &value), VCONF_ERROR_WRONG_TYPE);
    char* text = vconf_get_str("db/a");
    EXPECT_STREQ(text, "twelve");
    std::free(text);
    device().setSetting("db/a", true);
    EXPECT_EQ(vconf_get_bool("db/a", &value), VCONF_OK);
    EXPECT_EQ(value, 1);
    EXPECT_EQ(vconf_get_int("db/missing", &value), VCONF_ERROR);
}

TEST_F(DeviceFakeTest, AChangedSettingRunsItsCallbacks) {
    int changes = 0;
    vconf_notify_key_changed("db/a", countCb, &changes);
    EXPECT_EQ(device().watchers("db/a"), 1U);
    device().setSetting("db/a", 1);
    EXPECT_EQ(changes, 1);
    device().setSetting("db/a", 1);
    EXPECT_EQ(changes, 1) << "the same value is no change";
    device().setSetting("db/a", 2, DeviceFake::Deliver::Later);
    vconf_set_int("db/a", 3);
    EXPECT_EQ(changes, 1) << "not before they are delivered";
    device().deliverChanges();
    EXPECT_EQ(changes, 3);
    device().deliverChanges();
    EXPECT_EQ(changes, 3);
}

TEST_F(DeviceFakeTest, SchedulesAlarmsAsTheServerDoes) {
    const alarm_schedule_s daily{1, 1, 7, 30, 127, 0, 0, 0};
    std::int32_t id = 0;
    EXPECT_EQ(alarm_server_register(&daily, &id), ALARM_SERVER_ERROR_NONE);
    std::int64_t ring = 0;
    EXPECT_EQ(alarm_server_get(id, nullptr, &ring), ALARM_SERVER_ERROR_NONE);
    EXPECT_GT(ring, time(nullptr));
    alarm_schedule_s silent = daily;
    silent.enabled = 0;
    EXPECT_EQ(alarm_server_update(id, &silent), ALARM_SERVER_ERROR_NONE);
    EXPECT_EQ(device().nextRing(id), 0);
    alarm_schedule_s wrong = daily;
    wrong.hour = 24;
    EXPECT_EQ(alarm_server_register(&wrong, &id), ALARM_SERVER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(alarm_server_unregister(id), ALARM_SERVER_ERROR_NONE);
    EXPECT_EQ(alarm_server_unregister(id), ALARM_SERVER_ERROR_NOT_FOUND);
    EXPECT_EQ(device().callsTo("alarm_server_register").front(),
              "alarm_server_register({alarm 1, on, 07:30, weekdays 127})");
}

TEST_F(DeviceFakeTest, CountsTheUsersOfTheResourceManager) {
    char* path = nullptr;
    EXPECT_EQ(app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, "edje/device.edj", &path),
              APP_RESOURCE_ERROR_NOT_FOUND);
    app_resource_manager_init();
    EXPECT_EQ(device().openResourceManagers(), 1);
    EXPECT_EQ(app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, "edje/device.edj", &path),
              APP_RESOURCE_ERROR_NONE);
    EXPECT_EQ(path, device().resourceRoot() + "/edje/device.edj");
    std::free(path);
    app_resource_manager_release();
    EXPECT_EQ(device().openResourceManagers(), 0);
}

TEST_F(DeviceFakeTest, GivesEveryTestADataFolderOfItsOwn) {
    char* path = app_get_data_path();
    const std::string first = path;
    std::free(path);
    EXPECT_TRUE(std::filesystem::is_directory(first));
    device().reset();
    EXPECT_FALSE(std::filesystem::exists(first));
    EXPECT_NE(device().dataPath(), first);
    device().setDataPath(std::nullopt);
    EXPECT_EQ(app_get_data_path(), nullptr);
}

TEST_F(DeviceFakeTest, TakesErrorsOnceAndWithoutTheirForm) {
    LOG_ERROR("Data is NULL !!");
    LOG_INFO("all is well");
    LOG_ERROR("path: %s", "/somewhere/a.edj");
    EXPECT_THAT(device().takeErrors(), ElementsAre("Data is NULL !!"));
    EXPECT_THAT(device().takeErrors(), IsEmpty());
    EXPECT_THAT(device().log(), SizeIs(3));
    EXPECT_EQ(device().log()[0].tag, "fake-test");
    EXPECT_TRUE(device().logged(DLOG_INFO, "all is"));
    EXPECT_FALSE(device().logged(DLOG_ERROR, "all is"));
}

TEST_F(DeviceFakeTest, AnActionRunsInTheCallItBelongsTo) {
    int runs = 0;
    device().onCall("vconf_get_int", [&runs] { ++runs; });
    int value = 0;
    vconf_get_int("db/a", &value);
    vconf_get_bool("db/a", &value);
    EXPECT_EQ(runs, 1);
}

#include "clock/ClockNotificationModel.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "device/notification.h"
#include "host/Helper.h"

namespace {

TEST(ClockNotificationModelTest, RemovesTheNotificationWithTheTagAlone) {
    const DeviceHost host;
    ASSERT_EQ(notification_post_with_tag("1", "Alarm at 07:30"), NOTIFICATION_ERROR_NONE);
    ASSERT_EQ(notification_post_with_tag("11", "Alarm at 08:30"), NOTIFICATION_ERROR_NONE);
    ClockNotificationModel::removeAlarmNotificationByTag("1");
    EXPECT_EQ(notification_delete_by_tag("1"), NOTIFICATION_ERROR_NOT_EXIST_ID);
    EXPECT_EQ(notification_delete_by_tag("11"), NOTIFICATION_ERROR_NONE);
}

TEST(ClockNotificationModelTest, AnAlarmWithoutNotificationIsNoFailure) {
    const DeviceHost host;
    const auto log =
        standardErrorOf([] { ClockNotificationModel::removeAlarmNotificationByTag("5"); });
    EXPECT_EQ(log, "");
}

TEST(ClockNotificationModelTest, ATagThatCannotBeOneIsReported) {
    const DeviceHost host;
    const auto log =
        standardErrorOf([] { ClockNotificationModel::removeAlarmNotificationByTag(""); });
    EXPECT_THAT(log, testing::HasSubstr("notification_delete_by_tag failed(tag = , ret = -1)"));
}

} // namespace

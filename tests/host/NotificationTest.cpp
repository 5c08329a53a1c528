#include <filesystem>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Helper.h"
#include "device/notification.h"
#include "device_host.h"

namespace fs = std::filesystem;

using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;
using testing::IsEmpty;

namespace {

class Notification : public testing::Test {
protected:
    std::vector<std::string> posted() const {
        std::vector<std::string> texts;
        const std::string folder = host.runtimeDir() + "/notifications";
        if (fs::exists(folder)) {
            for (const auto& entry : fs::directory_iterator(folder))
                texts.push_back(readFile(entry.path()));
        }
        return texts;
    }

    int post(const char* tag, const char* text) {
        int result = 0;
        standardErrorOf([&] { result = notification_post_with_tag(tag, text); });
        return result;
    }

    DeviceHost host;
};

void collectCb(const char* message, void* data) {
    static_cast<std::vector<std::string>*>(data)->emplace_back(message);
}

} // namespace

TEST_F(Notification, AToastReachesWhoShowsItAndTheLog) {
    std::vector<std::string> toasts;
    device_host_set_toast_callback(collectCb, &toasts);
    const auto log = standardErrorOf(
        [] { EXPECT_EQ(notification_status_message_post("Alarm set."), NOTIFICATION_ERROR_NONE); });
    EXPECT_THAT(toasts, ElementsAre("Alarm set."));
    EXPECT_THAT(log, EndsWith("Toast: Alarm set.\n"));
}

TEST_F(Notification, AToastIsLoggedWhenNobodyShowsIt) {
    std::vector<std::string> toasts;
    device_host_set_toast_callback(collectCb, &toasts);
    device_host_set_toast_callback(nullptr, nullptr);
    const auto log = standardErrorOf([] { notification_status_message_post("100 % sure %s"); });
    EXPECT_THAT(toasts, IsEmpty());
    EXPECT_THAT(log, EndsWith("Toast: 100 % sure %s\n"));
}

TEST_F(Notification, EndingTheDeviceForgetsWhoShowsToasts) {
    std::vector<std::string> toasts;
    device_host_set_toast_callback(collectCb, &toasts);
    device_host_shutdown();
    standardErrorOf([] { notification_status_message_post("Alarm set."); });
    EXPECT_THAT(toasts, IsEmpty());
}

TEST_F(Notification, ANullToastIsRefused) {
    EXPECT_EQ(notification_status_message_post(nullptr), NOTIFICATION_ERROR_INVALID_PARAMETER);
}

TEST_F(Notification, APostedNotificationStaysUntilItIsDeletedByItsTag) {
    EXPECT_EQ(post("17", "Wake up"), NOTIFICATION_ERROR_NONE);
    EXPECT_EQ(post("18", "Tea"), NOTIFICATION_ERROR_NONE);
    EXPECT_EQ(notification_delete_by_tag("17"), NOTIFICATION_ERROR_NONE);
    EXPECT_THAT(posted(), ElementsAre("Tea"));
    EXPECT_EQ(notification_delete_by_tag("17"), NOTIFICATION_ERROR_NOT_EXIST_ID);
}

TEST_F(Notification, PostingATagAgainReplacesTheEarlierOne) {
    post("17", "Wake up");
    post("17", "Snoozed");
    EXPECT_THAT(posted(), ElementsAre("Snoozed"));
}

TEST_F(Notification, AnotherProcesssNotificationCanBeDeleted) {
    EXPECT_EQ(waitFor(startHelper({"post", "17", "Missed alarm"})), 0);
    EXPECT_THAT(posted(), ElementsAre("Missed alarm"));
    EXPECT_EQ(notification_delete_by_tag("17"), NOTIFICATION_ERROR_NONE);
    EXPECT_THAT(posted(), IsEmpty());
}

TEST_F(Notification, WhatIsNoTagIsRefused) {
    const std::string tooLong(300, 'x');
    for (const char* tag : {"", tooLong.c_str(), static_cast<const char*>(nullptr)}) {
        EXPECT_EQ(post(tag, "text"), NOTIFICATION_ERROR_INVALID_PARAMETER);
        EXPECT_EQ(notification_delete_by_tag(tag), NOTIFICATION_ERROR_INVALID_PARAMETER);
    }
    EXPECT_EQ(post("17", nullptr), NOTIFICATION_ERROR_INVALID_PARAMETER);
}

TEST_F(Notification, ATagCannotLeaveItsFolder) {
    EXPECT_EQ(post("../../data/escaped", "text"), NOTIFICATION_ERROR_NONE);
    EXPECT_FALSE(fs::exists(host.dataDir() + "/escaped"));
    EXPECT_THAT(posted(), ElementsAre("text"));
    writeFile(host.dataDir() + "/precious", "data");
    EXPECT_EQ(notification_delete_by_tag("../../data/precious"), NOTIFICATION_ERROR_NOT_EXIST_ID);
    EXPECT_TRUE(fs::exists(host.dataDir() + "/precious"));
}

TEST_F(Notification, TagsOfDotsAreTagsLikeOthers) {
    for (const char* tag : {".", "..", ".new-aaaaaa"}) {
        EXPECT_EQ(post(tag, tag), NOTIFICATION_ERROR_NONE);
        EXPECT_THAT(posted(), ElementsAre(tag));
        EXPECT_EQ(notification_delete_by_tag(tag), NOTIFICATION_ERROR_NONE);
    }
}

TEST_F(Notification, AStoreThatCannotBeWrittenIsAnError) {
    writeFile(host.runtimeDir() + "/notifications", "in the way");
    const auto log = standardErrorOf([] {
        EXPECT_EQ(notification_post_with_tag("17", "text"), NOTIFICATION_ERROR_IO_ERROR);
        EXPECT_EQ(notification_delete_by_tag("17"), NOTIFICATION_ERROR_NOT_EXIST_ID);
    });
    EXPECT_THAT(log, HasSubstr("Not a directory"));
}

TEST_F(Notification, ANotificationThatCannotBeRemovedIsAnError) {
    writeFile(host.runtimeDir() + "/notifications/17/something", "in the way");
    standardErrorOf(
        [] { EXPECT_EQ(notification_delete_by_tag("17"), NOTIFICATION_ERROR_IO_ERROR); });
}

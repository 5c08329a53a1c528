#include "support/AppControlFake.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "support/DeviceFake.h"

using testing::IsEmpty;
using testing::SizeIs;

namespace {

class AppControlFakeTest : public testing::Test {
public:
    AppControlFakeTest() { device().reset(); }
    ~AppControlFakeTest() override { device().reset(); }
};

struct Answer {
    int calls = 0;
    int missing = 0;
    app_control_result_e result = APP_CONTROL_RESULT_SUCCEEDED;
};

void answerCb(app_control_h, app_control_h reply, app_control_result_e result, void* data) {
    auto* answer = static_cast<Answer*>(data);
    char* value = nullptr;
    ++answer->calls;
    answer->missing = app_control_get_extra_data(reply, "missing", &value);
    answer->result = result;
}

TEST_F(AppControlFakeTest, ASentRequestMayBeDestroyedBeforeItsAnswer) {
    app_control_h request = nullptr;
    EXPECT_EQ(app_control_create(&request), APP_CONTROL_ERROR_NONE);
    EXPECT_EQ(app_control_set_app_id(request, "com.example"), APP_CONTROL_ERROR_NONE);
    Answer answer;
    EXPECT_EQ(app_control_send_launch_request(request, answerCb, &answer), APP_CONTROL_ERROR_NONE);
    EXPECT_EQ(app_control_destroy(request), APP_CONTROL_ERROR_NONE);
    EXPECT_EQ(applications::unreleased(), 0U);
    EXPECT_EQ(answer.calls, 0);
    applications::answer({}, APP_CONTROL_RESULT_CANCELED);
    EXPECT_EQ(answer.calls, 1);
    EXPECT_EQ(answer.missing, APP_CONTROL_ERROR_KEY_NOT_FOUND);
    EXPECT_EQ(answer.result, APP_CONTROL_RESULT_CANCELED);
    EXPECT_EQ(applications::requests().front().application, "com.example");
    EXPECT_EQ(applications::unreleased(), 0U);
}

TEST_F(AppControlFakeTest, ADestroyedRequestIsRefused) {
    app_control_h request = nullptr;
    app_control_create(&request);
    app_control_destroy(request);
    EXPECT_EQ(app_control_set_app_id(request, "com.example"), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_destroy(request), APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_send_launch_request(nullptr, answerCb, nullptr),
              APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_THAT(applications::requests(), IsEmpty());
}

TEST_F(AppControlFakeTest, ARequestIsAnsweredOnce) {
    app_control_h request = nullptr;
    app_control_h reply = nullptr;
    app_control_create(&request);
    app_control_create(&reply);
    app_control_add_extra_data(reply, "city", "Oslo");
    EXPECT_EQ(app_control_reply_to_launch_request(reply, request, APP_CONTROL_RESULT_SUCCEEDED),
              APP_CONTROL_ERROR_NONE);
    EXPECT_EQ(app_control_reply_to_launch_request(reply, request, APP_CONTROL_RESULT_SUCCEEDED),
              APP_CONTROL_ERROR_INVALID_PARAMETER);
    ASSERT_THAT(applications::replies(), SizeIs(1));
    EXPECT_EQ(applications::replies().front().extras.at("city"), "Oslo");
    EXPECT_EQ(applications::unreleased(), 2U);
    device().reset();
    EXPECT_EQ(applications::unreleased(), 0U);
    EXPECT_THAT(applications::replies(), IsEmpty());
}

} // namespace

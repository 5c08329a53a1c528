// What becomes of a city that is chosen in the city picker.

#include <functional>
#include <ostream>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <device/app_control.h>

#include "screens/CityPickerFixture.h"
#include "support/AppControlFake.h"

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;

namespace {

constexpr const char* BERLIN = "IDS_CITY_DE_BERLIN_BERLIN";
constexpr const char* KATHMANDU = "IDS_CITY_NP_KATHMANDU";

class CityPickerReturnTest : public CityPickerFixture {
protected:
    void SetUp() override {
        CityPickerFixture::SetUp();
        worldOf({BERLIN, KATHMANDU});
        app_control_create(&request);
    }
    void TearDown() override {
        takeStageDown();
        app_control_destroy(request);
        CityPickerFixture::TearDown();
    }

    app_control_h request = nullptr;
};

TEST_F(CityPickerReturnTest, AChosenCityIsStoredReturnedAndThePageLeaves) {
    openPicker(3);
    tapCity(KATHMANDU);
    stage().settle();
    EXPECT_FALSE(isOpen());
    ASSERT_THAT(returned, SizeIs(1));
    EXPECT_EQ(returned[0].city, KATHMANDU);
    EXPECT_EQ(returned[0].selected, 1);
    EXPECT_EQ(returned[0].position, 3);
    EXPECT_EQ(stored(KATHMANDU).selected, 1);
    EXPECT_EQ(stored(KATHMANDU).position, 3);
    EXPECT_EQ(stored(BERLIN).selected, 0);
    EXPECT_THAT(device().callsTo("app_control_reply_to_launch_request"), IsEmpty());
}

TEST_F(CityPickerReturnTest, TheRecordIsStoredBeforeItIsReturned) {
    openPicker(2);
    int seen = -1;
    picker().setCityDataReturnFunc(
        [&](ClockWorldClockDbData& city) { seen = stored(city.city).position; });
    tapCity(KATHMANDU);
    EXPECT_EQ(seen, 2);
}

TEST_F(CityPickerReturnTest, ACityOfTheListAlreadyIsToldAndThePageStays) {
    openPicker(0);
    tapCity(BERLIN);
    stage().settle();
    openPicker(1);
    tapCity(BERLIN);
    stage().settle();
    EXPECT_TRUE(isOpen());
    EXPECT_THAT(device().toasts(), ElementsAre("Berlin has already been added."));
    EXPECT_THAT(returned, SizeIs(1));
    EXPECT_EQ(stored(BERLIN).position, 0);
}

TEST_F(CityPickerReturnTest, AfterTheToastTheSameRowCanBeTappedAgain) {
    openPicker(0);
    tapCity(BERLIN);
    stage().settle();
    openPicker(1);
    tapCity(BERLIN);
    stage().settle();
    tapCity(BERLIN);
    stage().settle();
    EXPECT_THAT(device().toasts(), SizeIs(2));
}

TEST_F(CityPickerReturnTest, AReturnFunctionReplacesTheEarlierOne) {
    openPicker();
    int calls = 0;
    picker().setCityDataReturnFunc([&](ClockWorldClockDbData&) { ++calls; });
    tapCity(KATHMANDU);
    EXPECT_EQ(calls, 1);
    EXPECT_THAT(returned, IsEmpty());
}

TEST_F(CityPickerReturnTest, WithoutAReturnFunctionTheStandardErrorIsRaised) {
    openPicker();
    picker().setCityDataReturnFunc(nullptr);
    Elm_Object_Item* row = rowOf(KATHMANDU);
    EXPECT_THROW(WorldClockAddCityViewController::_genlistSelectedCb(&picker(), genlist(), row),
                 std::bad_function_call);
}

TEST_F(CityPickerReturnTest, ARowWithoutACitySaysSoAndThePageStays) {
    openPicker();
    WorldClockAddCityViewController::_genlistSelectedCb(&picker(), genlist(), nullptr);
    expectLog("city data is not set for genlist item");
    EXPECT_TRUE(isOpen());
}

TEST_F(CityPickerReturnTest, AnotherApplicationGetsFiveTextsInOrder) {
    openPickerFor(request);
    device().clearCalls();
    tapCity(KATHMANDU);
    stage().settle();
    std::vector<std::string> calls;
    for (const std::string& call : device().calls())
        if (call.starts_with("app_control_"))
            calls.push_back(call);
    EXPECT_THAT(
        calls,
        ElementsAre(
            HasSubstr("app_control_create"), HasSubstr("/appcontrol/operation/default"),
            HasSubstr("\"index_key\", \"" + std::to_string(stored(KATHMANDU).index) + "\""),
            HasSubstr("\"city\", \"IDS_CITY_NP_KATHMANDU\""),
            HasSubstr("\"country\", \"IDS_COUNTRY_NP\""), HasSubstr("\"timezone\", \"GMT+05:45\""),
            HasSubstr("\"tz_path\", \"Asia/Kathmandu\""),
            HasSubstr("app_control_reply_to_launch_request"), HasSubstr("app_control_destroy")));
    ASSERT_THAT(applications::replies(), SizeIs(1));
    EXPECT_EQ(applications::replies()[0].result, APP_CONTROL_RESULT_SUCCEEDED);
    EXPECT_FALSE(isOpen());
    EXPECT_EQ(stored(KATHMANDU).selected, 0);
    EXPECT_THAT(returned, IsEmpty());
}

TEST_F(CityPickerReturnTest, WithoutARequestNothingIsSentAndThePageLeaves) {
    openPickerFor(nullptr);
    device().clearCalls();
    tapCity(KATHMANDU);
    stage().settle();
    EXPECT_THAT(device().callsTo("app_control_create"), IsEmpty());
    EXPECT_FALSE(isOpen());
    EXPECT_EQ(stored(KATHMANDU).selected, 0);
}

struct FailingStep {
    const char* function;
    int result;
    std::vector<std::string> messages;
};

// Otherwise a parameter is printed byte by byte, with what lies between its members.
void PrintTo(const FailingStep& step, std::ostream* out) {
    *out << step.function << " = " << step.result;
}

class CityPickerReplyFailureTest : public CityPickerReturnTest,
                                   public testing::WithParamInterface<FailingStep> {};

TEST_P(CityPickerReplyFailureTest, IsToldAndThePageLeavesAllTheSame) {
    openPickerFor(request);
    const std::size_t before = applications::unreleased();
    device().fail(GetParam().function, GetParam().result);
    tapCity(KATHMANDU);
    stage().settle();
    for (const std::string& message : GetParam().messages)
        expectLog(message);
    EXPECT_FALSE(isOpen());
    EXPECT_THAT(applications::replies(), IsEmpty());
    EXPECT_EQ(applications::unreleased(), before);
}

INSTANTIATE_TEST_SUITE_P(
    Steps, CityPickerReplyFailureTest,
    testing::Values(
        FailingStep{"app_control_create", -12, {"app control create failed"}},
        FailingStep{"app_control_set_operation", -22, {"app control set operationfailed"}},
        FailingStep{
            "app_control_add_extra_data",
            -22,
            {"app cotron add extra data failed :: index_key"},
        },
        FailingStep{
            "app_control_reply_to_launch_request",
            -12,
            {"app control reply to launch request failed(-12)", "case out of memory"},
        },
        FailingStep{
            "app_control_reply_to_launch_request",
            -22,
            {"app control reply to launch request failed(-22)", "case invalid parameter"},
        }));

TEST_F(CityPickerReturnTest, LongTextsAreCutToSixtyThreeBytes) {
    openPickerFor(request);
    device().clearCalls();
    ClockWorldClockDbData city;
    city.city = std::string(70, 'c');
    city.tzPath = std::string(62, 't') + "\xC3\xA9";
    picker()._sendReplyToCaller(city);
    EXPECT_THAT(device().callsTo("app_control_add_extra_data"),
                ElementsAre(HasSubstr("\"0\""), HasSubstr("\"" + std::string(63, 'c') + "\""),
                            HasSubstr("\"country\", \"\""), HasSubstr("\"timezone\", \"\""),
                            HasSubstr("\"" + std::string(62, 't') + "\"")));
}

} // namespace

#include <functional>
#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <Elementary.h>

#include <app_assist/WContentViewController.h>

#include "AlarmDiscardPopupViewController.h"
#include "screens/PageBelow.h"
#include "support/LiveObjects.h"
#include "support/ScreenTest.h"

using testing::Contains;
using testing::ElementsAre;
using testing::HasSubstr;

namespace {

class DiscardPopupTest : public ScreenTest {
protected:
    void show() {
        page = new PageBelow;
        stage().push(page);
        popup = new AlarmDiscardPopupViewController;
        popup->setDiscardBtnSelectedCb([this] { ++discards; });
        alive = popup->getWeakPtr();
        page->attachPopup(popup);
        stage().settle();
    }

    PageBelow* page = nullptr;
    AlarmDiscardPopupViewController* popup = nullptr;
    app_assist::WWeakPtr<app_assist::WViewController> alive;
    int discards = 0;
};

TEST_F(DiscardPopupTest, AsksWithTwoButtons) {
    show();
    EXPECT_TRUE(stage().shows("Discard changes"));
    EXPECT_TRUE(stage().shows("All changes will be discarded."));
    const auto cancel = stage().findText("Cancel");
    const auto discard = stage().findText("Discard");
    ASSERT_TRUE(cancel && discard);
    EXPECT_LT(cancel->area.x, discard->area.x);
    EXPECT_TRUE(cancel->area.insideCircle());
    EXPECT_TRUE(discard->area.insideCircle());
}

TEST_F(DiscardPopupTest, FillsTheWidthAtTheBottom) {
    show();
    double horizontal = 0;
    double vertical = 0;
    elm_popup_align_get(popup->getEvasObj(), &horizontal, &vertical);
    EXPECT_EQ(horizontal, -1.0);
    EXPECT_EQ(vertical, 1.0);
}

TEST_F(DiscardPopupTest, CancelClosesIt) {
    show();
    stage().tapText("Cancel");
    stage().settle();
    EXPECT_FALSE(alive);
    EXPECT_FALSE(stage().shows("Discard changes"));
    EXPECT_EQ(discards, 0);
    EXPECT_EQ(page->pops, 0);
}

TEST_F(DiscardPopupTest, TheBackKeyClosesItAndReachesNobodyElse) {
    show();
    stage().backKey();
    stage().settle();
    EXPECT_FALSE(alive);
    EXPECT_EQ(discards, 0);
    EXPECT_EQ(page->pops, 0);
    stage().backKey();
    EXPECT_EQ(page->pops, 1);
}

TEST_F(DiscardPopupTest, DiscardRunsTheActionAndLeavesThePopupToIt) {
    show();
    stage().tapText("Discard");
    stage().settle();
    EXPECT_EQ(discards, 1);
    EXPECT_TRUE(alive);
    EXPECT_TRUE(stage().shows("Discard changes"));
}

TEST_F(DiscardPopupTest, TheLastActionCounts) {
    show();
    popup->setDiscardBtnSelectedCb([this] { discards += 10; });
    stage().tapText("Discard");
    EXPECT_EQ(discards, 10);
}

TEST_F(DiscardPopupTest, DiscardWithoutAnActionIsAProgrammingError) {
    AlarmDiscardPopupViewController lonely;
    EXPECT_THROW(AlarmDiscardPopupViewController::_discardPopupDiscardBtnClickedCb(&lonely, nullptr,
                                                                                   nullptr),
                 std::bad_function_call);
}

TEST_F(DiscardPopupTest, CancelWithoutAPopupDoesNothing) {
    AlarmDiscardPopupViewController lonely;
    AlarmDiscardPopupViewController::_discardPopupCancelBtnClickedCb(&lonely, nullptr, nullptr);
}

TEST_F(DiscardPopupTest, ListensToTheBackKey) {
    show();
    EXPECT_THAT(device().callsTo("eext_object_event_callback_add"),
                Contains(HasSubstr("elm_popup")));
}

TEST_F(DiscardPopupTest, MissingDataIsLogged) {
    AlarmDiscardPopupViewController::_discardPopupCancelBtnClickedCb(nullptr, nullptr, nullptr);
    AlarmDiscardPopupViewController::_discardPopupDiscardBtnClickedCb(nullptr, nullptr, nullptr);
    EXPECT_THAT(takeErrors(), ElementsAre("Data is NULL !!", "Data is NULL !!"));
}

} // namespace

// What every list of the simulator does, whatever it lists.

#include "ListPage.h"

#include <string>

#include <gtest/gtest.h>

#include "PageFixture.h"

namespace {

constexpr double MINUTE = 60;
constexpr simulator::ListPageTexts TEXTS{"IDS_COM_BODY_ALARM", "IDS_COM_BODY_ALARM",
                                         "IDS_COM_BODY_ALARM", "IDS_COM_BODY_ALARM"};

/** A list without rows that counts minutes. */
class MinutePage : public simulator::ListPage {
public:
    MinutePage(const std::string& theme, int& minutes)
        : ListPage(theme, TEXTS), _minutes(minutes) {}

protected:
    Elm_Object_Item* appendRows() override { return nullptr; }
    void onMinute() override { ++_minutes; }
    void onAddTapped() override {}
    void onOtherTapped() override {}

private:
    int& _minutes;
};

using ListPageTest = PageFixture;

} // namespace

TEST_F(ListPageTest, minutesPassOnlyOnThePageThatIsSeen) {
    int below = 0;
    int above = 0;
    stage().push(new MinutePage(theme(), below));
    // Not where a minute begins.
    Stage::advance(MINUTE + 10);
    EXPECT_EQ(below, 1);
    auto* page = new MinutePage(theme(), above);
    stage().push(page);
    Stage::advance(2 * MINUTE);
    EXPECT_EQ(below, 1) << "nobody sees it";
    EXPECT_EQ(above, 2);
    ClockEventListener::raise(ClockEventListener::PAUSED);
    Stage::advance(2 * MINUTE);
    EXPECT_EQ(above, 2) << "nobody sees the application";
    ClockEventListener::raise(ClockEventListener::RESUMED);
    Stage::advance(2 * MINUTE);
    EXPECT_EQ(below, 1) << "nobody sees it still";
    EXPECT_EQ(above, 4);
    page->popOut();
    stage().settle();
    Stage::advance(MINUTE);
    EXPECT_EQ(below, 2) << "it has come back";
}

// What every list of the simulator does, whatever it lists.

#include "ListPage.h"

#include <string>

#include <gtest/gtest.h>

#include "support/ScreenTest.h"

namespace {

const std::string THEME = CLOCK_RESOURCE_DIR "/edje/simulator.edj";
constexpr double MINUTE = 60;
constexpr simulator::ListPageTexts TEXTS{"IDS_COM_BODY_ALARM", "IDS_COM_BODY_ALARM",
                                         "IDS_COM_BODY_ALARM", "IDS_COM_BODY_ALARM"};

/** A list without rows that counts minutes. */
class MinutePage : public simulator::ListPage {
public:
    explicit MinutePage(int& minutes) : ListPage(THEME, TEXTS), _minutes(minutes) {}

protected:
    Elm_Object_Item* appendRows() override { return nullptr; }
    void onMinute() override { ++_minutes; }
    void onAddTapped() override {}
    void onOtherTapped() override {}

private:
    int& _minutes;
};

class ListPageTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        elm_theme_extension_add(nullptr, THEME.c_str());
    }
    void TearDown() override {
        takeStageDown();
        elm_theme_extension_del(nullptr, THEME.c_str());
        ScreenTest::TearDown();
    }
};

} // namespace

TEST_F(ListPageTest, minutesPassOnlyOnThePageThatIsSeen) {
    int below = 0;
    int above = 0;
    stage().push(new MinutePage(below));
    // Not where a minute begins.
    Stage::advance(MINUTE + 10);
    EXPECT_EQ(below, 1);
    auto* page = new MinutePage(above);
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

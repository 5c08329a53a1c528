// Choices in lists are marked, and the button that waits for one is paler until there is one.

#include <cstdlib>
#include <memory>
#include <vector>

#include <gtest/gtest.h>

#include "TonePage.h"
#include "screens/EditorFixture.h"
#include "support/Look.h"

namespace {

/** Lists of choices: each row ends in a mark. */
class ChoiceStatesTest : public EditorFixture {
protected:
    void TearDown() override {
        takeErrors();
        EditorFixture::TearDown();
    }
    void openRow(unsigned position) {
        editAlarm(storedAlarm(7, 30));
        stage().tapRow(elm_genlist_nth_item_get(genlist(), position));
        stage().settle();
    }
    Evas_Object* lastList() { return stage().widgets("Elm_Genlist").back(); }
    /** The mark of a row that can be seen. */
    Look mark(Evas_Object* list, std::size_t position) {
        const Area row = Stage::rows(list).at(position).area;
        return {stage(), {row.x + 270, row.y, 48, row.height}};
    }
};

TEST_F(ChoiceStatesTest, ADayThatIsSetIsMarked) {
    openRow(1);
    Evas_Object* const days = lastList();
    // The stored alarm rings from Monday to Friday.
    const std::size_t position = 1;
    const Look before = mark(days, position);
    stage().tap(Stage::rows(days).at(position).area.middle());
    EXPECT_GT(mark(days, position).unlike(before), SEEN);
    EXPECT_GT(std::abs(mark(days, position).accent() - before.accent()), SEEN);
    stage().screenshot("choice-days");
    stage().tap(Stage::rows(days).at(position).area.middle());
    EXPECT_EQ(mark(days, position).unlike(before), 0);
}

TEST_F(ChoiceStatesTest, TheTypeThatIsSetIsMarked) {
    openRow(2);
    EXPECT_GT(mark(lastList(), 0).accent(), SEEN);
    EXPECT_EQ(mark(lastList(), 1).accent(), 0);
}

/** The page of the device's tone picker. */
class ToneStatesTest : public ChoiceStatesTest {
protected:
    void SetUp() override {
        ChoiceStatesTest::SetUp();
        const tone_picker::TonePage::Actions actions{.marked = [](int) {},
                                                     .done = [](int) {},
                                                     .cancelled =
                                                         [] {
                                                         }};
        page = std::make_unique<tone_picker::TonePage>(
            std::vector<tone_picker::Tone>{{"a.ogg", "Bells"}, {"b.ogg", "Chimes"}}, -1, actions);
        page->show(stage().window());
        stage().settle();
    }
    void TearDown() override {
        takeStageDown();
        page.reset();
        ChoiceStatesTest::TearDown();
    }
    void tap(std::size_t position) {
        stage().tap(Stage::rows(lastList()).at(position).area.middle());
    }

    std::unique_ptr<tone_picker::TonePage> page;
};

TEST_F(ToneStatesTest, TheToneThatIsChosenIsMarked) {
    const Look none = mark(lastList(), 0);
    EXPECT_EQ(none.accent(), 0);
    tap(0);
    EXPECT_GT(mark(lastList(), 0).accent(), SEEN);
    stage().screenshot("choice-tone");
    tap(1);
    EXPECT_GT(mark(lastList(), 1).accent(), SEEN);
    EXPECT_EQ(mark(lastList(), 0).unlike(none), 0);
}

TEST_F(ToneStatesTest, DoneIsPalerUntilAToneHasBeenChosen) {
    Evas_Object* const done = stage().findText("Done")->widget;
    const Look before(stage(), done);
    stage().screenshot("tone-done-disabled");
    pressOn(stage(), done);
    EXPECT_EQ(Look(stage(), done).unlike(before), 0);
    stage().release();
    EXPECT_EQ(before.accent(), 0);
    tap(0);
    EXPECT_GT(Look(stage(), done).accent(), 10 * SEEN);
}

} // namespace

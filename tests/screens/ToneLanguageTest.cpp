// The tone picker in every language that the clock has a catalogue for.

#include <algorithm>
#include <cmath>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include <Elementary.h>
#include <gmock/gmock.h>

#include <clock/ClockText.h>

#include "screens/ToneFixture.h"
#include "support/LiveLanguage.h"
#include "support/TextFaults.h"

using testing::IsEmpty;
using testing::Lt;

namespace {

constexpr const char* DONE = "IDS_TPLATFORM_ACBUTTON_DONE_ABB";

double luminance(unsigned pixel) {
    const auto linear = [pixel](unsigned shift) {
        const double value = (pixel >> shift & 0xFF) / 255.0;
        return value <= 0.03928 ? value / 12.92 : std::pow((value + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(16) + 0.7152 * linear(8) + 0.0722 * linear(0);
}

/** How the strokes of a button's text stand out from its ground. */
double contrast(Stage& stage, const Area& text) {
    constexpr int BESIDE = 4;
    const double ground = luminance(stage.pixel(text.x - BESIDE, text.middle().y)) + 0.05;
    std::vector<double> contrasts;
    for (const unsigned pixel : stage.pixels(text.x, text.y, text.width, text.height)) {
        const double light = luminance(pixel) + 0.05;
        contrasts.push_back(std::max(light, ground) / std::min(light, ground));
    }
    // Most of the place is ground, and the edges of strokes are soft.
    std::ranges::sort(contrasts);
    return contrasts.at(contrasts.size() - contrasts.size() / 20);
}

class ToneLanguageTest : public ToneFixture, public testing::WithParamInterface<std::string> {
protected:
    void SetUp() override {
        ToneFixture::SetUp();
        _language.emplace();
    }
    void TearDown() override {
        ToneFixture::TearDown();
        _language.reset();
    }
    void choose() {
        _language->choose(GetParam());
        stage().settle();
    }
    /** Titles are what sound files call themselves, in whatever letters. */
    static std::vector<std::string> titles() {
        return {"Impatient", "Ägypten & Ångström", "الأجراس", "घंटियाँ", "目覚まし", "Будильник"};
    }
    Evas_Object* list() { return stage().widgets("Elm_Genlist").back(); }
    std::set<std::string> faults() {
        const auto found = faultsOf(stage().texts());
        return {found.begin(), found.end()};
    }
    std::set<std::string> faultsAtEveryRow() {
        std::set<std::string> all;
        for (Elm_Object_Item* row = elm_genlist_first_item_get(list()); row;
             row = elm_genlist_item_next_get(row)) {
            stage().showRow(row);
            stage().settle();
            all.merge(faults());
        }
        return all;
    }
    void expectWords() {
        for (const char* id : {"IDS_ALM_HEADER_TONE", "IDS_TPLATFORM_ACBUTTON_CANCEL_ABB", DONE})
            EXPECT_TRUE(stage().shows(clockText(id))) << id;
    }
    double contrastOfDone() {
        const auto done = stage().findText(clockText(DONE));
        return done ? contrast(stage(), done->area) : 0;
    }
    void take(const std::string& name) { stage().screenshot("language-" + GetParam() + name); }

    std::optional<LiveLanguage> _language;
};

TEST_P(ToneLanguageTest, EveryToneAndButtonFits) {
    choose();
    openTones(titles(), 0);
    take("-tones");
    expectWords();
    EXPECT_THAT(faultsAtEveryRow(), IsEmpty());
}

TEST_P(ToneLanguageTest, AnOpenPickerFollowsAndFits) {
    openTones(titles(), -1);
    choose();
    take("-tones-unmarked");
    expectWords();
    EXPECT_THAT(faultsAtEveryRow(), IsEmpty());
}

TEST_P(ToneLanguageTest, TheWordsThatThereAreNoTonesFollowAndFit) {
    openTones({}, -1);
    choose();
    take("-tones-none");
    expectWords();
    EXPECT_TRUE(stage().shows(clockText("IDS_ALM_BODY_NO_TONES")));
    EXPECT_THAT(faults(), IsEmpty());
}

TEST_P(ToneLanguageTest, DoneCanBeReadBeforeAToneIsMarkedAndIsClearlyPaler) {
    constexpr double READABLE = 3.5;
    _language->choose("en");
    openTones(titles(), -1);
    const double waiting = contrastOfDone();
    EXPECT_GE(waiting, READABLE);
    choose();
    EXPECT_NEAR(contrastOfDone(), waiting, 0.2) << "in the new language";
    stage().tapRow(elm_genlist_first_item_get(list()));
    stage().settle();
    ASSERT_EQ(heard, 0);
    EXPECT_THAT(waiting, Lt(contrastOfDone() / 2));
}

INSTANTIATE_TEST_SUITE_P(Language, ToneLanguageTest, testing::ValuesIn(catalogueLanguages()),
                         [](const auto& language) { return language.param; });

} // namespace

// Finding a text on the face as a person reads it.

#include "script/VisibleTexts.h"

#include <cstdlib>
#include <string>
#include <vector>

#include <Eina.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

using simulator::asRead;
using simulator::describeTexts;
using simulator::FaceArea;
using simulator::Match;
using simulator::matchText;
using simulator::VisibleText;
using testing::HasSubstr;

namespace {

VisibleText at(const std::string& text, int x, int y, bool covered = false) {
    const FaceArea area{x - 30, y - 10, 60, 20};
    return {text, area, area, covered};
}

const std::vector<VisibleText> EDITOR{
    at("Create", 180, 22),      at("Cancel", 124, 60),
    at("Done", 236, 60),        at("Alarm tone", 120, 180),
    at("Alarm name", 120, 240), at("Sound the\nalarm 3 times", 150, 300),
};

std::string inUtf8(Eina_Unicode character) {
    const Eina_Unicode text[] = {character, 0};
    int length = 0;
    char* bytes = eina_unicode_unicode_to_utf8(text, &length);
    std::string result(bytes, static_cast<std::size_t>(length));
    std::free(bytes);
    return result;
}

} // namespace

TEST(ScriptTexts, WhiteSpaceCountsAsPeopleReadIt) {
    EXPECT_EQ(asRead("  Sound \n the\talarm "), "Sound the alarm");
    EXPECT_EQ(asRead(" \n"), "");
    EXPECT_EQ(asRead("\uFFFC\u00A0Search"), "Search") << "a picture before it";
    EXPECT_EQ(asRead("\uF897 Search"), "Search") << "a symbol before it";
    EXPECT_EQ(asRead("\u200F12:30\u00A0\u2066PM\u2069"), "12:30 PM") << "marks of direction";
    EXPECT_EQ(asRead("Z\xC3rich"), "Z\xC3rich") << "broken text stays as it is";
}

TEST(ScriptTexts, MarksOfDirectionAreNotCompared) {
    // Marks, embeddings, overrides and isolates, with their ends.
    for (const Eina_Unicode mark : {0x200E, 0x200F, 0x061C, 0x202A, 0x202B, 0x202C, 0x202D, 0x202E,
                                    0x2066, 0x2067, 0x2068, 0x2069}) {
        const std::string m = inUtf8(mark);
        for (std::string drawn : {"*Yoga", "Yoga*", "Yo*ga", "* Yoga *", "**Yoga*"}) {
            for (auto gap = drawn.find('*'); gap != std::string::npos; gap = drawn.find('*'))
                drawn.replace(gap, 1, m);
            SCOPED_TRACE(testing::PrintToString(drawn));
            EXPECT_EQ(asRead(drawn), "Yoga");
            const std::vector<VisibleText> face{at("Yoga today", 90, 40), at(drawn, 150, 90)};
            EXPECT_EQ(matchText(face, "Yoga", Match::Whole).problem, "");
            EXPECT_EQ(matchText(face, "Yoga", Match::Whole).index, 1U);
            EXPECT_EQ(matchText({at(drawn + ", غدًا", 150, 90)}, "Yoga").problem, "");
            EXPECT_EQ(matchText({at("Yoga", 150, 90)}, drawn).problem, "") << "what is looked for";
        }
    }
}

TEST(ScriptTexts, AWholeTextIsFoundOrItsBeginning) {
    EXPECT_EQ(matchText(EDITOR, "Done").index, 2U);
    EXPECT_EQ(matchText(EDITOR, "Done").problem, "");
    EXPECT_EQ(matchText(EDITOR, "Sound the alarm").index, 5U);
    EXPECT_EQ(matchText(EDITOR, "Alarm n").index, 4U);
    EXPECT_EQ(matchText(EDITOR, "Alarm n").problem, "");
}

TEST(ScriptTexts, AWholeTextGoesBeforeOneThatOnlyBeginsSo) {
    auto texts = EDITOR;
    texts.push_back(at("Alarm", 100, 320));
    EXPECT_EQ(matchText(texts, "Alarm").index, 6U);
    EXPECT_EQ(matchText(texts, "Alarm").problem, "");
}

TEST(ScriptTexts, TheBeginningMayBeTooLittle) {
    EXPECT_NE(matchText(EDITOR, "Alarm n", Match::Whole).problem, "");
    EXPECT_EQ(matchText(EDITOR, "Alarm name", Match::Whole).index, 4U);
}

TEST(ScriptTexts, WhatIsNotThereIsToldWithAllThatIs) {
    EXPECT_EQ(matchText({EDITOR[1], EDITOR[2]}, "Snooze").problem,
              "no text reads \"Snooze\" or begins so; the face shows \"Cancel\" (124 60), "
              "\"Done\" (236 60)");
    EXPECT_THAT(matchText(EDITOR, "done").problem, HasSubstr("no text reads \"done\""));
    EXPECT_THAT(matchText({}, "Done").problem, HasSubstr("the face shows no text"));
}

TEST(ScriptTexts, WhatIsThereTwiceIsNotGuessed) {
    EXPECT_EQ(matchText(EDITOR, "Alarm").problem,
              "\"Alarm\" may mean \"Alarm tone\" (120 180), \"Alarm name\" (120 240)");
    EXPECT_EQ(matchText({at("7", 10, 20), at("7", 30, 20)}, "7").problem,
              "\"7\" may mean \"7\" (10 20), \"7\" (30 20)");
}

TEST(ScriptTexts, WhatCanBeTouchedGoesBeforeWhatLiesBelow) {
    const std::vector<VisibleText> popup{at("Cancel", 124, 60, true), at("Cancel", 110, 276)};
    EXPECT_EQ(matchText(popup, "Cancel").index, 1U);
    EXPECT_EQ(matchText(popup, "Cancel").problem, "");
    EXPECT_EQ(describeTexts(popup), "the face shows \"Cancel\" (110 276)");
}

TEST(ScriptTexts, WhatIsCoveredIsFoundWhereThereIsNothingElse) {
    EXPECT_EQ(matchText({at("Done", 236, 60, true)}, "Done").index, 0U);
    EXPECT_EQ(matchText({at("Done", 236, 60, true)}, "Done").problem, "");
}

TEST(ScriptTexts, OnlyAWholeTextInsideTheCircleIsFullySeen) {
    EXPECT_TRUE(at("Done", 180, 180).isFullySeen());
    EXPECT_FALSE(at("Done", 180, 180, true).isFullySeen());
    EXPECT_FALSE(at("Done", 30, 60).isFullySeen()) << "beyond the rim";
    VisibleText cut = at("Done", 180, 90);
    cut.seen.height = 3;
    EXPECT_FALSE(cut.isFullySeen());
}

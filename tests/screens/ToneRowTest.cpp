// The editor's row for the tone.

#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <device/dlog.h>

#include "AlarmToneItem.h"
#include "screens/TestCatalogue.h"
#include "screens/TextRowFixture.h"
#include "support/ToneFake.h"

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

const std::string FOLDER = "/opt/usr/share/settings/Ringtones/";
constexpr const char* TITLE_PART = "elm.text.main.left.top";
constexpr const char* NAME_PART = "elm.text.sub.left.bottom";
constexpr const char* NO_FILE = "There is no Tone File !! Set default Tone File(Alarm_Impatient)";

class ToneRowTest : public TextRowFixture<AlarmToneItem> {
protected:
    void SetUp() override {
        TextRowFixture::SetUp();
        device().clearCalls();
    }
    void TearDown() override {
        EXPECT_EQ(tones::unreleased(), 0U);
        TextRowFixture::TearDown();
    }

    void showTone(const std::string& path) {
        alarm.soundPath = path;
        show();
    }

    /** The name of a tone in a buffer of its own. */
    std::string nameOf(std::string path, int size) {
        AlarmToneItem item(alarm);
        std::vector<char> name(static_cast<std::size_t>(size) + 1, '#');
        item._getToneName(path.data(), name.data(), size);
        EXPECT_EQ(name.back(), '#') << "written behind the buffer";
        name.pop_back();
        return {name.begin(), name.end()};
    }

    static std::vector<std::string> warnings() {
        std::vector<std::string> texts;
        for (const DeviceLogLine& line : device().log()) {
            if (line.priority == DLOG_WARN)
                texts.push_back(line.text);
        }
        return texts;
    }

    static std::vector<std::string> extractorCalls() {
        std::vector<std::string> calls = device().calls();
        std::erase_if(calls, [](const auto& call) { return !call.starts_with("metadata_"); });
        return calls;
    }
};

// What it shows.

TEST_F(ToneRowTest, ShowsTheTitleAndTheDefaultTone) {
    show();
    EXPECT_THAT(texts(), ElementsAre("Alarm tone", "Alarm_Impatient"));
    EXPECT_THAT(warnings(), IsEmpty()) << "a file without a title is nothing special";
    EXPECT_EQ(alarm.soundPath, CLOCK_ALARM_DEFAULT_TONE);
}

TEST_F(ToneRowTest, ShowsTheTitleOfTheFileAsItIs) {
    tones::add(FOLDER + "bells.ogg", "Bells No. 5.ogg");
    showTone(FOLDER + "bells.ogg");
    EXPECT_THAT(texts(), ElementsAre("Alarm tone", "Bells No. 5.ogg"));
    EXPECT_EQ(alarm.soundPath, FOLDER + "bells.ogg");
    EXPECT_THAT(warnings(), IsEmpty());
}

TEST_F(ToneRowTest, ShowsTheFileNameOfAFileWithoutTitle) {
    for (const auto& [path, name] :
         std::vector<std::pair<std::string, std::string>>{{"/x/a.b.c.ogg", "a.b.c"},
                                                          {"/x/.hidden", ".hidden"},
                                                          {"/x/no extension", "no extension"},
                                                          {"/a.b/c", "c"},
                                                          {"/Alarm.ogg", "/Alarm"},
                                                          {".ogg", ".ogg"}}) {
        tones::add(path);
        showTone(path);
        EXPECT_THAT(texts(), ElementsAre("Alarm tone", name)) << path;
        EXPECT_EQ(alarm.soundPath, path);
    }
}

TEST_F(ToneRowTest, ANewToneShowsWhenTheRowIsRefreshed) {
    show();
    tones::add(FOLDER + "Bells.ogg");
    alarm.soundPath = FOLDER + "Bells.ogg";
    elm_genlist_item_update(page->item());
    stage().settle();
    EXPECT_THAT(texts(), ElementsAre("Alarm tone", "Bells"));
}

TEST_F(ToneRowTest, AMissingFileIsReplacedByTheDefaultTone) {
    showTone(FOLDER + "Gone.ogg");
    EXPECT_THAT(texts(), ElementsAre("Alarm tone", "Alarm_Impatient"));
    EXPECT_EQ(alarm.soundPath, CLOCK_ALARM_DEFAULT_TONE);
    expectLog(NO_FILE);
    EXPECT_THAT(takeErrors(), IsEmpty()) << "the record was put right, so it is told once";
}

TEST_F(ToneRowTest, ARecordWithoutAToneGetsTheDefaultTone) {
    showTone("");
    EXPECT_THAT(texts(), ElementsAre("Alarm tone", "Alarm_Impatient"));
    EXPECT_EQ(alarm.soundPath, CLOCK_ALARM_DEFAULT_TONE);
    expectLog(NO_FILE);
}

TEST_F(ToneRowTest, ADeviceWithoutTonesShowsTheDefaultTonesFileName) {
    tones::remove(CLOCK_ALARM_DEFAULT_TONE);
    show();
    EXPECT_THAT(texts(), ElementsAre("Alarm tone", "Alarm_Impatient"));
    EXPECT_THAT(takeErrors(), testing::Each(NO_FILE));
    EXPECT_THAT(warnings(), testing::Each("metadata() set_path failed"));
}

TEST_F(ToneRowTest, OnlyTheNameLooksAtTheFile) {
    show();
    alarm.soundPath = FOLDER + "Gone.ogg";
    EXPECT_EQ(answer(TITLE_PART), "Alarm tone");
    EXPECT_EQ(answer("elm.text"), "(null)");
    EXPECT_EQ(alarm.soundPath, FOLDER + "Gone.ogg");
}

TEST_F(ToneRowTest, MarkupInNamesIsOnlyText) {
    tones::add(FOLDER + "rock.ogg", "<b>Rock & Roll</b>");
    showTone(FOLDER + "rock.ogg");
    EXPECT_EQ(answer(NAME_PART), "&lt;b&gt;Rock &amp; Roll&lt;/b&gt;");
    EXPECT_TRUE(stage().shows("<b>Rock & Roll</b>"));
}

TEST_F(ToneRowTest, HostileTextsAreOnlyText) {
    tones::add(FOLDER + "bad.ogg", "%n%s \xff\xfe\xc3");
    showTone(FOLDER + "bad.ogg");
    EXPECT_TRUE(answer(NAME_PART).starts_with("%n%s "));
    const TestCatalogue hostile{{"IDS_CLOCK_TMBODY_ALARM_TONE", "%s%n"}};
    EXPECT_EQ(answer(TITLE_PART), "%s%n");
}

TEST_F(ToneRowTest, ALongTitleIsCutAtACharacter) {
    std::string title(510, 'a');
    tones::add(FOLDER + "long.ogg", title + "äb");
    showTone(FOLDER + "long.ogg");
    EXPECT_EQ(answer(NAME_PART), title);
    tones::add(FOLDER + "long.ogg", std::string(600, 'b'));
    EXPECT_EQ(answer(NAME_PART), std::string(511, 'b'));
}

TEST_F(ToneRowTest, ALongPathIsCutBeforeItIsRead) {
    const std::string path = "/" + std::string(4090, 'd') + "/abcdefgh";
    tones::add(path);
    showTone(path);
    EXPECT_EQ(answer(NAME_PART), "abc");
    const std::string asked = device().callsTo("metadata_extractor_set_path").back();
    EXPECT_EQ(asked, "metadata_extractor_set_path(\"" + path.substr(0, 4095) + "\")");
    EXPECT_EQ(alarm.soundPath, path);
}

// How it reads the title.

TEST_F(ToneRowTest, AsksTheFileForItsTitle) {
    tones::add("/x/a.ogg", "Bells");
    EXPECT_STREQ(nameOf("/x/a.ogg", 512).c_str(), "Bells");
    EXPECT_THAT(extractorCalls(), ElementsAre("metadata_extractor_create()",
                                              R"(metadata_extractor_set_path("/x/a.ogg"))",
                                              "metadata_extractor_get_metadata(METADATA_TITLE)",
                                              "metadata_extractor_destroy()"));
}

TEST_F(ToneRowTest, WithoutAnExtractorThereIsNoNameAtAll) {
    device().fail("metadata_extractor_create");
    show();
    EXPECT_EQ(answer(NAME_PART), "");
    EXPECT_THAT(texts(), ElementsAre("Alarm tone"));
    EXPECT_THAT(warnings(), testing::Each("metadata() create failed"));
    EXPECT_EQ(nameOf("/x/a.ogg", 3), "###") << "nothing is written";
    EXPECT_THAT(device().callsTo("metadata_extractor_destroy"), IsEmpty());
}

TEST_F(ToneRowTest, AFileThatCannotBeReadHasItsFileName) {
    device().fail("metadata_extractor_set_path");
    tones::add("/x/a.ogg", "Bells");
    EXPECT_STREQ(nameOf("/x/a.ogg", 512).c_str(), "a");
    EXPECT_THAT(warnings(), ElementsAre("metadata() set_path failed"));
    EXPECT_THAT(extractorCalls(), ElementsAre("metadata_extractor_create()",
                                              R"(metadata_extractor_set_path("/x/a.ogg"))",
                                              "metadata_extractor_destroy()"));
}

TEST_F(ToneRowTest, ATitleThatCannotBeReadGivesWayToTheFileName) {
    device().fail("metadata_extractor_get_metadata");
    tones::add("/x/a.ogg", "Bells");
    EXPECT_STREQ(nameOf("/x/a.ogg", 512).c_str(), "a");
    EXPECT_THAT(warnings(), ElementsAre("metadata() get failed"));
    EXPECT_EQ(extractorCalls().back(), "metadata_extractor_destroy()");
}

TEST_F(ToneRowTest, AnEmptyTitleGivesWayToTheFileName) {
    tones::add("/x/a.ogg", "");
    EXPECT_STREQ(nameOf("/x/a.ogg", 512).c_str(), "a");
    EXPECT_THAT(warnings(), ElementsAre("metadata() title_length is 0"));
    EXPECT_EQ(extractorCalls().back(), "metadata_extractor_destroy()");
}

TEST_F(ToneRowTest, ATitleOfBlanksIsATitle) {
    tones::add("/x/a.ogg", " ");
    EXPECT_STREQ(nameOf("/x/a.ogg", 512).c_str(), " ");
    EXPECT_THAT(warnings(), IsEmpty());
}

TEST_F(ToneRowTest, ANameFitsItsBufferAndClearsIt) {
    tones::add("/x/a.ogg", "Bells");
    EXPECT_EQ(nameOf("/x/a.ogg", 8), std::string("Bells\0\0\0", 8));
    EXPECT_EQ(nameOf("/x/a.ogg", 6), std::string("Bells\0", 6));
    EXPECT_EQ(nameOf("/x/a.ogg", 5), std::string("Bell\0", 5));
    EXPECT_EQ(nameOf("/x/a.ogg", 1), std::string(1, '\0'));
    tones::add("/x/chimes.ogg");
    EXPECT_EQ(nameOf("/x/chimes.ogg", 8), std::string("chimes\0\0", 8));
    EXPECT_EQ(nameOf("/x/chimes.ogg", 4), std::string("chi\0", 4));
    EXPECT_EQ(nameOf("/x/chimes.ogg", 1), std::string(1, '\0'));
    tones::add("/x/a.ogg", "öö");
    EXPECT_EQ(nameOf("/x/a.ogg", 4), std::string("ö\0\0", 4));
}

TEST_F(ToneRowTest, BadArgumentsAreRefused) {
    AlarmToneItem item(alarm);
    char path[] = "/x/a.ogg";
    char name[] = "###";
    item._getToneName(nullptr, name, sizeof name);
    item._getToneName(path, nullptr, sizeof name);
    item._getToneName(path, name, 0);
    item._getToneName(path, name, -1);
    EXPECT_STREQ(name, "###");
    EXPECT_THAT(warnings(),
                ElementsAre("Param value invalid, return", "Param value invalid, return",
                            "Param value invalid, return", "Param value invalid, return"));
    EXPECT_THAT(extractorCalls(), IsEmpty());
}

// The row in its list.

TEST_F(ToneRowTest, EveryTapCounts) {
    show();
    stage().tapText("Alarm tone");
    EXPECT_EQ(selections, 1);
    EXPECT_FALSE(elm_genlist_item_selected_get(page->item()));
    stage().tapText("Alarm_Impatient");
    EXPECT_EQ(selections, 2);
}

} // namespace

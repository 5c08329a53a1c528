#include <cstdlib>
#include <filesystem>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Helper.h"
#include "ToneList.h"

namespace fs = std::filesystem;

using namespace std::string_literals;

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using tone_picker::positionOf;
using tone_picker::Tone;
using tone_picker::tonesIn;

namespace {

constexpr const char* deviceFolder = "/opt/usr/share/settings/Ringtones";

/** A number as sound files have it, lowest byte first. */
std::string number(std::size_t value) {
    std::string bytes;
    for (const int shift : {0, 8, 16, 24})
        bytes += static_cast<char>(value >> shift & 0xFF);
    return bytes;
}

std::string chunk(const std::string& id, std::string contents) {
    if (contents.size() % 2 != 0)
        contents += '\0';
    return id + number(contents.size()) + contents;
}

/** A tag with a title of less than a hundred bytes. */
std::string titleTag(const std::string& title) {
    const std::string frame =
        "TIT2\0\0\0"s + static_cast<char>(title.size() + 1) + "\0\0\3"s + title;
    return "ID3\4\0\0\0\0\0"s + static_cast<char>(frame.size()) + frame;
}

/** A short silent sound. */
std::string sound(const std::string& title = "") {
    const std::string form = "\1\0\1\0"s + number(8000) + number(8000) + "\1\0\10\0"s;
    const std::string tag = title.empty() ? "" : chunk("ID3 ", titleTag(title));
    return chunk("RIFF",
                 "WAVE" + chunk("fmt ", form) + tag + chunk("data", std::string(800, '\x80')));
}

class ToneList : public testing::Test {
public:
    ~ToneList() override { unsetenv("CLOCK_TONE_DIR"); }

protected:
    ToneList() { setenv("CLOCK_TONE_DIR", folder.path().c_str(), 1); }

    void add(const std::string& file, const std::string& title = "") {
        writeFile(folder / file, sound(title));
    }
    std::vector<std::string> titles() {
        std::vector<std::string> texts;
        log = standardErrorOf([&] {
            for (const Tone& tone : tonesIn(deviceFolder))
                texts.push_back(tone.title);
        });
        return texts;
    }

    DeviceHost host;
    TemporaryFolder folder;
    std::string log;
};

} // namespace

TEST_F(ToneList, ATitleIsShownElseTheFilesNameWithoutExtension) {
    add("a.wav", "Bells");
    add("Morning.Light.wav");
    EXPECT_THAT(titles(), ElementsAre("Bells", "Morning.Light"));
}

TEST_F(ToneList, TonesAreSortedByTitleAsTheLanguageSorts) {
    add("1.wav", "zephyr");
    add("2.wav", "Ocean");
    add("3.wav", "\xc3\x89"
                 "b\xc3\xa8ne");
    add("4.wav", "bells");
    EXPECT_THAT(titles(), ElementsAre("bells",
                                      "\xc3\x89"
                                      "b\xc3\xa8ne",
                                      "Ocean", "zephyr"));
}

TEST_F(ToneList, TonesOfTheSameTitleAreInTheOrderOfTheirFiles) {
    for (const char* file : {"c.wav", "a.wav", "b.wav"})
        add(file, "Same");
    const auto tones = tonesIn(deviceFolder);
    ASSERT_EQ(tones.size(), 3U);
    EXPECT_EQ(tones[0].file + tones[1].file + tones[2].file, "a.wavb.wavc.wav");
}

TEST_F(ToneList, OnlySoundFilesAreListed) {
    add("Sound.WAV");
    add("Hidden/inside.wav");
    add(".hidden.wav");
    add("sound.txt");
    writeFile(folder / "text.ogg", "no sound");
    writeFile(folder / "empty.mp3", "");
    fs::create_symlink(folder / "nowhere", folder / "dangling.wav");
    EXPECT_THAT(titles(), ElementsAre("Sound"));
}

TEST_F(ToneList, AMissingFolderHasNoTonesAndIsLogged) {
    setenv("CLOCK_TONE_DIR", (folder / "gone").c_str(), 1);
    EXPECT_THAT(titles(), IsEmpty());
    EXPECT_THAT(log, HasSubstr(folder / "gone"));
}

TEST_F(ToneList, AnEmptyFolderHasNoTones) {
    EXPECT_THAT(titles(), IsEmpty());
    EXPECT_EQ(log, "");
}

TEST_F(ToneList, AFolderOfThisMachineIsListedToo) {
    add("Bells.wav");
    unsetenv("CLOCK_TONE_DIR");
    EXPECT_EQ(tonesIn(folder.path()).size(), 1U);
}

TEST_F(ToneList, ATonesPlaceIsFoundByItsPathOnTheDevice) {
    const std::vector<Tone> tones{{"a.ogg", "A"}, {"b.ogg", "B"}};
    const std::string path = deviceFolder + "/b.ogg"s;
    EXPECT_EQ(positionOf(tones, deviceFolder, path), 1);
    EXPECT_EQ(positionOf(tones, deviceFolder + "/"s, path), 1);
    EXPECT_EQ(positionOf(tones, deviceFolder, "/elsewhere/b.ogg"), -1);
    EXPECT_EQ(positionOf(tones, deviceFolder, "b.ogg"), -1);
    EXPECT_EQ(positionOf(tones, deviceFolder, ""), -1);
    EXPECT_EQ(positionOf({}, deviceFolder, path), -1);
}

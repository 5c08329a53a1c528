#include <cstdlib>
#include <filesystem>
#include <optional>
#include <random>
#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include "Helper.h"
#include "device/metadata_extractor.h"

namespace fs = std::filesystem;

using testing::HasSubstr;

namespace {

constexpr const char* TAGGED_FORMATS[] = {"ogg", "mp3", "flac"};
constexpr int NONE = METADATA_EXTRACTOR_ERROR_NONE;
constexpr int INVALID = METADATA_EXTRACTOR_ERROR_INVALID_PARAMETER;
constexpr int NO_FILE = METADATA_EXTRACTOR_ERROR_FILE;
constexpr int NO_SOUND = METADATA_EXTRACTOR_ERROR_FORMAT;

struct Answer {
    int result;
    std::optional<std::string> title;
};

/** What an application gets to know of a file. */
Answer ask(const std::string& path) {
    metadata_extractor_h extractor = nullptr;
    EXPECT_EQ(metadata_extractor_create(&extractor), NONE);
    Answer answer{metadata_extractor_set_path(extractor, path.c_str()), {}};
    if (answer.result == NONE) {
        char* value = nullptr;
        answer.result = metadata_extractor_get_metadata(extractor, METADATA_TITLE, &value);
        if (value)
            answer.title = value;
        std::free(value);
    }
    EXPECT_EQ(metadata_extractor_destroy(extractor), NONE);
    return answer;
}

Answer askQuietly(const std::string& path) {
    Answer answer{};
    standardErrorOf([&] { answer = ask(path); });
    return answer;
}

/** Changes one text in a file for another one of the same length. */
void patch(const std::string& path, const std::string& from, const std::string& to) {
    std::string bytes = readFile(path);
    const auto at = bytes.find(from);
    ASSERT_NE(at, std::string::npos) << from << " in " << path;
    bytes.replace(at, from.size(), to);
    writeFile(path, bytes);
}

class MetadataExtractor : public testing::Test {
protected:
    /** A short sound in a file. @param comment The words of sox about its tags. */
    std::string make(const std::string& name, const std::string& comment) const {
        std::string path = folder / name;
        const std::string command =
            "sox -V1 -n -r 44100 -c 1 " + comment + " " + path + " synth 0.1 sine 441";
        EXPECT_EQ(std::system(command.c_str()), 0);
        return path;
    }
    static std::string builtTone(const std::string& name) {
        return std::string(CLOCK_RESOURCE_DIR "/tones/") + name;
    }

    TemporaryFolder folder;
    DeviceHost host;
};

} // namespace

TEST_F(MetadataExtractor, ReadsTheTitleOfEveryBuiltTone) {
    EXPECT_EQ(ask(builtTone("Alarm_Impatient.ogg")).title, "Impatient");
    EXPECT_EQ(ask(builtTone("Alarm_Music_Box.mp3")).title, "Music Box");
    EXPECT_EQ(ask(builtTone("Alarm_Sunrise.flac")).title, "Sunrise");
    EXPECT_EQ(ask(builtTone("Alarm_Drops.wav")).title, "Drops");
}

TEST_F(MetadataExtractor, ReadsATitleAsItIsInEveryFormat) {
    const std::string title = "Ça va. (Frühling, 봄) <&>";
    for (const char* format : TAGGED_FORMATS) {
        const Answer answer =
            ask(make(std::string("a.") + format, "--comment 'TITLE=" + title + "'"));
        EXPECT_EQ(answer.result, NONE) << format;
        // The writer of this format's tags knows only the letters of Western Europe.
        if (format != std::string("mp3")) {
            EXPECT_EQ(answer.title, title) << format;
        }
    }
}

TEST_F(MetadataExtractor, KnowsASoundByWhatItHoldsWhateverItIsCalled) {
    const std::string path = make("a.mp3", "--comment TITLE=Disguised");
    for (const char* name : {"a.ogg", "a.flac", "a.txt", "a"}) {
        fs::copy_file(path, folder / name);
        EXPECT_EQ(ask(folder / name).title, "Disguised") << name;
    }
}

TEST_F(MetadataExtractor, HasNoTitleForASoundWithoutOne) {
    for (const char* format : {"ogg", "mp3", "flac", "wav"}) {
        const Answer answer = ask(make(std::string("a.") + format, "--comment ARTIST=Nobody"));
        EXPECT_EQ(answer.result, NONE) << format;
        EXPECT_EQ(answer.title, std::nullopt) << format;
    }
}

TEST_F(MetadataExtractor, TellsAnEmptyTitleFromNone) {
    const std::string path = make("a.mp3", "--comment ''");
    // A tag of 12 bytes: one frame with a text of no letters in the first encoding.
    const std::string frame = "TIT2" + std::string{'\0', '\0', '\0', '\2', '\0', '\0', '\0', '\0'};
    const std::string tag = "ID3" + std::string{'\3', '\0', '\0', '\0', '\0', '\0', '\14'} + frame;
    writeFile(path, tag + readFile(path));
    const Answer answer = ask(path);
    EXPECT_EQ(answer.result, NONE);
    EXPECT_EQ(answer.title, "");
}

TEST_F(MetadataExtractor, AnEmptyCommentIsNoTitle) {
    for (const char* format : {"ogg", "flac"}) {
        const Answer answer = ask(make(std::string("a.") + format, "--comment TITLE="));
        EXPECT_EQ(answer.result, NONE) << format;
        EXPECT_EQ(answer.title.value_or(""), "") << format;
    }
}

TEST_F(MetadataExtractor, ATitleOfAnotherNameIsNone) {
    const std::string path = make("a.flac", "--comment TITLE=Sunrise");
    patch(path, "TITLE=Sunrise", "TITLX=Sunrise");
    EXPECT_EQ(ask(path).title, std::nullopt);
}

TEST_F(MetadataExtractor, TitlesThatAreNotTextDoNotBreakAnything) {
    const std::string path = make("a.flac", "--comment TITLE=Sunrise");
    patch(path, "Sunrise",
          "\xFF\xC3\xFE"
          "ise\x80");
    EXPECT_EQ(ask(path).result, NONE);
}

TEST_F(MetadataExtractor, AToneOfTheDeviceIsFoundInTheToneFolder) {
    setenv("CLOCK_TONE_DIR", CLOCK_RESOURCE_DIR "/tones", 1);
    const Answer answer = ask("/opt/usr/share/settings/Ringtones/Alarm_Impatient.ogg");
    unsetenv("CLOCK_TONE_DIR");
    EXPECT_EQ(answer.title, "Impatient");
}

TEST_F(MetadataExtractor, WhatCannotBeReadIsAnErrorOfTheFileAndLogged) {
    EXPECT_EQ(askQuietly("").result, NO_FILE);
    EXPECT_EQ(askQuietly(folder / "none.ogg").result, NO_FILE);
    EXPECT_EQ(askQuietly(folder.path()).result, NO_FILE);
    EXPECT_EQ(askQuietly("/dev/null").result, NO_FILE);
    fs::create_symlink(folder / "nowhere", folder / "link.ogg");
    EXPECT_EQ(askQuietly(folder / "link.ogg").result, NO_FILE);
    EXPECT_THAT(standardErrorOf([&] { ask(folder / "none.ogg"); }), HasSubstr("none.ogg"));
    const std::string locked = make("locked.ogg", "--comment TITLE=Locked");
    fs::permissions(locked, fs::perms::none);
    // Nothing is locked for root.
    if (access(locked.c_str(), R_OK) != 0) {
        EXPECT_EQ(askQuietly(locked).result, NO_FILE);
    }
}

TEST_F(MetadataExtractor, APipeIsRefusedWithoutWaitingForAWriter) {
    const std::string pipe = folder / "pipe.ogg";
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
    EXPECT_EQ(askQuietly(pipe).result, NO_FILE);
}

TEST_F(MetadataExtractor, AFileThatGoesAfterItWasChosenIsAnErrorOfTheFile) {
    const std::string path = make("a.ogg", "--comment TITLE=Gone");
    metadata_extractor_h extractor = nullptr;
    metadata_extractor_create(&extractor);
    EXPECT_EQ(metadata_extractor_set_path(extractor, path.c_str()), NONE);
    fs::remove(path);
    char untouched[] = "";
    char* value = untouched;
    standardErrorOf([&] {
        EXPECT_EQ(metadata_extractor_get_metadata(extractor, METADATA_TITLE, &value), NO_FILE);
    });
    EXPECT_EQ(value, nullptr);
    metadata_extractor_destroy(extractor);
}

TEST_F(MetadataExtractor, WhatIsNoSoundIsAnErrorOfTheFormatWhateverItIsCalled) {
    for (const char* format : {"ogg", "mp3", "flac", "wav", "txt"}) {
        const std::string path = folder / (std::string("a.") + format);
        writeFile(path, "");
        EXPECT_EQ(askQuietly(path).result, NO_SOUND) << format;
        writeFile(path, "This is not the sound of anything.\n");
        EXPECT_EQ(askQuietly(path).result, NO_SOUND) << format;
        writeFile(path, std::string(100000, '\0'));
        EXPECT_EQ(askQuietly(path).result, NO_SOUND) << format;
    }
}

TEST_F(MetadataExtractor, FilesThatAreCutOffAreAnAnswerOrAnError) {
    for (const char* name :
         {"Alarm_Impatient.ogg", "Alarm_Music_Box.mp3", "Alarm_Sunrise.flac", "Alarm_Drops.wav"}) {
        const std::string whole = readFile(builtTone(name));
        for (std::size_t size = 1; size < 6000; size += size < 300 ? 7 : 331) {
            writeFile(folder / name, whole.substr(0, size));
            const int result = askQuietly(folder / name).result;
            EXPECT_TRUE(result == NONE || result == NO_SOUND) << name << " cut at " << size;
        }
    }
}

TEST_F(MetadataExtractor, FilesWithWrongBytesAreAnAnswerOrAnError) {
    std::mt19937 random(1);
    for (const char* name :
         {"Alarm_Impatient.ogg", "Alarm_Music_Box.mp3", "Alarm_Sunrise.flac", "Alarm_Drops.wav"}) {
        const std::string whole = readFile(builtTone(name));
        for (int round = 0; round < 60; ++round) {
            std::string damaged = whole;
            for (int count = 0; count < 8; ++count)
                damaged[random() % 400] = static_cast<char>(random());
            // Titles of a WAV file stand at its end.
            damaged[damaged.size() - 1 - random() % 40] = static_cast<char>(random());
            writeFile(folder / name, damaged);
            const int result = askQuietly(folder / name).result;
            EXPECT_TRUE(result == NONE || result == NO_SOUND) << name;
        }
    }
}

TEST_F(MetadataExtractor, RefusesNullUnknownAttributesAndNoPath) {
    metadata_extractor_h extractor = nullptr;
    char* value = nullptr;
    EXPECT_EQ(metadata_extractor_create(nullptr), INVALID);
    ASSERT_EQ(metadata_extractor_create(&extractor), NONE);
    EXPECT_EQ(metadata_extractor_get_metadata(extractor, METADATA_TITLE, &value), INVALID);
    EXPECT_EQ(metadata_extractor_set_path(nullptr, "/"), INVALID);
    EXPECT_EQ(metadata_extractor_set_path(extractor, nullptr), INVALID);
    EXPECT_EQ(metadata_extractor_set_path(extractor, builtTone("Alarm_Impatient.ogg").c_str()),
              NONE);
    EXPECT_EQ(metadata_extractor_get_metadata(nullptr, METADATA_TITLE, &value), INVALID);
    EXPECT_EQ(metadata_extractor_get_metadata(extractor, METADATA_TITLE, nullptr), INVALID);
    EXPECT_EQ(metadata_extractor_get_metadata(extractor, static_cast<metadata_extractor_attr_e>(3),
                                              &value),
              INVALID);
    EXPECT_EQ(metadata_extractor_destroy(extractor), NONE);
    EXPECT_EQ(metadata_extractor_destroy(nullptr), INVALID);
}

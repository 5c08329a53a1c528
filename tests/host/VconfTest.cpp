#include <algorithm>
#include <climits>
#include <csignal>
#include <cstdlib>
#include <filesystem>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include "Helper.h"
#include "device/vconf.h"
#include "device_host.h"
#include "device_remote.h"

namespace fs = std::filesystem;

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

namespace {

constexpr const char* formatKey = "db/menu_widget/regionformat_time1224";
constexpr const char* countKey = "memory/private/com.vendra.indicator/alarm";

class Vconf : public testing::Test {
protected:
    /** The one file that holds the value of a key. */
    std::string fileOf(const std::string& folder) const {
        std::vector<std::string> files;
        for (const auto& entry : fs::directory_iterator(folder + "/settings"))
            files.push_back(entry.path());
        return files.size() == 1 ? files[0] : "not one file";
    }

    std::string stringOf(const char* key) const {
        char* text = vconf_get_str(key);
        std::string copy = text ? text : "(null)";
        std::free(text);
        return copy;
    }

    DeviceHost host;
};

/** The keys that changed, in order. */
class ChangeLog {
public:
    void watch(const char* key) { EXPECT_EQ(vconf_notify_key_changed(key, changedCb, this), 0); }
    const std::vector<std::string>& keys() const { return _keys; }
    bool waitFor(std::size_t count) {
        return iterateUntil([&] { return _keys.size() >= count; });
    }

private:
    static void changedCb(keynode_t* node, void* data) {
        static_cast<ChangeLog*>(data)->_keys.emplace_back(vconf_keynode_get_name(node));
    }

    std::vector<std::string> _keys;
};

} // namespace

TEST_F(Vconf, AMissingKeyFailsAndLeavesTheValueUntouched) {
    int value = 42;
    EXPECT_EQ(vconf_get_int(formatKey, &value), VCONF_ERROR);
    EXPECT_EQ(vconf_get_bool(formatKey, &value), VCONF_ERROR);
    EXPECT_EQ(value, 42);
    EXPECT_EQ(vconf_get_str(formatKey), nullptr);
}

TEST_F(Vconf, ValuesAreReadAsTheyWereWritten) {
    for (const int number : {0, -1, 7, INT_MAX, INT_MIN}) {
        int value = 42;
        EXPECT_EQ(vconf_set_int(formatKey, number), VCONF_OK);
        EXPECT_EQ(vconf_get_int(formatKey, &value), VCONF_OK);
        EXPECT_EQ(value, number);
    }
    for (const std::string text :
         {"", "en_US.UTF-8", " two  words ", "한국어", "a\nb\n", "int 7"}) {
        EXPECT_EQ(vconf_set_str("db/text", text.c_str()), VCONF_OK);
        EXPECT_EQ(stringOf("db/text"), text);
    }
    int flag = 42;
    EXPECT_EQ(vconf_set_bool("db/flag", 5), VCONF_OK);
    EXPECT_EQ(vconf_get_bool("db/flag", &flag), VCONF_OK);
    EXPECT_EQ(flag, 1);
    EXPECT_EQ(vconf_set_bool("db/flag", 0), VCONF_OK);
    EXPECT_EQ(vconf_get_bool("db/flag", &flag), VCONF_OK);
    EXPECT_EQ(flag, 0);
}

TEST_F(Vconf, ReadingAnotherTypeIsAnErrorOfItsOwn) {
    int value = 42;
    vconf_set_str(formatKey, "12");
    EXPECT_EQ(vconf_get_int(formatKey, &value), VCONF_ERROR_WRONG_TYPE);
    EXPECT_EQ(vconf_get_bool(formatKey, &value), VCONF_ERROR_WRONG_TYPE);
    vconf_set_int(formatKey, 1);
    EXPECT_EQ(vconf_get_bool(formatKey, &value), VCONF_ERROR_WRONG_TYPE);
    EXPECT_EQ(vconf_get_str(formatKey), nullptr);
    EXPECT_EQ(value, 42);
}

TEST_F(Vconf, LastingKeysLieInTheDataFolderAndOthersInTheRuntimeFolder) {
    vconf_set_int(formatKey, 1);
    EXPECT_TRUE(fs::is_regular_file(fileOf(host.dataDir())));
    EXPECT_FALSE(fs::exists(host.runtimeDir() + "/settings"));
    vconf_set_int(countKey, 3);
    EXPECT_TRUE(fs::is_regular_file(fileOf(host.runtimeDir())));
}

TEST_F(Vconf, ValuesAreForTheOwnerOnly) {
    vconf_set_int(formatKey, 1);
    EXPECT_EQ(fs::status(fileOf(host.dataDir())).permissions(),
              fs::perms::owner_read | fs::perms::owner_write);
    EXPECT_EQ(fs::status(host.dataDir() + "/settings").permissions(), fs::perms::owner_all);
}

TEST_F(Vconf, AKeyMayBeTheBeginningOfAnotherOne) {
    EXPECT_EQ(vconf_set_int("db/a", 1), VCONF_OK);
    EXPECT_EQ(vconf_set_int("db/a/b", 2), VCONF_OK);
    EXPECT_EQ(vconf_set_int("db/a%2Fb", 3), VCONF_OK);
    int value = 0;
    EXPECT_EQ(vconf_get_int("db/a/b", &value), VCONF_OK);
    EXPECT_EQ(value, 2);
}

TEST_F(Vconf, WhatIsNotTheNameOfASettingIsRefused) {
    const std::string tooLong = "db/" + std::string(300, 'x');
    for (const char* key :
         {"", "/", "db", "db/", "/db/a", "db//a", "db/a/", "db/../a", "db/a/..", "db/./a",
          "../db/a", "memory", "file/a", tooLong.c_str(), static_cast<const char*>(nullptr)}) {
        int value = 42;
        const auto log = standardErrorOf([&] {
            EXPECT_EQ(vconf_set_int(key, 1), VCONF_ERROR);
            EXPECT_EQ(vconf_set_bool(key, 1), VCONF_ERROR);
            EXPECT_EQ(vconf_set_str(key, "x"), VCONF_ERROR);
            EXPECT_EQ(vconf_get_int(key, &value), VCONF_ERROR);
            EXPECT_EQ(vconf_get_bool(key, &value), VCONF_ERROR);
            EXPECT_EQ(vconf_get_str(key), nullptr);
            EXPECT_EQ(vconf_notify_key_changed(
                          key, [](keynode_t*, void*) {}, nullptr),
                      VCONF_ERROR);
        });
        EXPECT_EQ(value, 42);
        EXPECT_THAT(log, HasSubstr("is not the name of a setting"));
    }
    EXPECT_FALSE(fs::exists(host.dataDir() + "/settings"));
}

TEST_F(Vconf, NullArgumentsAreRefused) {
    vconf_set_int(formatKey, 1);
    EXPECT_EQ(vconf_get_int(formatKey, nullptr), VCONF_ERROR);
    EXPECT_EQ(vconf_get_bool(formatKey, nullptr), VCONF_ERROR);
    EXPECT_EQ(vconf_set_str(formatKey, nullptr), VCONF_ERROR);
    EXPECT_EQ(vconf_notify_key_changed(formatKey, nullptr, nullptr), VCONF_ERROR);
    EXPECT_EQ(vconf_keynode_get_name(nullptr), nullptr);
}

TEST_F(Vconf, ADamagedFileIsAMissingValueThatIsLoggedAndCanBeWrittenAnew) {
    vconf_set_int(formatKey, 1);
    const std::string file = fileOf(host.dataDir());
    using namespace std::string_literals;
    for (const std::string& contents :
         {""s, "int"s, "int 1"s, "int one\n"s, "int 1 2\n"s, "int 99999999999\n"s, "int \n"s,
          "bool 2\n"s, "float 1\n"s, "\n"s, "string a\0b\n"s, "\xff\xfe\n"s,
          "string " + std::string(100000, 'x') + "\n"}) {
        writeFile(file, contents);
        int value = 42;
        const auto log = standardErrorOf([&] {
            EXPECT_EQ(vconf_get_int(formatKey, &value), VCONF_ERROR) << contents.substr(0, 20);
            EXPECT_EQ(vconf_get_str(formatKey), nullptr) << contents.substr(0, 20);
        });
        EXPECT_EQ(value, 42);
        EXPECT_THAT(log, HasSubstr(file));
    }
    int value = 42;
    EXPECT_EQ(vconf_set_int(formatKey, 5), VCONF_OK);
    EXPECT_EQ(vconf_get_int(formatKey, &value), VCONF_OK);
    EXPECT_EQ(value, 5);
}

TEST_F(Vconf, SomethingElseInTheFilesPlaceIsAnErrorAndDoesNotBlock) {
    vconf_set_int(formatKey, 1);
    const std::string file = fileOf(host.dataDir());
    const auto expectFailure = [&](const char* what) {
        int value = 42;
        standardErrorOf([&] { EXPECT_EQ(vconf_get_int(formatKey, &value), VCONF_ERROR) << what; });
    };
    fs::remove(file);
    fs::create_directory(file);
    expectFailure("folder");
    const auto log = standardErrorOf([] { EXPECT_EQ(vconf_set_int(formatKey, 2), VCONF_ERROR); });
    EXPECT_THAT(log, HasSubstr("Is a directory"));
    EXPECT_EQ(fileOf(host.dataDir()), file) << "a failed write leaves nothing behind";
    fs::remove(file);
    mkfifo(file.c_str(), 0600);
    expectFailure("named pipe");
    fs::remove(file);
    fs::create_symlink(file, file);
    expectFailure("endless link");
    EXPECT_EQ(vconf_set_int(formatKey, 2), VCONF_OK) << "a write replaces the link";
}

TEST_F(Vconf, AFolderThatCannotBeMadeIsAnError) {
    writeFile(host.dataDir() + "/settings", "in the way");
    const auto log = standardErrorOf([] {
        EXPECT_EQ(vconf_set_int(formatKey, 1), VCONF_ERROR);
        EXPECT_EQ(vconf_notify_key_changed(
                      formatKey, [](keynode_t*, void*) {}, nullptr),
                  VCONF_ERROR);
    });
    EXPECT_THAT(log, HasSubstr("Not a directory"));
    EXPECT_EQ(readFile(host.dataDir() + "/settings"), "in the way");
}

TEST_F(Vconf, TheLongestTextIsKeptAndALongerOneRefused) {
    const std::string longest(65536, 'x');
    EXPECT_EQ(vconf_set_str("db/text", longest.c_str()), VCONF_OK);
    EXPECT_EQ(stringOf("db/text"), longest);
    const auto log = standardErrorOf(
        [&] { EXPECT_EQ(vconf_set_str("db/text", (longest + "x").c_str()), VCONF_ERROR); });
    EXPECT_THAT(log, HasSubstr("longer than"));
    EXPECT_EQ(stringOf("db/text"), longest);
}

TEST_F(Vconf, AnotherProcessReadsWhatWasWritten) {
    EXPECT_EQ(waitFor(startHelper({"set-str", "db/text", "from the other process"})), 0);
    EXPECT_EQ(stringOf("db/text"), "from the other process");
}

TEST_F(Vconf, AChangeByAnotherProcessRunsTheCallback) {
    vconf_set_int(formatKey, 1);
    ChangeLog changes;
    changes.watch(formatKey);
    EXPECT_EQ(waitFor(startHelper({"set-int", formatKey, "2"})), 0);
    EXPECT_TRUE(changes.waitFor(1));
    iterateFor(0.1);
    EXPECT_THAT(changes.keys(), ElementsAre(formatKey));
    int value = 0;
    vconf_get_int(formatKey, &value);
    EXPECT_EQ(value, 2);
}

TEST_F(Vconf, WhoeverAsksForItGetsAllEarlierChangesAtOnce) {
    ChangeLog changes;
    changes.watch(formatKey);
    EXPECT_EQ(waitFor(startHelper({"set-int", formatKey, "2"})), 0);
    EXPECT_THAT(changes.keys(), IsEmpty());
    const char* request[] = {"settings"};
    EXPECT_EQ(device_remote_send(request, 1), 0);
    EXPECT_THAT(changes.keys(), ElementsAre(formatKey)) << "before the main loop turns";
    iterateFor(0.1);
    EXPECT_THAT(changes.keys(), ElementsAre(formatKey)) << "and not twice";
}

TEST_F(Vconf, AKeyThatDoesNotExistYetCanBeWatched) {
    ChangeLog changes;
    changes.watch(countKey);
    iterateFor(0.05);
    EXPECT_THAT(changes.keys(), IsEmpty());
    EXPECT_EQ(waitFor(startHelper({"set-int", countKey, "1"})), 0);
    EXPECT_TRUE(changes.waitFor(1));
    EXPECT_THAT(changes.keys(), ElementsAre(countKey));
}

TEST_F(Vconf, AnOwnChangeRunsTheCallbackOnceAndOnTheMainLoop) {
    ChangeLog changes;
    changes.watch(formatKey);
    vconf_set_int(formatKey, 2);
    EXPECT_THAT(changes.keys(), IsEmpty()) << "not from inside the setter";
    EXPECT_TRUE(changes.waitFor(1));
    iterateFor(0.1);
    EXPECT_THAT(changes.keys(), ElementsAre(formatKey));
}

TEST_F(Vconf, WritingTheSameValueAgainIsNoChange) {
    vconf_set_int(formatKey, 2);
    ChangeLog changes;
    changes.watch(formatKey);
    vconf_set_int(formatKey, 2);
    iterateFor(0.1);
    EXPECT_THAT(changes.keys(), IsEmpty());
    vconf_set_str(formatKey, "2");
    EXPECT_TRUE(changes.waitFor(1)) << "another type is a change";
}

TEST_F(Vconf, OnlyTheCallbacksOfTheChangedKeyRun) {
    ChangeLog format;
    ChangeLog region;
    format.watch(formatKey);
    region.watch("db/menu_widget/regionformat");
    vconf_set_str("db/menu_widget/regionformat", "ko_KR");
    EXPECT_TRUE(region.waitFor(1));
    EXPECT_THAT(format.keys(), IsEmpty());
}

TEST_F(Vconf, EveryCallbackOfAKeyRuns) {
    ChangeLog first;
    ChangeLog second;
    first.watch(formatKey);
    second.watch(formatKey);
    vconf_set_int(formatKey, 2);
    EXPECT_TRUE(second.waitFor(1));
    EXPECT_THAT(first.keys(), ElementsAre(formatKey));
}

TEST_F(Vconf, ACallbackMayAddCallbacksAndWrite) {
    struct State {
        ChangeLog added;
        int runs = 0;
    } state;
    const auto callback = [](keynode_t*, void* data) {
        auto* seen = static_cast<State*>(data);
        if (++seen->runs == 1) {
            seen->added.watch(formatKey);
            vconf_set_int(formatKey, 3);
        }
    };
    vconf_notify_key_changed(formatKey, callback, &state);
    vconf_set_int(formatKey, 2);
    EXPECT_TRUE(state.added.waitFor(1));
    EXPECT_EQ(state.runs, 2);
    EXPECT_THAT(state.added.keys(), ElementsAre(formatKey)) << "only the change after it was added";
}

TEST_F(Vconf, ACallbackMayEndTheDevice) {
    ChangeLog later;
    vconf_notify_key_changed(
        formatKey, [](keynode_t*, void*) { device_host_shutdown(); }, nullptr);
    later.watch(formatKey);
    vconf_set_int(formatKey, 2);
    iterateFor(0.1);
    EXPECT_THAT(later.keys(), IsEmpty());
}

TEST_F(Vconf, AValueEditedByHandIsAChange) {
    vconf_set_int(formatKey, 1);
    const std::string file = fileOf(host.dataDir());
    ChangeLog changes;
    changes.watch(formatKey);
    writeFile(file, "int 2\n");
    EXPECT_TRUE(changes.waitFor(1));
    int value = 0;
    vconf_get_int(formatKey, &value);
    EXPECT_EQ(value, 2);
    fs::remove(file);
    EXPECT_TRUE(changes.waitFor(2));
}

TEST_F(Vconf, ChangesAreSeenAfterTheFolderWasRemovedAndMadeAnew) {
    ChangeLog changes;
    changes.watch(countKey);
    fs::remove_all(host.runtimeDir());
    iterateUntil([&] { return fs::exists(host.runtimeDir() + "/settings"); });
    const auto before = changes.keys().size();
    EXPECT_EQ(waitFor(startHelper({"set-int", countKey, "1"})), 0);
    EXPECT_TRUE(changes.waitFor(before + 1));
}

TEST_F(Vconf, AReaderNeverSeesHalfAValueOfConcurrentWriters) {
    const std::vector<pid_t> writers{startHelper({"write-for-ever", "db/text"}),
                                     startHelper({"write-for-ever", "db/text"})};
    EXPECT_TRUE(iterateUntil([&] { return stringOf("db/text") != "(null)"; }));
    for (int round = 0; round < 2000; ++round) {
        const std::string text = stringOf("db/text");
        const bool ones = text == std::string(20000, '1');
        const bool twos = text == std::string(60000, '2');
        ASSERT_TRUE(ones || twos) << text.size() << " bytes: " << text.substr(0, 20);
    }
    for (const pid_t writer : writers) {
        kill(writer, SIGKILL);
        EXPECT_EQ(waitFor(writer), -1) << "the writer still wrote";
    }
}

TEST_F(Vconf, AKilledWriterLeavesTheOldOrTheNewValue) {
    for (int round = 0; round < 20; ++round) {
        const pid_t writer = startHelper({"write-for-ever", "db/text"});
        usleep(20000 + 1777 * round);
        kill(writer, SIGKILL);
        EXPECT_EQ(waitFor(writer), -1);
        const std::string text = stringOf("db/text");
        EXPECT_TRUE(text == "(null)" || text == std::string(20000, '1') ||
                    text == std::string(60000, '2'))
            << text.size();
    }
}

TEST_F(Vconf, WhatAKilledWriterLeftBehindIsRemovedAfterAWhile) {
    DeviceHost later;
    const std::string old = later.dataDir() + "/settings/.new-aaaaaa";
    const std::string fresh = later.dataDir() + "/settings/.new-bbbbbb";
    writeFile(old, "string ha");
    writeFile(fresh, "string ha");
    fs::last_write_time(old, fs::file_time_type::clock::now() - std::chrono::hours(1));
    vconf_set_int(formatKey, 1);
    EXPECT_FALSE(fs::exists(old));
    EXPECT_TRUE(fs::exists(fresh)) << "its writer may be alive";
}

#include "base/SqliteDatabase.h"

#include <chrono>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/resource.h>

#include "host/ClockStore.h"
#include "host/Helper.h"

namespace fs = std::filesystem;

namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::StartsWith;

const std::vector<std::string> first{"CREATE TABLE note(text TEXT NOT NULL) STRICT"};
const std::vector<std::string> second{first[0], "ALTER TABLE note ADD COLUMN place TEXT"};

class ClockSqliteDatabaseTest : public testing::Test {
protected:
    std::string path() const { return folder / "test.db"; }

    bool addNote(base::SqliteDatabase& database, const std::string& text) {
        auto insert = database.prepare("INSERT INTO note(text) VALUES(?1)");
        return insert.bind(1, std::string_view(text)).run();
    }
    std::int64_t notes(base::SqliteDatabase& database) {
        auto query = database.prepare("SELECT COUNT(*) FROM note");
        return query.step() ? query.integer(0) : -1;
    }
    void createWithOneNote() {
        base::SqliteDatabase database(path());
        ASSERT_TRUE(database.open("notes", first)) << database.lastError();
        ASSERT_TRUE(addNote(database, "first"));
    }
    std::vector<std::string> files() const {
        std::vector<std::string> names;
        for (const auto& entry : fs::directory_iterator(folder.path()))
            names.push_back(entry.path().filename());
        return names;
    }

    TemporaryFolder folder;
};

TEST_F(ClockSqliteDatabaseTest, KeepsWhatWasWritten) {
    createWithOneNote();
    base::SqliteDatabase database(path());
    ASSERT_TRUE(database.open("notes", first));
    auto query = database.prepare("SELECT text FROM note");
    ASSERT_TRUE(query.step());
    EXPECT_EQ(query.text(0), "first");
    EXPECT_FALSE(query.step());
    EXPECT_FALSE(query.failed());
}

TEST_F(ClockSqliteDatabaseTest, WritesAheadAndWaitsForTheDisk) {
    base::SqliteDatabase database(path());
    ASSERT_TRUE(database.open("notes", first));
    auto mode = database.prepare("PRAGMA journal_mode");
    ASSERT_TRUE(mode.step());
    EXPECT_EQ(mode.text(0), "wal");
    auto waiting = database.prepare("PRAGMA synchronous");
    ASSERT_TRUE(waiting.step());
    EXPECT_EQ(waiting.integer(0), 2);
}

TEST_F(ClockSqliteDatabaseTest, KeepsAnyText) {
    base::SqliteDatabase database(path());
    ASSERT_TRUE(database.open("notes", first));
    const std::vector<std::string> texts{"", "O'Brien; DROP TABLE note", "日本 😀",
                                         std::string("a\0b", 3), std::string(100000, 'x')};
    for (const auto& text : texts)
        ASSERT_TRUE(addNote(database, text));
    auto query = database.prepare("SELECT text FROM note ORDER BY rowid");
    for (const auto& text : texts) {
        ASSERT_TRUE(query.step());
        EXPECT_EQ(query.text(0), text);
    }
}

TEST_F(ClockSqliteDatabaseTest, AStatementCanRunAgain) {
    base::SqliteDatabase database(path());
    ASSERT_TRUE(database.open("notes", first));
    auto insert = database.prepare("INSERT INTO note(text) VALUES(?1)");
    EXPECT_TRUE(insert.bind(1, std::string_view("a")).run());
    EXPECT_TRUE(insert.bind(1, std::string_view("b")).run());
    EXPECT_EQ(database.changes(), 1);
    EXPECT_EQ(database.lastInsertId(), 2);
    EXPECT_EQ(notes(database), 2);
}

TEST_F(ClockSqliteDatabaseTest, AWrongStatementFailsAndSaysWhy) {
    base::SqliteDatabase database(path());
    ASSERT_TRUE(database.open("notes", first));
    auto wrong = database.prepare("SELECT * FROM nowhere");
    EXPECT_FALSE(wrong.bind(1, std::int64_t(1)).step());
    EXPECT_TRUE(wrong.failed());
    EXPECT_FALSE(wrong.run());
    EXPECT_EQ(wrong.text(0), "");
    EXPECT_EQ(wrong.integer(0), 0);
    EXPECT_THAT(database.lastError(), HasSubstr("no such table: nowhere"));
}

TEST_F(ClockSqliteDatabaseTest, WithoutBeingOpenEverythingFails) {
    base::SqliteDatabase database(path());
    EXPECT_FALSE(database.isOpen());
    EXPECT_FALSE(database.execute("SELECT 1"));
    EXPECT_FALSE(database.transaction([] { return true; }));
    EXPECT_TRUE(database.prepare("SELECT 1").failed());
    EXPECT_EQ(database.lastInsertId(), 0);
    EXPECT_EQ(database.changes(), 0);
    EXPECT_EQ(database.lastError(), "not open");
}

// --- Transactions --------------------------------------------------------------------------

TEST_F(ClockSqliteDatabaseTest, ATransactionIsKeptWholeOrNotAtAll) {
    base::SqliteDatabase database(path());
    ASSERT_TRUE(database.open("notes", first));
    EXPECT_FALSE(database.transaction([&] { return addNote(database, "a") && false; }));
    EXPECT_EQ(notes(database), 0);
    EXPECT_TRUE(database.transaction([&] { return addNote(database, "b"); }));
    EXPECT_EQ(notes(database), 1);
}

TEST_F(ClockSqliteDatabaseTest, ATransactionThatFailsSaysWhyAfterItWasUndone) {
    base::SqliteDatabase database(path());
    ASSERT_TRUE(database.open("notes", first));
    EXPECT_FALSE(database.transaction([&] {
        addNote(database, "a");
        return database.execute("INSERT INTO note(text) VALUES(NULL)");
    }));
    EXPECT_THAT(database.lastError(), HasSubstr("NOT NULL constraint failed"));
    EXPECT_EQ(notes(database), 0);
}

// --- Migrations ----------------------------------------------------------------------------

TEST_F(ClockSqliteDatabaseTest, ANewerProgramMigratesAnOlderFile) {
    createWithOneNote();
    base::SqliteDatabase database(path());
    ASSERT_TRUE(database.open("notes", second)) << database.lastError();
    EXPECT_TRUE(database.execute("UPDATE note SET place = 'here'"));
    EXPECT_EQ(notes(database), 1);
}

TEST_F(ClockSqliteDatabaseTest, AnOlderProgramRefusesANewerFileAndLeavesIt) {
    {
        base::SqliteDatabase database(path());
        ASSERT_TRUE(database.open("notes", second));
        ASSERT_TRUE(addNote(database, "kept"));
    }
    const auto before = readFile(path());
    {
        base::SqliteDatabase database(path());
        EXPECT_FALSE(database.open("notes", first));
        EXPECT_FALSE(database.isOpen());
        EXPECT_THAT(database.lastError(), HasSubstr("written by a newer version"));
        EXPECT_THAT(database.quarantinePath(), IsEmpty());
    }
    EXPECT_EQ(readFile(path()), before);
}

TEST_F(ClockSqliteDatabaseTest, OwnersMigrateIndependently) {
    createWithOneNote();
    base::SqliteDatabase database(path());
    ASSERT_TRUE(database.open("plans", {"CREATE TABLE plan(a INTEGER)", "SELECT 1", "SELECT 2"}));
    OutsideView view(path());
    EXPECT_THAT(view.rows("SELECT owner, version FROM schema_version ORDER BY owner"),
                ElementsAre("notes|1", "plans|3"));
}

TEST_F(ClockSqliteDatabaseTest, AMigrationThatFailsLeavesNothingBehind) {
    base::SqliteDatabase database(path());
    EXPECT_FALSE(database.open("notes", {first[0], "nonsense"}));
    EXPECT_THAT(database.lastError(), HasSubstr("syntax error"));
    base::SqliteDatabase again(path());
    EXPECT_TRUE(again.open("notes", first)) << again.lastError();
}

TEST_F(ClockSqliteDatabaseTest, ManyProcessesCanOpenANewFileAtOnce) {
    for (int round = 0; round < 5; ++round) {
        std::vector<pid_t> processes;
        const auto shared = folder / ("shared" + std::to_string(round) + ".db");
        for (int i = 0; i < 8; ++i) {
            processes.push_back(fork());
            if (processes.back() == 0) {
                base::SqliteDatabase database(shared, 20000);
                if (!database.open("notes", second))
                    std::fprintf(stderr, "%s\n", database.lastError().c_str());
                _exit(database.isOpen() && addNote(database, "x") ? 0 : 1);
            }
        }
        for (const pid_t process : processes)
            EXPECT_EQ(waitFor(process), 0);
        OutsideView view(shared);
        EXPECT_EQ(view.value("SELECT COUNT(*) FROM note"), "8");
    }
}

// --- Damage --------------------------------------------------------------------------------

TEST_F(ClockSqliteDatabaseTest, AFileThatIsNoDatabaseIsMovedAsideUnchanged) {
    for (const std::string& content :
         {std::string("this is not a database at all, but a letter to grandmother"),
          std::string("SQLite format 3"), std::string("SQLite format 3\0", 16),
          std::string("SQLite format 3\0and then rubbish that is much too short", 55),
          std::string(8192, '\xff')}) {
        writeFile(path(), content);
        base::SqliteDatabase database(path());
        ASSERT_TRUE(database.open("notes", first)) << database.lastError();
        EXPECT_THAT(database.quarantinePath(), StartsWith(path() + ".corrupt-"));
        EXPECT_EQ(readFile(database.quarantinePath()), content);
        EXPECT_TRUE(addNote(database, "goes on"));
        EXPECT_EQ(notes(database), 1);
    }
    // Several in one second are all kept.
    std::size_t kept = 0;
    for (const auto& name : files())
        kept += name.starts_with("test.db.corrupt-") ? 1 : 0;
    EXPECT_EQ(kept, 5U);
}

TEST_F(ClockSqliteDatabaseTest, AnEmptyFileIsANewDatabase) {
    writeFile(path(), "");
    base::SqliteDatabase database(path());
    EXPECT_TRUE(database.open("notes", first));
    EXPECT_THAT(database.quarantinePath(), IsEmpty());
}

TEST_F(ClockSqliteDatabaseTest, DamageInsideIsFoundAtTheFirstOpening) {
    {
        base::SqliteDatabase database(path());
        ASSERT_TRUE(database.open("notes", first));
        for (int i = 0; i < 500; ++i)
            ASSERT_TRUE(addNote(database, std::string(100, 'n')));
    }
    auto content = readFile(path());
    std::fill(content.begin() + 8192, content.begin() + 16384, '\x55');
    // A new inode: for this process a file that it has never seen.
    writeFile(path() + ".new", content);
    fs::rename(path() + ".new", path());
    base::SqliteDatabase database(path());
    ASSERT_TRUE(database.open("notes", first)) << database.lastError();
    EXPECT_THAT(database.quarantinePath(), StartsWith(path() + ".corrupt-"));
    EXPECT_EQ(readFile(database.quarantinePath()), content);
}

TEST_F(ClockSqliteDatabaseTest, DamageThatIsMetLaterIsRepairedByTheNextOpening) {
    {
        base::SqliteDatabase database(path());
        ASSERT_TRUE(database.open("notes", first));
        for (int i = 0; i < 500; ++i)
            ASSERT_TRUE(addNote(database, std::string(100, 'n')));
    }
    // The pages of the notes, not those that every opening reads.
    auto content = readFile(path());
    std::fill(content.begin() + 16384, content.end(), '\x55');
    std::ofstream(path(), std::ios::binary | std::ios::in) << content;
    {
        base::SqliteDatabase database(path());
        ASSERT_TRUE(database.open("notes", first)) << "this process has already checked the file";
        EXPECT_FALSE(database.execute("UPDATE note SET text = text || 'x'"));
        EXPECT_THAT(database.lastError(), HasSubstr("malformed"));
    }
    base::SqliteDatabase database(path());
    ASSERT_TRUE(database.open("notes", first)) << database.lastError();
    EXPECT_THAT(database.quarantinePath(), StartsWith(path() + ".corrupt-"));
    EXPECT_TRUE(addNote(database, "goes on"));
}

TEST_F(ClockSqliteDatabaseTest, DamageOfTheFirstPagesIsRepairedByTheSameOpening) {
    createWithOneNote();
    auto content = readFile(path());
    std::fill(content.begin() + 4096, content.end(), '\x55');
    std::ofstream(path(), std::ios::binary | std::ios::in) << content;
    base::SqliteDatabase database(path());
    ASSERT_TRUE(database.open("notes", first)) << database.lastError();
    EXPECT_THAT(database.quarantinePath(), StartsWith(path() + ".corrupt-"));
    EXPECT_EQ(notes(database), 0);
}

TEST_F(ClockSqliteDatabaseTest, TheLogOfADamagedFileGoesAsideWithIt) {
    writeFile(path(), "rubbish rubbish rubbish");
    writeFile(path() + "-wal", "log");
    writeFile(path() + "-shm", "index");
    base::SqliteDatabase database(path());
    ASSERT_TRUE(database.open("notes", first));
    EXPECT_EQ(readFile(database.quarantinePath() + "-wal"), "log");
    EXPECT_EQ(readFile(database.quarantinePath() + "-shm"), "index");
}

// --- Files that cannot be used -------------------------------------------------------------

TEST_F(ClockSqliteDatabaseTest, AMissingFolderIsReported) {
    base::SqliteDatabase database(folder / "nowhere/test.db");
    EXPECT_FALSE(database.open("notes", first));
    EXPECT_THAT(database.lastError(), HasSubstr("No such file or directory"));
}

TEST_F(ClockSqliteDatabaseTest, AFolderInPlaceOfTheFileIsReportedAndLeft) {
    fs::create_directories(path());
    base::SqliteDatabase database(path());
    EXPECT_FALSE(database.open("notes", first));
    EXPECT_THAT(database.lastError(), HasSubstr("unable to open database file"));
    EXPECT_TRUE(fs::is_directory(path()));
}

TEST_F(ClockSqliteDatabaseTest, AnEmptyNameIsReported) {
    base::SqliteDatabase database("");
    EXPECT_FALSE(database.open("notes", first));
    EXPECT_EQ(database.lastError(), "no file name");
}

TEST_F(ClockSqliteDatabaseTest, ALockedFileIsWaitedForAndThenReported) {
    createWithOneNote();
    base::SqliteDatabase database(path(), 200);
    ASSERT_TRUE(database.open("notes", first)) << database.lastError();
    const LockedStore lock(path());
    const auto before = std::chrono::steady_clock::now();
    EXPECT_FALSE(addNote(database, "second"));
    const auto waited = std::chrono::steady_clock::now() - before;
    EXPECT_THAT(database.lastError(), HasSubstr("locked"));
    EXPECT_GE(waited, std::chrono::milliseconds(150));
    EXPECT_LT(waited, std::chrono::seconds(5));
    EXPECT_EQ(notes(database), 1) << "reading must go on";
}

TEST_F(ClockSqliteDatabaseTest, AFullFileIsReportedAndNothingIsLost) {
    createWithOneNote();
    base::SqliteDatabase database(path());
    ASSERT_TRUE(database.open("notes", first));
    ASSERT_TRUE(database.execute("PRAGMA max_page_count = 1"));
    EXPECT_FALSE(database.transaction([&] { return addNote(database, std::string(99999, 'x')); }));
    EXPECT_THAT(database.lastError(), HasSubstr("full"));
    EXPECT_EQ(notes(database), 1);
    ASSERT_TRUE(database.execute("PRAGMA max_page_count = 100000"));
    EXPECT_TRUE(addNote(database, "second"));
}

// As an ordinary user: permission bits mean nothing to root.
int asOrdinaryUser(const std::function<int()>& action) {
    return inAnotherProcess([&] {
        if (geteuid() == 0 && (setgid(65534) != 0 || setuid(65534) != 0))
            return 99;
        return action();
    });
}

TEST_F(ClockSqliteDatabaseTest, AFileThatMayOnlyBeReadIsReadAndNotWritten) {
    createWithOneNote();
    fs::permissions(path(), fs::perms(0444));
    fs::permissions(folder.path(), fs::perms(0555));
    EXPECT_EQ(asOrdinaryUser([&] {
                  base::SqliteDatabase database(path());
                  if (!database.open("notes", first))
                      return 1;
                  if (notes(database) != 1)
                      return 2;
                  if (addNote(database, "second"))
                      return 3;
                  return database.lastError().find("readonly") == std::string::npos ? 4 : 0;
              }),
              0);
    fs::permissions(folder.path(), fs::perms(0755));
}

TEST_F(ClockSqliteDatabaseTest, AFolderThatMayOnlyBeReadIsReported) {
    fs::permissions(folder.path(), fs::perms(0555));
    EXPECT_EQ(asOrdinaryUser([&] {
                  base::SqliteDatabase database(path());
                  return !database.open("notes", first) && !database.lastError().empty() ? 0 : 1;
              }),
              0);
    fs::permissions(folder.path(), fs::perms(0755));
}

TEST_F(ClockSqliteDatabaseTest, ADamagedFileThatCannotBeMovedAsideIsReportedAndLeft) {
    writeFile(path(), "rubbish rubbish rubbish");
    fs::permissions(folder.path(), fs::perms(0555));
    EXPECT_EQ(asOrdinaryUser([&] {
                  base::SqliteDatabase database(path());
                  if (database.open("notes", first))
                      return 1;
                  return database.lastError().find("cannot be moved aside") == std::string::npos
                             ? 2
                             : 0;
              }),
              0);
    fs::permissions(folder.path(), fs::perms(0755));
    EXPECT_EQ(readFile(path()), "rubbish rubbish rubbish");
}

} // namespace

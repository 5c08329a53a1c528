#include "clock/LoggingModel.h"

#include <cstdlib>
#include <filesystem>
#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "host/ClockStore.h"
#include "host/Helper.h"
#include "rules/FrozenTime.h"

namespace fs = std::filesystem;

namespace {

using testing::ElementsAre;
using testing::HasSubstr;

class ClockLoggingModelTest : public testing::Test {
protected:
    std::string path() const { return host.dataDir() + "/usage.db"; }

    DeviceHost host;
};

TEST_F(ClockLoggingModelTest, IsOneObject) {
    EXPECT_EQ(&LoggingModel::getInstance(), &LoggingModel::getInstance());
}

TEST_F(ClockLoggingModelTest, IsPreparedByItsFirstUse) {
    // Only a program that has just been started has not used it yet.
    if (std::getenv("CLOCK_TEST_FIRST_USE")) {
        EXPECT_FALSE(fs::exists(path()));
        LoggingModel::getInstance();
        EXPECT_TRUE(fs::exists(path()));
        return;
    }
    EXPECT_EQ(inAnotherProcess([] {
                  setenv("CLOCK_TEST_FIRST_USE", "1", 1);
                  // What the toolkit leaks at its end is not the question here.
                  setenv("ASAN_OPTIONS", "detect_leaks=0", 1);
                  execl("/proc/self/exe", "host-tests",
                        "--gtest_filter=ClockLoggingModelTest.IsPreparedByItsFirstUse", nullptr);
                  return 127;
              }),
              0);
}

TEST_F(ClockLoggingModelTest, KeepsEventsInTheirOrder) {
    const FrozenTime now(1795176000);
    auto& log = LoggingModel::getInstance();
    log.insertLog(CLOCK_APPLICATION_ID, "CK08", "Name entered", nullptr);
    log.insertLog(CLOCK_APPLICATION_ID, "CK11", "Vibrate and sound", "more");
    OutsideView view(path());
    EXPECT_THAT(view.rows("SELECT time, application_id, feature, detail, extra FROM usage "
                          "ORDER BY number"),
                ElementsAre("1795176000|com.vendra.clock|CK08|Name entered|",
                            "1795176000|com.vendra.clock|CK11|Vibrate and sound|more"));
}

TEST_F(ClockLoggingModelTest, KeepsTheNewestTenThousand) {
    auto& log = LoggingModel::getInstance();
    log.insertLog(CLOCK_APPLICATION_ID, "CK08", "oldest", nullptr);
    OutsideView view(path());
    view.rows("WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i + 1 FROM n WHERE i < 9999) "
              "INSERT INTO usage(time, application_id, feature, detail, extra) "
              "SELECT 0, 'a', 'f', 'event ' || i, '' FROM n");
    EXPECT_EQ(view.value("SELECT COUNT(*) FROM usage"), "10000");
    log.insertLog(CLOCK_APPLICATION_ID, "CK08", "newest", nullptr);
    EXPECT_EQ(view.value("SELECT COUNT(*) FROM usage"), "10000");
    EXPECT_EQ(view.value("SELECT COUNT(*) FROM usage WHERE detail = 'oldest'"), "0");
    EXPECT_EQ(view.value("SELECT COUNT(*) FROM usage WHERE detail = 'event 1'"), "1");
    EXPECT_EQ(view.value("SELECT detail FROM usage ORDER BY number DESC LIMIT 1"), "newest");
}

TEST_F(ClockLoggingModelTest, NullTextsAreReportedAndNotKept) {
    auto& log = LoggingModel::getInstance();
    const auto lines = standardErrorOf([&] {
        log.insertLog(nullptr, "CK08", "detail", nullptr);
        log.insertLog("app", nullptr, "detail", nullptr);
        log.insertLog("app", "CK08", nullptr, nullptr);
    });
    EXPECT_THAT(lines, HasSubstr("applicationId is NULL !!"));
    EXPECT_THAT(lines, HasSubstr("feature is NULL !!"));
    EXPECT_THAT(lines, HasSubstr("detail is NULL !!"));
    log.insertLog("app", "CK08", "good", nullptr);
    EXPECT_EQ(OutsideView(path()).value("SELECT detail FROM usage"), "good");
}

TEST_F(ClockLoggingModelTest, AStoreThatCannotBeUsedIsReportedAndUsedWhenItIsBack) {
    auto& log = LoggingModel::getInstance();
    fs::remove_all(host.dataDir());
    EXPECT_THAT(standardErrorOf([&] { log.insertLog("app", "CK08", "lost", nullptr); }),
                HasSubstr("usage log cannot be opened: unable to open database file"));
    fs::create_directories(host.dataDir());
    log.insertLog("app", "CK08", "kept", nullptr);
    EXPECT_EQ(OutsideView(path()).value("SELECT detail FROM usage"), "kept");
}

TEST_F(ClockLoggingModelTest, AKilledProcessLosesNoEvent) {
    EXPECT_EQ(inAnotherProcess([] {
                  LoggingModel::getInstance().insertLog("app", "CK08", "kept", nullptr);
                  raise(SIGKILL);
                  return 0;
              }),
              -1);
    EXPECT_EQ(OutsideView(path()).value("SELECT detail FROM usage"), "kept");
}

TEST_F(ClockLoggingModelTest, ADamagedLogIsMovedAside) {
    auto& log = LoggingModel::getInstance();
    writeFile(path(), "rubbish");
    EXPECT_THAT(standardErrorOf([&] { log.insertLog("app", "CK08", "kept", nullptr); }),
                HasSubstr("usage.db was damaged, it is kept as "));
    EXPECT_EQ(OutsideView(path()).value("SELECT detail FROM usage"), "kept");
}

} // namespace

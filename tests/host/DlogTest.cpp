#include <cerrno>
#include <cstring>
#include <string>

#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <pty.h>
#include <unistd.h>

#include "Helper.h"
#include "device/dlog.h"

#define LOG_TAG "log-test"
#include "base/Log.h"

using testing::HasSubstr;
using testing::MatchesRegex;
using testing::Not;

namespace {

/** Standard error as a terminal, and what appears on it. */
std::string terminalOutputOf(const std::function<void()>& action) {
    int master = -1;
    int slave = -1;
    if (openpty(&master, &slave, nullptr, nullptr, nullptr) != 0)
        return "no terminal";
    const int earlier = dup(STDERR_FILENO);
    dup2(slave, STDERR_FILENO);
    action();
    dup2(earlier, STDERR_FILENO);
    char buffer[1024];
    const ssize_t size = read(master, buffer, sizeof buffer);
    close(master);
    close(slave);
    close(earlier);
    return {buffer, size > 0 ? static_cast<std::size_t>(size) : 0};
}

} // namespace

TEST(Dlog, ALineIsTheTagAndTheMessage) {
    const auto output =
        standardErrorOf([] { __dlog_print(LOG_ID_MAIN, DLOG_INFO, "tag", "%s is %d", "six", 6); });
    EXPECT_EQ(output, "tag six is 6\n");
}

TEST(Dlog, ReturnsTheNumberOfBytesWritten) {
    int written = 0;
    standardErrorOf([&] { written = __dlog_print(LOG_ID_MAIN, DLOG_INFO, "tag", "%s", "six"); });
    EXPECT_EQ(written, static_cast<int>(std::strlen("tag six\n")));
}

TEST(Dlog, ColoursAreLeftOutWhereThereIsNoTerminal) {
    const auto output = standardErrorOf([] { LOG_ERROR("Data is NULL !!"); });
    EXPECT_THAT(output, Not(HasSubstr("\033")));
    EXPECT_THAT(output, MatchesRegex("log-test DlogTest.cpp: .*\\([0-9]+\\) > \\* Critical \\* "
                                     "Data is NULL !!\n"));
}

TEST(Dlog, ATerminalShowsColours) {
    const auto output = terminalOutputOf([] { LOG_ERROR("Data is NULL !!"); });
    EXPECT_THAT(output, HasSubstr("\033[0;31m* Critical * Data is NULL !!\033[0;m"));
}

TEST(Dlog, AnEscapeThatIsNoColourAndAnUnfinishedOneStay) {
    const auto output =
        standardErrorOf([] { __dlog_print(LOG_ID_MAIN, DLOG_INFO, "tag", "\033[2Ja\033[1;3"); });
    EXPECT_EQ(output, "tag \033[2Ja\033[1;3\n");
}

TEST(Dlog, ALineEndInATextDoesNotStartANewLine) {
    const auto output = standardErrorOf(
        [] { __dlog_print(LOG_ID_MAIN, DLOG_INFO, "tag", "%s", "one\ntag two\r"); });
    EXPECT_EQ(output, "tag one tag two \n");
}

TEST(Dlog, ALongLineIsWrittenWhole) {
    const std::string text(100000, 'x');
    const auto output =
        standardErrorOf([&] { __dlog_print(LOG_ID_MAIN, DLOG_INFO, "tag", "%s", text.c_str()); });
    EXPECT_EQ(output.size(), text.size() + std::strlen("tag \n"));
}

TEST(Dlog, WithoutTagOrFormatNothingIsWritten) {
    const char* none = nullptr;
    int first = 0;
    int second = 0;
    const auto output = standardErrorOf([&] {
        first = __dlog_print(LOG_ID_MAIN, DLOG_INFO, none, "text");
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wformat"
#pragma GCC diagnostic ignored "-Wformat-security"
        second = __dlog_print(LOG_ID_MAIN, DLOG_INFO, "tag", none);
#pragma GCC diagnostic pop
    });
    EXPECT_LT(first, 0);
    EXPECT_LT(second, 0);
    EXPECT_EQ(output, "");
}

TEST(Dlog, LeavesErrnoAlone) {
    standardErrorOf([] {
        errno = EBUSY;
        LOG_INFO("a line");
        EXPECT_EQ(errno, EBUSY);
    });
}

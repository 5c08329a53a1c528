#include <array>
#include <cstdio>
#include <iterator>
#include <memory>
#include <regex>
#include <set>
#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tree.h"

using testing::Contains;
using testing::IsSupersetOf;

namespace {

/** The functions that headers below a folder declare as the device's. */
std::set<std::string> declaredBelow(const std::string& folder) {
    static const std::regex form(R"((?:^|\n)DEVICE_API\s[^;(]*?(\w+)\s*\()");
    std::set<std::string> names;
    for (const auto& file : filesOf(CLOCK_SOURCE_DIR)) {
        if (!file.starts_with(folder + "/") || !file.ends_with(".h"))
            continue;
        const std::string text = contentsOf(std::filesystem::path(CLOCK_SOURCE_DIR) / file);
        for (std::sregex_iterator match(text.begin(), text.end(), form), end; match != end; ++match)
            names.insert((*match)[1]);
    }
    return names;
}

/** The functions that a program or library exports. */
std::set<std::string> exportedBy(const std::string& file) {
    const std::string command = std::string(CLOCK_NM) + " -D --defined-only '" + file + "'";
    const auto closer = [](FILE* pipe) {
        pclose(pipe);
    };
    const std::unique_ptr<FILE, decltype(closer)> pipe(popen(command.c_str(), "r"), closer);
    std::set<std::string> names;
    std::array<char, 4096> line{};
    while (pipe && std::fgets(line.data(), line.size(), pipe.get())) {
        static const std::regex form(R"(^[0-9a-f]+ [TtWi] ([^@\s]+))");
        std::cmatch match;
        if (std::regex_search(line.data(), match, form))
            names.insert(match[1]);
    }
    return names;
}

} // namespace

TEST(DeviceFunctions, AreFoundInTheHeaders) {
    const auto declared = declaredBelow("platform/device");
    EXPECT_THAT(declared, IsSupersetOf({"vconf_get_int", "app_get_data_path", "uxt_date_time_add",
                                        "eext_object_event_callback_del", "__dlog_print"}));
    EXPECT_EQ(declared.count("device_host_init"), 0U);
    EXPECT_THAT(declaredBelow("host/include"), Contains("device_host_init"));
}

TEST(DeviceFunctions, AreAllDefinedByTheDesktop) {
    EXPECT_THAT(exportedBy(CLOCK_DEVICE_LIBRARY), IsSupersetOf(declaredBelow("platform/device")));
    EXPECT_THAT(exportedBy(CLOCK_DEVICE_LIBRARY), IsSupersetOf(declaredBelow("host/include")));
}

TEST(DeviceFunctions, AreAllDefinedByTheFakeAndComeBeforeTheDesktops) {
    EXPECT_THAT(exportedBy(CLOCK_SCREEN_TESTS), IsSupersetOf(declaredBelow("platform/device")));
}

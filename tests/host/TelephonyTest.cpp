#include <array>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <thread>
#include <utility>
#include <vector>

#include <fcntl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <glib.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Helper.h"
#include "device/telephony.h"
#include "device/vconf.h"

using testing::ElementsAre;
using testing::HasSubstr;

namespace {

/** A bus of its own with modems on it; see the script. */
class ModemBus {
public:
    explicit ModemBus(std::vector<std::string> modems) {
        std::array<int, 2> toBus{};
        std::array<int, 2> fromBus{};
        if (pipe2(toBus.data(), O_CLOEXEC) != 0 || pipe2(fromBus.data(), O_CLOEXEC) != 0)
            std::abort();
        modems.insert(modems.begin(), CLOCK_MODEM_BUS);
        std::vector<char*> words;
        words.reserve(modems.size() + 1);
        for (std::string& word : modems)
            words.push_back(word.data());
        words.push_back(nullptr);
        _process = fork();
        if (_process == 0) {
            dup2(toBus[0], STDIN_FILENO);
            dup2(fromBus[1], STDOUT_FILENO);
            execv(words[0], words.data());
            _exit(127);
        }
        close(toBus[0]);
        close(fromBus[1]);
        _input = toBus[1];
        _output = fdopen(fromBus[0], "r");
        _address = readLine();
        setenv("DBUS_SYSTEM_BUS_ADDRESS", _address.c_str(), 1);
    }
    ~ModemBus() {
        unsetenv("DBUS_SYSTEM_BUS_ADDRESS");
        close(_input);
        waitpid(_process, nullptr, 0);
        std::fclose(_output);
    }
    ModemBus(const ModemBus&) = delete;
    ModemBus& operator=(const ModemBus&) = delete;

    bool stands() const { return !_address.empty(); }
    /** Nothing on the bus moves any more. */
    void stop() {
        EXPECT_EQ(write(_input, "stop\n", 5), 5);
        EXPECT_EQ(readLine(), "done");
    }

private:
    std::string readLine() {
        std::array<char, 512> line{};
        if (!std::fgets(line.data(), line.size(), _output))
            return {};
        std::string text = line.data();
        return text.substr(0, text.find('\n'));
    }

    pid_t _process = -1;
    int _input = -1;
    FILE* _output = nullptr;
    std::string _address;
};

std::vector<std::string> modemNames() {
    std::vector<std::string> names;
    char** list = tel_get_cp_name_list();
    for (char** name = list; name && *name; ++name)
        names.emplace_back(*name);
    g_strfreev(list);
    return names;
}

/** What a modem says of its network; null for the first one. */
std::pair<int, std::string> networkOf(const char* modem) {
    tel_handle_h handle = tel_init(modem);
    if (!handle)
        return {1, "no modem"};
    char* value = nullptr;
    const int result = tel_get_property_string(handle, TEL_PROPERTY_NETWORK_PLMN, &value);
    const std::string text = value ? value : "untouched";
    std::free(value);
    tel_deinit(handle);
    return {result, text};
}

class Telephony : public testing::Test {
protected:
    void SetUp() override {
        setenv("DBUS_SYSTEM_BUS_ADDRESS", "unix:path=/nonexistent/bus", 1);
        // What an earlier test was told is too old to be told again.
        std::this_thread::sleep_for(std::chrono::milliseconds(600));
    }
    void TearDown() override { unsetenv("DBUS_SYSTEM_BUS_ADDRESS"); }

    static void setNetwork(const char* plmn) {
        standardErrorOf([plmn] { EXPECT_EQ(vconf_set_str("memory/telephony/plmn", plmn), 0); });
    }
    /** Runs what the location button asks, and tells its log and how long it took. */
    static std::string askAll(std::pair<int, std::string>& first, double& seconds) {
        return standardErrorOf([&] {
            const auto start = std::chrono::steady_clock::now();
            modemNames();
            first = networkOf(nullptr);
            networkOf("/modem2");
            const std::chrono::duration<double> spent = std::chrono::steady_clock::now() - start;
            seconds = spent.count();
        });
    }

    DeviceHost host;
};

const std::pair<int, std::string> NO_NETWORK = {TEL_ERROR_NONE, ""};

/** Room for a machine that is busy, on top of the 0.3 seconds. */
constexpr double PATIENCE = 0.45;

} // namespace

TEST_F(Telephony, WithoutABusTheSettingIsTheNetwork) {
    setNetwork("26201");
    EXPECT_THAT(modemNames(), ElementsAre("simulated"));
    EXPECT_EQ(networkOf(nullptr), std::pair(TEL_ERROR_NONE, std::string("26201")));
    setNetwork("23415");
    EXPECT_EQ(networkOf("simulated"), std::pair(TEL_ERROR_NONE, std::string("23415")));
}

TEST_F(Telephony, WithoutABusAndASettingThereIsNoNetwork) {
    EXPECT_EQ(networkOf(nullptr), NO_NETWORK);
    setNetwork("");
    EXPECT_EQ(networkOf(nullptr), NO_NETWORK);
}

TEST_F(Telephony, WithoutOfonoTheSettingIsTheNetwork) {
    const ModemBus bus({});
    ASSERT_TRUE(bus.stands());
    setNetwork("26201");
    EXPECT_EQ(networkOf(nullptr), std::pair(TEL_ERROR_NONE, std::string("26201")));
}

TEST_F(Telephony, AModemTellsCountryAndNetwork) {
    const ModemBus bus({"262:01"});
    ASSERT_TRUE(bus.stands());
    setNetwork("99999");
    EXPECT_THAT(modemNames(), ElementsAre("/modem1"));
    EXPECT_EQ(networkOf(nullptr), std::pair(TEL_ERROR_NONE, std::string("26201")));
}

TEST_F(Telephony, EachOfTwoModemsTellsItsOwnNetwork) {
    const ModemBus bus({"", "234:15"});
    ASSERT_TRUE(bus.stands());
    EXPECT_THAT(modemNames(), ElementsAre("/modem1", "/modem2"));
    EXPECT_EQ(networkOf("/modem1"), NO_NETWORK);
    EXPECT_EQ(networkOf("/modem2"), std::pair(TEL_ERROR_NONE, std::string("23415")));
}

TEST_F(Telephony, AModemThatIsSwitchedOffHasNoNetwork) {
    const ModemBus bus({"off"});
    ASSERT_TRUE(bus.stands());
    EXPECT_EQ(networkOf(nullptr), NO_NETWORK);
}

TEST_F(Telephony, ASlowModemFailsInTime) {
    const ModemBus bus({"slow", "slow"});
    ASSERT_TRUE(bus.stands());
    std::pair<int, std::string> first;
    double seconds = 0;
    EXPECT_THAT(askAll(first, seconds), HasSubstr("Modem /modem1 tells no network"));
    EXPECT_EQ(first, std::pair(TEL_ERROR_OPERATION_FAILED, std::string("untouched")));
    EXPECT_LT(seconds, PATIENCE);
}

TEST_F(Telephony, ABusThatVanishesWhileAModemIsAskedFailsInTime) {
    const ModemBus bus({"gone", "262:01"});
    ASSERT_TRUE(bus.stands());
    std::pair<int, std::string> first;
    double seconds = 0;
    askAll(first, seconds);
    EXPECT_EQ(first, std::pair(TEL_ERROR_OPERATION_FAILED, std::string("untouched")));
    EXPECT_LT(seconds, PATIENCE);
}

TEST_F(Telephony, ABusThatStandsStillFailsInTimeAndIsNotAskedTwiceAtOnce) {
    std::pair<int, std::string> first;
    double seconds = 0;
    {
        ModemBus bus({"262:01"});
        ASSERT_TRUE(bus.stands());
        bus.stop();
        EXPECT_THAT(askAll(first, seconds), HasSubstr("have not answered within 300 milliseconds"));
        EXPECT_EQ(first, std::pair(1, std::string("no modem")));
        EXPECT_LT(seconds, PATIENCE);
        std::this_thread::sleep_for(std::chrono::milliseconds(600));
        EXPECT_THAT(askAll(first, seconds), HasSubstr("has not answered the last question"));
        EXPECT_LT(seconds, 0.1);
    }
    // The bus ended, and with it the question.
    std::this_thread::sleep_for(std::chrono::milliseconds(600));
    setenv("DBUS_SYSTEM_BUS_ADDRESS", "unix:path=/nonexistent/bus", 1);
    EXPECT_EQ(networkOf(nullptr), NO_NETWORK);
}

TEST_F(Telephony, BadArgumentsAreErrors) {
    standardErrorOf([] { EXPECT_EQ(networkOf("/modem9").second, "no modem"); });
    const auto log = standardErrorOf([] {
        tel_handle_h handle = tel_init(nullptr);
        ASSERT_NE(handle, nullptr);
        char* value = nullptr;
        EXPECT_EQ(tel_get_property_string(handle, "org.nimbo.telephony.Network:name", &value),
                  TEL_ERROR_INVALID_PARAMETER);
        EXPECT_EQ(tel_get_property_string(handle, nullptr, &value), TEL_ERROR_INVALID_PARAMETER);
        EXPECT_EQ(tel_get_property_string(handle, TEL_PROPERTY_NETWORK_PLMN, nullptr),
                  TEL_ERROR_INVALID_PARAMETER);
        EXPECT_EQ(tel_get_property_string(nullptr, TEL_PROPERTY_NETWORK_PLMN, &value),
                  TEL_ERROR_INVALID_PARAMETER);
        EXPECT_EQ(value, nullptr);
        EXPECT_EQ(tel_deinit(handle), TEL_ERROR_NONE);
    });
    EXPECT_THAT(log, HasSubstr("A modem and a known property are needed"));
    EXPECT_EQ(tel_deinit(nullptr), TEL_ERROR_NONE);
}

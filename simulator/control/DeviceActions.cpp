#include "DeviceActions.h"

#include <cstring>
#include <initializer_list>
#include <vector>

#include "../Foreground.h"
#include "../QuickPanel.h"
#include "../WatchFace.h"
#include "clock/ClockEventListener.h"
#include "device_remote.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {

namespace {

QuickPanel*& quickPanel() {
    static QuickPanel* panel = nullptr;
    return panel;
}

Foreground*& foreground() {
    static Foreground* current = nullptr;
    return current;
}

using Words = std::initializer_list<std::string>;

std::vector<const char*> pointersTo(const Words& words) {
    std::vector<const char*> pointers;
    pointers.reserve(words.size());
    for (const std::string& word : words)
        pointers.push_back(word.c_str());
    return pointers;
}

void send(const Words& words) {
    const auto pointers = pointersTo(words);
    const int result = device_remote_send(pointers.data(), static_cast<int>(pointers.size()));
    if (result < 0)
        LOG_ERROR("The application in front cannot be reached: %s", std::strerror(-result));
}

void showHome(bool shown) {
    const Words words{"home", shown ? "on" : "off"};
    const auto pointers = pointersTo(words);
    const int result =
        device_remote_send_to_all(pointers.data(), static_cast<int>(pointers.size()));
    if (result < 0)
        LOG_ERROR("An application cannot be reached: %s", std::strerror(-result));
    if (foreground() != nullptr)
        foreground()->leave(shown);
    else
        ClockEventListener::raise(shown ? ClockEventListener::PAUSED : ClockEventListener::RESUMED);
}

} // namespace

void pressKey(const std::string& name) {
    send({"key", name, "", "down"});
}

void releaseKey(const std::string& name) {
    send({"key", name, "", "up"});
}

void turnBezel(int direction) {
    const std::string middle = std::to_string(FACE_SIZE / 2);
    send({"bezel", std::to_string(direction), middle, middle});
}

void pressBezel() {
    const std::string middle = std::to_string(FACE_SIZE / 2);
    for (const char* press : {"down", "up"})
        send({"pointer", press, "2", middle, middle});
}

void setQuickPanel(QuickPanel* panel) {
    quickPanel() = panel;
}

void openQuickPanel() {
    if (quickPanel() != nullptr && !quickPanel()->isShown())
        quickPanel()->toggle();
}

void closeQuickPanel() {
    if (quickPanel() != nullptr && quickPanel()->isShown())
        quickPanel()->toggle();
}

void setForeground(Foreground* current) {
    foreground() = current;
}

void goToBackground() {
    showHome(true);
}

void comeToForeground() {
    showHome(false);
}

bool isInForeground() {
    return foreground() == nullptr || foreground()->isInFront();
}

} // namespace simulator

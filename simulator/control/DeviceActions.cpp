#include "DeviceActions.h"

#include <cstring>
#include <initializer_list>
#include <vector>

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

void send(std::initializer_list<std::string> words) {
    std::vector<const char*> pointers;
    pointers.reserve(words.size());
    for (const std::string& word : words)
        pointers.push_back(word.c_str());
    const int result = device_remote_send(pointers.data(), static_cast<int>(pointers.size()));
    if (result < 0)
        LOG_ERROR("The application in front cannot be reached: %s", std::strerror(-result));
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

void goToBackground() {
    ClockEventListener::raise(ClockEventListener::PAUSED);
}

void comeToForeground() {
    ClockEventListener::raise(ClockEventListener::RESUMED);
}

} // namespace simulator

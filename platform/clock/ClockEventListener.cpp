#include "clock/ClockEventListener.h"

#include <algorithm>
#include <cstddef>
#include <vector>

namespace {

struct Registry {
    std::vector<ClockEventListener*> listeners;
    int deliveries = 0;
};

Registry& registry() {
    // Never destroyed: listeners with static storage may outlive any other static object.
    static auto* const instance = new Registry;
    return *instance;
}

} // namespace

ClockEventListener::ClockEventListener() {
    registry().listeners.push_back(this);
}

ClockEventListener::~ClockEventListener() {
    auto& [listeners, deliveries] = registry();
    const auto self = std::find(listeners.begin(), listeners.end(), this);
    if (self == listeners.end())
        return;
    // A delivery that is under way counts by place.
    if (deliveries > 0)
        *self = nullptr;
    else
        listeners.erase(self);
}

void ClockEventListener::raise(EventType type) {
    auto& [listeners, deliveries] = registry();
    ++deliveries;
    const auto count = listeners.size();
    for (std::size_t i = 0; i < count; ++i)
        if (listeners[i])
            listeners[i]->onEvent(type);
    if (--deliveries == 0)
        std::erase(listeners, nullptr);
}

#pragma once

#include <vector>

#include "clock/ClockEventListener.h"

/** Notes the application's events. */
class EventRecorder : public ClockEventListener {
public:
    void onEvent(EventType type) override { events.push_back(type); }
    std::vector<EventType> events;
};

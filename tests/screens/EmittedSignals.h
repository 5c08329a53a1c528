/**
 * @file
 * @brief The signals that screens emit to widgets.
 */
#pragma once

#include <string>
#include <vector>

#include <Elementary.h>

/** A signal, and what the widget was like at that moment. */
struct EmittedSignal {
    const Evas_Object* object = nullptr;
    std::string signal;
    std::string source;
    bool wasOn = false; ///< The state of a check, before what follows the signal.
};

/** Every signal that code outside the toolkit has emitted since the last call, in order. */
std::vector<EmittedSignal> takeEmittedSignals();
/** Those to one object, as "source: signal". */
std::vector<std::string> takeSignalsTo(const Evas_Object* object);

/** Counts how often a widget itself receives a signal, whoever emits it. */
class SignalCount {
public:
    SignalCount(Evas_Object* object, const char* signal);
    int count() const { return _count; }
    SignalCount(const SignalCount&) = delete;
    SignalCount& operator=(const SignalCount&) = delete;

private:
    int _count = 0;
};

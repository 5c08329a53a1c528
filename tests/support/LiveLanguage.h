/**
 * @file
 * @brief The device's language, changed while screens are open.
 */
#pragma once

#include <string>
#include <vector>

/** The languages that the clock has a catalogue for, in the order of their codes. */
std::vector<std::string> catalogueLanguages();

/** The desktop device's own following of the language, on the recording device's settings. */
class LiveLanguage {
public:
    LiveLanguage();
    /** Speaks English again. */
    ~LiveLanguage();
    LiveLanguage(const LiveLanguage&) = delete;
    LiveLanguage& operator=(const LiveLanguage&) = delete;

    /** Chooses a language as a person does; the application then hears of it. */
    void choose(const std::string& code);
    /** Restarts following, after the recording device has forgotten who watches it. */
    void restart();
};

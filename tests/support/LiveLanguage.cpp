#include "support/LiveLanguage.h"

#include <algorithm>
#include <filesystem>

#include <clock/ClockEventListener.h>

#include "host/Language.h"
#include "support/DeviceFake.h"

namespace {

constexpr const char* LANGUAGE_KEY = "db/setting/language";

} // namespace

std::vector<std::string> catalogueLanguages() {
    std::vector<std::string> codes;
    for (const auto& file : std::filesystem::directory_iterator(CLOCK_SOURCE_DIR "/po"))
        if (file.path().extension() == ".po")
            codes.push_back(file.path().stem());
    std::ranges::sort(codes);
    return codes;
}

LiveLanguage::LiveLanguage() {
    restart();
}

LiveLanguage::~LiveLanguage() {
    // Nobody watches any more when the recording device was reset before.
    device().removeSetting(LANGUAGE_KEY);
    restart();
    host::forgetLanguage();
}

void LiveLanguage::restart() {
    host::bindTexts(CLOCK_RESOURCE_DIR "/locale");
    host::followLanguage();
}

void LiveLanguage::choose(const std::string& code) {
    device().setSetting(LANGUAGE_KEY, code);
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
}

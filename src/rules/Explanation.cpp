#include "rules/Explanation.h"

#include <base/Text.h>
#include <clock/ClockText.h>

namespace rules {

namespace {

constexpr std::size_t MAX_TEXT_BYTES = 1023;
constexpr int RISING_SECONDS = 60;

std::string explanation(const char* textId, const std::vector<base::FormatArgument>& arguments) {
    return base::formatTranslation(base::cutUtf8(clockText(textId), MAX_TEXT_BYTES), arguments,
                                   MAX_TEXT_BYTES);
}

} // namespace

std::string snoozeExplanation(int times, int minutes) {
    return explanation("IDS_CLOCK_SBODY_SOUND_THE_ALARM_P1SD_TIMES_AT_P2SD_MINUTE_INTERVALS",
                       {times, minutes});
}

std::string increaseVolumeExplanation() {
    return explanation("IDS_CLOCK_SBODY_INCREASE_THE_ALARM_VOLUME_FOR_THE_FIRST_PD_SECONDS",
                       {RISING_SECONDS});
}

} // namespace rules

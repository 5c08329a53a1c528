#include "TimeText.h"

#include <array>
#include <cstdlib>
#include <ctime>

#include <Elementary.h>

#include "clock/ClockIcuDataModel.h"
#include "device/vconf.h"
#include "device_settings.h"

namespace simulator {

bool isTwelveHour() {
    int form = 0;
    return vconf_get_int(DEVICE_SETTING_TIME_FORM, &form) == VCONF_OK && form == 1;
}

std::string timeOfDayText(int hour, int minute, bool twelveHour) {
    constexpr std::time_t MINUTE = 60;
    constexpr std::time_t HOUR = 60 * MINUTE;
    // A wall clock reading, not an instant: formatted in a zone that skips no hour.
    const std::time_t reading = hour * HOUR + minute * MINUTE;
    std::array<char, 64> text{};
    ClockIcuDataModel::getFormattedDateString(reading, text.data(), static_cast<int>(text.size()),
                                              nullptr, twelveHour ? "hmm" : "HHmm", "UTC");
    return text.data();
}

std::string markupOf(const std::string& text) {
    char* markup = elm_entry_utf8_to_markup(text.c_str());
    std::string result = markup == nullptr ? "" : markup;
    std::free(markup);
    return result;
}

} // namespace simulator

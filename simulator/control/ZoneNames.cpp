#include "ZoneNames.h"

#include <algorithm>
#include <cctype>
#include <cstdlib>
#include <fstream>
#include <memory>
#include <sstream>

#include <unicode/ucal.h>
#include <unicode/uenum.h>

#include "base/CivilTime.h"

namespace simulator {
namespace {

struct EnumerationDeleter {
    void operator()(UEnumeration* names) const { uenum_close(names); }
};

/** The places of the system's time-zone files, under the names that they have today. */
std::vector<std::string> placesOfSystem() {
    const char* folder = std::getenv("TZDIR");
    std::ifstream table(std::string(folder == nullptr ? "/usr/share/zoneinfo" : folder) +
                        "/zone.tab");
    std::vector<std::string> zones;
    for (std::string line; std::getline(table, line);) {
        if (line.starts_with('#'))
            continue;
        std::string country;
        std::string place;
        std::string name;
        std::istringstream(line) >> country >> place >> name;
        zones.push_back(name);
    }
    return zones;
}

/** ICU keeps some names that have changed since: for systems without the table of places. */
std::vector<std::string> placesOfIcu() {
    UErrorCode status = U_ZERO_ERROR;
    const std::unique_ptr<UEnumeration, EnumerationDeleter> names(ucal_openTimeZoneIDEnumeration(
        UCAL_ZONE_TYPE_CANONICAL_LOCATION, nullptr, nullptr, &status));
    std::vector<std::string> zones;
    while (U_SUCCESS(status)) {
        const char* name = uenum_next(names.get(), nullptr, &status);
        if (name == nullptr)
            break;
        zones.emplace_back(name);
    }
    return zones;
}

std::vector<std::string> allZones() {
    std::vector<std::string> zones = placesOfSystem();
    if (zones.empty())
        zones = placesOfIcu();
    zones.emplace_back("UTC");
    std::erase_if(zones, [](const std::string& zone) { return !base::isTimeZone(zone); });
    std::sort(zones.begin(), zones.end());
    return zones;
}

/** As names are compared. */
std::string folded(const std::string& text) {
    std::string result;
    for (const char c : text)
        result += c == ' ' ? '_' : static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
    return result;
}

bool cityBegins(const std::string& zone, const std::string& text) {
    const auto slash = zone.rfind('/');
    return folded(slash == std::string::npos ? zone : zone.substr(slash + 1)).starts_with(text);
}

} // namespace

std::vector<std::string> zonesMatching(const std::string& text, std::size_t most) {
    static const std::vector<std::string> zones = allZones();
    const std::string wanted = folded(text);
    std::vector<std::string> found;
    if (wanted.empty())
        return found;
    std::copy_if(zones.begin(), zones.end(), std::back_inserter(found),
                 [&](const auto& zone) { return folded(zone).find(wanted) != std::string::npos; });
    std::stable_partition(found.begin(), found.end(),
                          [&](const auto& zone) { return cityBegins(zone, wanted); });
    found.resize(std::min(found.size(), most));
    return found;
}

} // namespace simulator

#include "support/ToneFake.h"

#include <cstdlib>
#include <cstring>
#include <map>
#include <set>
#include <string_view>

#include <Ecore_File.h>

#include <clock/ClockAlarmDbData.h>
#include <device/metadata_extractor.h>

#include "support/DeviceFake.h"
#include "support/FakeCalls.h"

struct metadata_extractor_s {
    std::string path;
};

namespace {

using fakes::quoted;
using fakes::real;

constexpr std::string_view TONE_FOLDER = "/opt/usr/share/settings/Ringtones/";

using Titles = std::map<std::string, std::optional<std::string>>;

Titles& titles() {
    // Never destroyed, like the device.
    static Titles* titles = new Titles{{CLOCK_ALARM_DEFAULT_TONE, std::nullopt}};
    return *titles;
}

std::set<metadata_extractor_h>& extractors() {
    static std::set<metadata_extractor_h>* extractors = new std::set<metadata_extractor_h>;
    return *extractors;
}

bool lives(metadata_extractor_h extractor) {
    return extractors().contains(extractor);
}

} // namespace

void tones::add(const std::string& path, std::optional<std::string> title) {
    titles()[path] = std::move(title);
}

void tones::remove(const std::string& path) {
    titles().erase(path);
}

std::size_t tones::unreleased() {
    return extractors().size();
}

void tones::reset() {
    titles() = {{CLOCK_ALARM_DEFAULT_TONE, std::nullopt}};
    for (metadata_extractor_h extractor : extractors())
        delete extractor;
    extractors().clear();
}

Eina_Bool ecore_file_exists(const char* file) {
    const std::string_view path(file ? file : "");
    if (titles().contains(std::string(path)))
        return EINA_TRUE;
    if (path.starts_with(TONE_FOLDER))
        return EINA_FALSE;
    return real<decltype(ecore_file_exists)>("ecore_file_exists")(file);
}

int metadata_extractor_create(metadata_extractor_h* extractor) {
    if (const auto failure = device().record("metadata_extractor_create", ""))
        return *failure;
    if (!extractor)
        return METADATA_EXTRACTOR_ERROR_INVALID_PARAMETER;
    *extractor = *extractors().insert(new metadata_extractor_s).first;
    return METADATA_EXTRACTOR_ERROR_NONE;
}

int metadata_extractor_set_path(metadata_extractor_h extractor, const char* path) {
    if (const auto failure = device().record("metadata_extractor_set_path", quoted(path)))
        return *failure;
    if (!lives(extractor) || !path)
        return METADATA_EXTRACTOR_ERROR_INVALID_PARAMETER;
    if (!titles().contains(path))
        return METADATA_EXTRACTOR_ERROR_FILE;
    extractor->path = path;
    return METADATA_EXTRACTOR_ERROR_NONE;
}

int metadata_extractor_get_metadata(metadata_extractor_h extractor,
                                    metadata_extractor_attr_e attribute, char** value) {
    const std::string name =
        attribute == METADATA_TITLE ? "METADATA_TITLE" : std::to_string(attribute);
    if (const auto failure = device().record("metadata_extractor_get_metadata", name))
        return *failure;
    if (!lives(extractor) || extractor->path.empty() || !value || attribute != METADATA_TITLE)
        return METADATA_EXTRACTOR_ERROR_INVALID_PARAMETER;
    const auto& title = titles()[extractor->path];
    *value = title ? strdup(title->c_str()) : nullptr;
    return METADATA_EXTRACTOR_ERROR_NONE;
}

int metadata_extractor_destroy(metadata_extractor_h extractor) {
    if (const auto failure = device().record("metadata_extractor_destroy", ""))
        return *failure;
    if (!lives(extractor))
        return METADATA_EXTRACTOR_ERROR_INVALID_PARAMETER;
    extractors().erase(extractor);
    delete extractor;
    return METADATA_EXTRACTOR_ERROR_NONE;
}

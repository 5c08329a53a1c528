#include "ToneList.h"

#include <algorithm>
#include <array>
#include <cctype>
#include <cstdlib>
#include <filesystem>
#include <memory>
#include <optional>
#include <string_view>

#include <unicode/coll.h>

#include "base/MessageLocale.h"
#include "device/metadata_extractor.h"
#include "device_app.h"

#define LOG_TAG "tone-picker"
#include "base/Log.h"

namespace fs = std::filesystem;

namespace tone_picker {
namespace {

bool mayBeSound(const fs::path& file) {
    constexpr std::array<std::string_view, 7> extensions{".ogg",  ".oga", ".opus", ".mp3",
                                                         ".flac", ".m4a", ".wav"};
    std::string extension = file.extension().string();
    std::transform(extension.begin(), extension.end(), extension.begin(),
                   [](unsigned char letter) { return static_cast<char>(std::tolower(letter)); });
    return !file.string().starts_with('.') &&
           std::find(extensions.begin(), extensions.end(), extension) != extensions.end();
}

std::string localPath(const std::string& path) {
    char* local = nullptr;
    if (device_app_get_local_path(path.c_str(), &local) != APP_CONTROL_ERROR_NONE)
        return path;
    std::string copy = local;
    std::free(local);
    return copy;
}

/** The title that a sound file says of itself, perhaps empty; nothing for what is no sound. */
std::optional<std::string> writtenTitle(const std::string& path) {
    metadata_extractor_h extractor = nullptr;
    if (metadata_extractor_create(&extractor) != METADATA_EXTRACTOR_ERROR_NONE)
        return "";
    char* value = nullptr;
    int result = metadata_extractor_set_path(extractor, path.c_str());
    if (result == METADATA_EXTRACTOR_ERROR_NONE)
        result = metadata_extractor_get_metadata(extractor, METADATA_TITLE, &value);
    metadata_extractor_destroy(extractor);
    std::string title = value ? value : "";
    std::free(value);
    return result == METADATA_EXTRACTOR_ERROR_NONE ? std::optional(title) : std::nullopt;
}

void addTone(std::vector<Tone>& tones, const std::string& folder, const fs::path& file) {
    if (const auto title = writtenTitle(join(folder, file.string())))
        tones.push_back({file.string(), title->empty() ? file.stem().string() : *title});
}

/** Compares as the language sorts, or by bytes when it has no rules. */
class Order {
public:
    Order() {
        UErrorCode status = U_ZERO_ERROR;
        _collator.reset(icu::Collator::createInstance(base::messageLocale().c_str(), status));
        if (U_FAILURE(status))
            _collator.reset();
    }

    /** Files with the same title have an order too, so that a position is always the same one. */
    bool operator()(const Tone& a, const Tone& b) const {
        const int order = compare(a.title, b.title);
        return order != 0 ? order < 0 : a.file < b.file;
    }

private:
    int compare(const std::string& a, const std::string& b) const {
        UErrorCode status = U_ZERO_ERROR;
        if (_collator)
            return _collator->compareUTF8(a, b, status);
        return a.compare(b);
    }

    std::unique_ptr<icu::Collator> _collator;
};

} // namespace

std::vector<Tone> tonesIn(const std::string& folder) {
    std::vector<Tone> tones;
    std::error_code problem;
    const std::string local = localPath(folder);
    for (fs::directory_iterator entry(local, problem), end; !problem && entry != end;
         entry.increment(problem)) {
        const fs::path file = entry->path().filename();
        std::error_code ignored;
        if (mayBeSound(file) && entry->is_regular_file(ignored))
            addTone(tones, folder, file);
    }
    if (problem)
        LOG_ERROR("The tones in %s cannot be read: %s", local.c_str(), problem.message().c_str());
    const Order order;
    std::sort(tones.begin(), tones.end(),
              [&order](const Tone& a, const Tone& b) { return order(a, b); });
    return tones;
}

int positionOf(const std::vector<Tone>& tones, const std::string& folder, const std::string& path) {
    const auto found = std::find_if(tones.begin(), tones.end(), [&](const Tone& tone) {
        return join(folder, tone.file) == path;
    });
    return found == tones.end() ? -1 : static_cast<int>(found - tones.begin());
}

std::string join(const std::string& folder, const std::string& file) {
    return folder.ends_with('/') ? folder + file : folder + "/" + file;
}

} // namespace tone_picker

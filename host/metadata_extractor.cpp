#include "device/metadata_extractor.h"

#include <cstring>
#include <exception>
#include <memory>
#include <optional>
#include <string>

#include <fileref.h>
#include <tag.h>
#include <tfilestream.h>
#include <tpropertymap.h>

#include "SoundFile.h"
#include "ToneFolder.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

struct metadata_extractor_s {
    std::string path;
};

namespace {

/** What a file's tags say about the title; nothing when they do not speak of one. */
std::optional<std::string> titleOf(const TagLib::FileRef& file) {
    const TagLib::String title = file.tag() ? file.tag()->title() : TagLib::String();
    if (!title.isEmpty())
        return title.to8Bit(true);
    // A file may have several tags, of which the one above is only the first.
    const TagLib::PropertyMap properties = file.file()->properties();
    const auto found = properties.find("TITLE");
    if (found == properties.end())
        return std::nullopt;
    return found->second.isEmpty() ? std::string() : found->second.front().to8Bit(true);
}

int readTitle(const std::string& path, char** value) {
    host::SoundFile opened(path);
    if (opened.descriptor() < 0) {
        LOG_WARNING("%s cannot be read: %s", path.c_str(), std::strerror(opened.problem()));
        return METADATA_EXTRACTOR_ERROR_FILE;
    }
    // By its descriptor the file is recognised by what it holds: its name may say anything.
    TagLib::FileStream stream(opened.release(), true);
    const TagLib::FileRef file(&stream, false);
    if (file.isNull() || !file.file()->isValid()) {
        LOG_WARNING("%s is not a sound file", path.c_str());
        return METADATA_EXTRACTOR_ERROR_FORMAT;
    }
    const auto title = titleOf(file);
    *value = title ? strdup(title->c_str()) : nullptr;
    return METADATA_EXTRACTOR_ERROR_NONE;
}

} // namespace

int metadata_extractor_create(metadata_extractor_h* extractor) {
    if (!extractor)
        return METADATA_EXTRACTOR_ERROR_INVALID_PARAMETER;
    *extractor = std::make_unique<metadata_extractor_s>().release();
    return METADATA_EXTRACTOR_ERROR_NONE;
}

int metadata_extractor_set_path(metadata_extractor_h extractor, const char* path) {
    if (!extractor || !path)
        return METADATA_EXTRACTOR_ERROR_INVALID_PARAMETER;
    const std::string here = host::pathHere(path);
    const host::SoundFile opened(here);
    if (opened.descriptor() < 0) {
        LOG_WARNING("%s cannot be read: %s", here.c_str(), std::strerror(opened.problem()));
        return METADATA_EXTRACTOR_ERROR_FILE;
    }
    extractor->path = here;
    return METADATA_EXTRACTOR_ERROR_NONE;
}

int metadata_extractor_get_metadata(metadata_extractor_h extractor,
                                    metadata_extractor_attr_e attribute, char** value) {
    if (!extractor || !value || attribute != METADATA_TITLE || extractor->path.empty())
        return METADATA_EXTRACTOR_ERROR_INVALID_PARAMETER;
    *value = nullptr;
    try {
        return readTitle(extractor->path, value);
    } catch (const std::exception& problem) {
        // A size in a damaged file may be more than there is memory.
        LOG_WARNING("%s cannot be understood: %s", extractor->path.c_str(), problem.what());
        return METADATA_EXTRACTOR_ERROR_FORMAT;
    }
}

int metadata_extractor_destroy(metadata_extractor_h extractor) {
    if (!extractor)
        return METADATA_EXTRACTOR_ERROR_INVALID_PARAMETER;
    const std::unique_ptr<metadata_extractor_s> gone(extractor);
    return METADATA_EXTRACTOR_ERROR_NONE;
}

/**
 * @file
 * @brief Reads what a sound file says about itself.
 */
#pragma once

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/** Reader of one file. */
typedef struct metadata_extractor_s* metadata_extractor_h;

/** Result of a successful call; every failure is a negative number. */
#define METADATA_EXTRACTOR_ERROR_NONE 0
/** A null argument, or no path was set. */
#define METADATA_EXTRACTOR_ERROR_INVALID_PARAMETER (-1)
/** The file does not exist or cannot be read. */
#define METADATA_EXTRACTOR_ERROR_FILE (-2)
/** The file is not a sound file. */
#define METADATA_EXTRACTOR_ERROR_FORMAT (-3)

/** What can be asked for. */
typedef enum {
    METADATA_TITLE = 12, /**< Title of the piece. */
} metadata_extractor_attr_e;

/** @brief Makes a reader. @param[out] extractor To be destroyed. */
DEVICE_API int metadata_extractor_create(metadata_extractor_h* extractor);

/** @brief Chooses the file. @param path Absolute path; must be readable. */
DEVICE_API int metadata_extractor_set_path(metadata_extractor_h extractor, const char* path);

/**
 * @brief Reads one attribute.
 * @param[out] value UTF-8 text to be freed with free(); null when the file does not have the
 * attribute, empty when it is there and empty. Formats that do not keep empty attributes count as
 * not having it.
 */
DEVICE_API int metadata_extractor_get_metadata(metadata_extractor_h extractor,
                                               metadata_extractor_attr_e attribute, char** value);

/** @brief Frees a reader. */
DEVICE_API int metadata_extractor_destroy(metadata_extractor_h extractor);

DEVICE_EXTERN_C_END

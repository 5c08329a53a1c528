/**
 * @file
 * @brief Collation and search in the wearer's language: ICU behind C functions.
 *
 * Texts are UTF-16. Lengths are in code units; -1 means up to the terminator.
 */
#pragma once

#include <stdint.h>

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/** A UTF-16 code unit. */
typedef uint16_t i18n_uchar;

/** Results. Warnings are negative as in ICU: a call succeeded unless its result is positive. */
typedef enum {
    I18N_ERROR_WARNING_FIRST = -128,
    I18N_ERROR_USING_DEFAULT = -127,         ///< The locale is unknown.
    I18N_ERROR_STRING_NOT_TERMINATED = -124, ///< No room was left for the terminator.
    I18N_ERROR_NONE = 0,
    I18N_ERROR_INVALID_PARAMETER = 1,
    I18N_ERROR_INTERNAL = 5, ///< Every other failure.
    I18N_ERROR_OUT_OF_MEMORY = 7,
    I18N_ERROR_BUFFER_OVERFLOW = 15,
} i18n_error_code_e;

/** Order of two texts. */
typedef enum {
    I18N_UCOLLATOR_LESS = -1,
    I18N_UCOLLATOR_EQUAL = 0,
    I18N_UCOLLATOR_GREATER = 1,
} i18n_ucollator_result_e;

typedef void* i18n_ucollator_h;
typedef void* i18n_usearch_h;

/** @brief The wearer's locale. @param[out] locale Static text; untouched on failure. */
DEVICE_API int i18n_ulocale_get_default(const char** locale);

/** @brief Makes a collator. @param[out] collator To be destroyed; null on failure. */
DEVICE_API int i18n_ucollator_create(const char* locale, i18n_ucollator_h* collator);
/** @brief Frees a collator; null is allowed. */
DEVICE_API int i18n_ucollator_destroy(i18n_ucollator_h collator);
/** @brief Compares two texts. @param[out] result Untouched on failure. */
DEVICE_API int i18n_ucollator_str_collator(i18n_ucollator_h collator, const i18n_uchar* a,
                                           int32_t a_length, const i18n_uchar* b, int32_t b_length,
                                           i18n_ucollator_result_e* result);

/** @brief Converts UTF-8 into UTF-16; the room at `to` must suffice. @return to, or null. */
DEVICE_API i18n_uchar* i18n_ustring_copy_ua(i18n_uchar* to, const char* from);
/** @brief Converts UTF-8 into at most n code units; ends with a terminator if there is room. */
DEVICE_API i18n_uchar* i18n_ustring_copy_ua_n(i18n_uchar* to, const char* from, int32_t n);
/** @brief Length up to the terminator. */
DEVICE_API int32_t i18n_ustring_get_length(const i18n_uchar* text);
/**
 * @brief Lower-cases a text.
 * @param[in,out] error Checked first as in ICU: nothing happens when it holds a failure.
 * @return Length of the result.
 */
DEVICE_API int32_t i18n_ustring_to_lower(i18n_uchar* to, int32_t capacity, const i18n_uchar* from,
                                         int32_t length, const char* locale,
                                         i18n_error_code_e* error);

/** @brief Makes a search of a pattern in a text. Both must outlive it. */
DEVICE_API int i18n_usearch_create_new(const i18n_uchar* pattern, int32_t pattern_length,
                                       const i18n_uchar* text, int32_t text_length,
                                       const char* locale, void* break_iterator,
                                       i18n_usearch_h* search);
/** @brief Frees a search; null is allowed. */
DEVICE_API int i18n_usearch_destroy(i18n_usearch_h search);
/** @brief Finds the first match. @return Its place, or -1. */
DEVICE_API int32_t i18n_usearch_first(i18n_usearch_h search, i18n_error_code_e* error);
/** @brief Copies the matched text. @return Its length; 0 without a match. */
DEVICE_API int32_t i18n_usearch_get_matched_text(i18n_usearch_h search, i18n_uchar* to,
                                                 int32_t capacity, i18n_error_code_e* error);

DEVICE_EXTERN_C_END

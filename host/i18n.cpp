#include "device/i18n.h"

#include <algorithm>
#include <optional>
#include <set>
#include <string>
#include <string_view>

#include <unicode/ucol.h>
#include <unicode/usearch.h>
#include <unicode/ustring.h>
#include <unicode/utf16.h>
#include <unicode/utf8.h>

#include "base/MessageLocale.h"

namespace {

const UChar* units(const i18n_uchar* text) {
    return reinterpret_cast<const UChar*>(text);
}

UChar* units(i18n_uchar* text) {
    return reinterpret_cast<UChar*>(text);
}

i18n_error_code_e result(UErrorCode status) {
    switch (status) {
    case U_ILLEGAL_ARGUMENT_ERROR:
        return I18N_ERROR_INVALID_PARAMETER;
    case U_MEMORY_ALLOCATION_ERROR:
        return I18N_ERROR_OUT_OF_MEMORY;
    case U_BUFFER_OVERFLOW_ERROR:
        return I18N_ERROR_BUFFER_OVERFLOW;
    default:
        return U_FAILURE(status) ? I18N_ERROR_INTERNAL : static_cast<i18n_error_code_e>(status);
    }
}

/** A text and a length as they may be passed: -1 up to the terminator. */
bool isText(const i18n_uchar* text, std::int32_t length) {
    return text && length >= -1;
}

/** Nothing at all is a place for no characters. */
bool isRoom(const i18n_uchar* to, std::int32_t capacity) {
    return capacity >= 0 && (to || capacity == 0);
}

/** Works on a status as ICU does: not at all once it tells a failure. */
template <typename Work>
std::int32_t withStatus(i18n_error_code_e* error, std::int32_t failed, Work&& work) {
    if (!error || *error > I18N_ERROR_NONE)
        return failed;
    UErrorCode status = U_ZERO_ERROR;
    const std::int32_t value = work(status);
    *error = result(status);
    return value;
}

/** Writes what fits of a text, no half character; @return where it ends. */
i18n_uchar* convert(i18n_uchar* to, const i18n_uchar* end, std::string_view from) {
    const auto length = static_cast<std::int32_t>(from.size());
    for (std::int32_t place = 0; place < length;) {
        UChar32 character = 0;
        U8_NEXT_OR_FFFD(from.data(), place, length, character);
        if (end - to < U16_LENGTH(character))
            break;
        std::int32_t written = 0;
        U16_APPEND_UNSAFE(to, written, character);
        to += written;
    }
    return to;
}

} // namespace

int i18n_ulocale_get_default(const char** locale) {
    if (!locale)
        return I18N_ERROR_INVALID_PARAMETER;
    // Every name stays valid: callers keep the pointer across a change of language.
    static std::set<std::string> names;
    *locale = names.insert(base::messageLocale()).first->c_str();
    return I18N_ERROR_NONE;
}

int i18n_ucollator_create(const char* locale, i18n_ucollator_h* collator) {
    if (!collator)
        return I18N_ERROR_INVALID_PARAMETER;
    UErrorCode status = U_ZERO_ERROR;
    *collator = ucol_open(locale, &status);
    return result(status);
}

int i18n_ucollator_destroy(i18n_ucollator_h collator) {
    ucol_close(static_cast<UCollator*>(collator));
    return I18N_ERROR_NONE;
}

int i18n_ucollator_str_collator(i18n_ucollator_h collator, const i18n_uchar* a, int32_t a_length,
                                const i18n_uchar* b, int32_t b_length,
                                i18n_ucollator_result_e* result) {
    if (!collator || !isText(a, a_length) || !isText(b, b_length) || !result)
        return I18N_ERROR_INVALID_PARAMETER;
    *result = static_cast<i18n_ucollator_result_e>(
        ucol_strcoll(static_cast<UCollator*>(collator), units(a), a_length, units(b), b_length));
    return I18N_ERROR_NONE;
}

i18n_uchar* i18n_ustring_copy_ua(i18n_uchar* to, const char* from) {
    if (!to || !from)
        return nullptr;
    // A byte never becomes more than a unit.
    const std::string_view text = from;
    *convert(to, to + text.size(), text) = 0;
    return to;
}

i18n_uchar* i18n_ustring_copy_ua_n(i18n_uchar* to, const char* from, int32_t n) {
    if (!to || !from || n < 0)
        return nullptr;
    const i18n_uchar* limit = to + n;
    i18n_uchar* end = convert(to, limit, from);
    if (end != limit)
        *end = 0;
    return to;
}

int32_t i18n_ustring_get_length(const i18n_uchar* text) {
    return text ? u_strlen(units(text)) : 0;
}

int32_t i18n_ustring_to_lower(i18n_uchar* to, int32_t capacity, const i18n_uchar* from,
                              int32_t length, const char* locale, i18n_error_code_e* error) {
    return withStatus(error, 0, [&](UErrorCode& status) {
        if (!isRoom(to, capacity) || !isText(from, length)) {
            status = U_ILLEGAL_ARGUMENT_ERROR;
            return 0;
        }
        return u_strToLower(units(to), capacity, units(from), length, locale, &status);
    });
}

int i18n_usearch_create_new(const i18n_uchar* pattern, int32_t pattern_length,
                            const i18n_uchar* text, int32_t text_length, const char* locale,
                            void* break_iterator, i18n_usearch_h* search) {
    if (!search)
        return I18N_ERROR_INVALID_PARAMETER;
    *search = nullptr;
    if (!isText(pattern, pattern_length) || !isText(text, text_length) || !locale)
        return I18N_ERROR_INVALID_PARAMETER;
    UErrorCode status = U_ZERO_ERROR;
    *search = usearch_open(units(pattern), pattern_length, units(text), text_length, locale,
                           static_cast<UBreakIterator*>(break_iterator), &status);
    return result(status);
}

int i18n_usearch_destroy(i18n_usearch_h search) {
    usearch_close(static_cast<UStringSearch*>(search));
    return I18N_ERROR_NONE;
}

int32_t i18n_usearch_first(i18n_usearch_h search, i18n_error_code_e* error) {
    return withStatus(error, USEARCH_DONE, [&](UErrorCode& status) {
        if (!search)
            status = U_ILLEGAL_ARGUMENT_ERROR;
        return usearch_first(static_cast<UStringSearch*>(search), &status);
    });
}

int32_t i18n_usearch_get_matched_text(i18n_usearch_h search, i18n_uchar* to, int32_t capacity,
                                      i18n_error_code_e* error) {
    return withStatus(error, 0, [&](UErrorCode& status) {
        if (!search || !isRoom(to, capacity)) {
            status = U_ILLEGAL_ARGUMENT_ERROR;
            return 0;
        }
        const auto* found = static_cast<UStringSearch*>(search);
        // Without a match the length is that of nothing.
        return std::max(usearch_getMatchedText(found, units(to), capacity, &status), 0);
    });
}

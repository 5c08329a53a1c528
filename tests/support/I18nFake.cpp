#include "support/I18nFake.h"

#include <string>

#include <device/i18n.h>

#include "support/DeviceFake.h"
#include "support/FakeCalls.h"

namespace {

using fakes::quoted;
using fakes::real;

void appendUtf8(std::string& text, char32_t character) {
    const auto byte = [&text](char32_t value) {
        text += static_cast<char>(value);
    };
    if (character < 0x80) {
        byte(character);
    } else if (character < 0x800) {
        byte(0xc0U | character >> 6U);
        byte(0x80U | (character & 0x3fU));
    } else if (character < 0x10000) {
        byte(0xe0U | character >> 12U);
        byte(0x80U | (character >> 6U & 0x3fU));
        byte(0x80U | (character & 0x3fU));
    } else {
        byte(0xf0U | character >> 18U);
        byte(0x80U | (character >> 12U & 0x3fU));
        byte(0x80U | (character >> 6U & 0x3fU));
        byte(0x80U | (character & 0x3fU));
    }
}

/** A text up to its length, or to its terminator when that is -1. */
std::string quoted(const i18n_uchar* units, std::int32_t length) {
    if (!units)
        return "null";
    std::string text = "\"";
    for (std::int32_t place = 0; length < 0 ? units[place] != 0 : place < length; ++place) {
        char32_t character = units[place];
        const bool more = length < 0 || place + 1 < length;
        if (character >= 0xd800 && character < 0xdc00 && more && units[place + 1] >= 0xdc00 &&
            units[place + 1] < 0xe000)
            character = 0x10000 + ((character - 0xd800) << 10U) + (units[++place] - 0xdc00U);
        appendUtf8(text, character);
    }
    return text + '"';
}

std::string handle(const void* object, const char* name) {
    return object ? name : "null";
}

/** Puts what a call is to fail with where it tells its errors. */
void tell(i18n_error_code_e* error, int failure) {
    if (error)
        *error = failure > 0 ? static_cast<i18n_error_code_e>(failure) : I18N_ERROR_INTERNAL;
}

} // namespace

// Failing with less than an error would be a warning.
#define FAIL_IF_TOLD(function, arguments)                                                          \
    if (const auto failure = device().record(function, arguments))                                 \
    return *failure > 0 ? *failure : I18N_ERROR_INTERNAL

int i18n_ulocale_get_default(const char** locale) {
    FAIL_IF_TOLD("i18n_ulocale_get_default", "");
    return real<decltype(i18n_ulocale_get_default)>("i18n_ulocale_get_default")(locale);
}

int i18n_ucollator_create(const char* locale, i18n_ucollator_h* collator) {
    FAIL_IF_TOLD("i18n_ucollator_create", quoted(locale));
    return real<decltype(i18n_ucollator_create)>("i18n_ucollator_create")(locale, collator);
}

int i18n_ucollator_destroy(i18n_ucollator_h collator) {
    FAIL_IF_TOLD("i18n_ucollator_destroy", handle(collator, "collator"));
    return real<decltype(i18n_ucollator_destroy)>("i18n_ucollator_destroy")(collator);
}

int i18n_ucollator_str_collator(i18n_ucollator_h collator, const i18n_uchar* a, int32_t a_length,
                                const i18n_uchar* b, int32_t b_length,
                                i18n_ucollator_result_e* result) {
    FAIL_IF_TOLD("i18n_ucollator_str_collator", quoted(a, a_length) + ", " + quoted(b, b_length));
    return real<decltype(i18n_ucollator_str_collator)>("i18n_ucollator_str_collator")(
        collator, a, a_length, b, b_length, result);
}

i18n_uchar* i18n_ustring_copy_ua(i18n_uchar* to, const char* from) {
    if (device().record("i18n_ustring_copy_ua", quoted(from)))
        return nullptr;
    return real<decltype(i18n_ustring_copy_ua)>("i18n_ustring_copy_ua")(to, from);
}

i18n_uchar* i18n_ustring_copy_ua_n(i18n_uchar* to, const char* from, int32_t n) {
    if (device().record("i18n_ustring_copy_ua_n", quoted(from) + ", " + std::to_string(n)))
        return nullptr;
    return real<decltype(i18n_ustring_copy_ua_n)>("i18n_ustring_copy_ua_n")(to, from, n);
}

int32_t i18n_ustring_get_length(const i18n_uchar* text) {
    if (device().record("i18n_ustring_get_length", quoted(text, -1)))
        return 0;
    return real<decltype(i18n_ustring_get_length)>("i18n_ustring_get_length")(text);
}

int32_t i18n_ustring_to_lower(i18n_uchar* to, int32_t capacity, const i18n_uchar* from,
                              int32_t length, const char* locale, i18n_error_code_e* error) {
    const auto arguments = quoted(from, length) + ", " + quoted(locale);
    if (const auto failure = device().record("i18n_ustring_to_lower", arguments)) {
        tell(error, *failure);
        return 0;
    }
    return real<decltype(i18n_ustring_to_lower)>("i18n_ustring_to_lower")(to, capacity, from,
                                                                          length, locale, error);
}

int i18n_usearch_create_new(const i18n_uchar* pattern, int32_t pattern_length,
                            const i18n_uchar* text, int32_t text_length, const char* locale,
                            void* break_iterator, i18n_usearch_h* search) {
    FAIL_IF_TOLD("i18n_usearch_create_new", quoted(pattern, pattern_length) + ", " +
                                                quoted(text, text_length) + ", " + quoted(locale));
    return real<decltype(i18n_usearch_create_new)>("i18n_usearch_create_new")(
        pattern, pattern_length, text, text_length, locale, break_iterator, search);
}

int i18n_usearch_destroy(i18n_usearch_h search) {
    FAIL_IF_TOLD("i18n_usearch_destroy", handle(search, "search"));
    return real<decltype(i18n_usearch_destroy)>("i18n_usearch_destroy")(search);
}

int32_t i18n_usearch_first(i18n_usearch_h search, i18n_error_code_e* error) {
    if (const auto failure = device().record("i18n_usearch_first", handle(search, "search"))) {
        tell(error, *failure);
        return -1;
    }
    return real<decltype(i18n_usearch_first)>("i18n_usearch_first")(search, error);
}

int32_t i18n_usearch_get_matched_text(i18n_usearch_h search, i18n_uchar* to, int32_t capacity,
                                      i18n_error_code_e* error) {
    if (const auto failure =
            device().record("i18n_usearch_get_matched_text", handle(search, "search"))) {
        tell(error, *failure);
        return 0;
    }
    return real<decltype(i18n_usearch_get_matched_text)>("i18n_usearch_get_matched_text")(
        search, to, capacity, error);
}

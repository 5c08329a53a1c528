#include <array>
#include <clocale>
#include <cstdlib>
#include <string>

#include <gtest/gtest.h>

#include "device/i18n.h"

namespace {

constexpr int ROOM = 64;

using Buffer = std::array<i18n_uchar, ROOM>;

Buffer bufferOf(const char* utf8) {
    Buffer buffer{};
    EXPECT_EQ(i18n_ustring_copy_ua(buffer.data(), utf8), buffer.data());
    return buffer;
}

std::u16string textOf(const i18n_uchar* units, int length = -1) {
    if (length < 0)
        length = i18n_ustring_get_length(units);
    return {units, units + length};
}

/** The language of messages, for the length of a test. */
class Language {
public:
    Language(const char* locale, const char* languages) : _locale(setlocale(LC_ALL, nullptr)) {
        const char* before = std::getenv("LANGUAGE");
        _languages = before ? before : "";
        setlocale(LC_ALL, locale);
        setenv("LANGUAGE", languages, 1);
    }
    ~Language() {
        setlocale(LC_ALL, _locale.c_str());
        setenv("LANGUAGE", _languages.c_str(), 1);
    }
    Language(const Language&) = delete;
    Language& operator=(const Language&) = delete;

private:
    std::string _locale;
    std::string _languages;
};

std::string defaultLocale() {
    const char* locale = nullptr;
    EXPECT_EQ(i18n_ulocale_get_default(&locale), I18N_ERROR_NONE);
    return locale ? locale : "null";
}

TEST(I18nLocale, IsThatOfTheTexts) {
    EXPECT_EQ((Language("C.UTF-8", "tr_TR.UTF-8:en"), defaultLocale()), "tr_TR");
    EXPECT_EQ((Language("C.UTF-8", "sr@latin"), defaultLocale()), "sr_Latn");
    EXPECT_EQ((Language("C.UTF-8", ""), defaultLocale()), "en");
    EXPECT_EQ((Language("C", "de"), defaultLocale()), "en");
}

TEST(I18nLocale, StaysValidWhenTheLanguageChanges) {
    const char* german = nullptr;
    const Language first("C.UTF-8", "de");
    i18n_ulocale_get_default(&german);
    const Language second("C.UTF-8", "ja");
    EXPECT_EQ(defaultLocale(), "ja");
    EXPECT_STREQ(german, "de");
}

TEST(I18nLocale, NeedsAPlace) {
    EXPECT_EQ(i18n_ulocale_get_default(nullptr), I18N_ERROR_INVALID_PARAMETER);
}

class I18nCollator : public testing::Test {
public:
    ~I18nCollator() override { i18n_ucollator_destroy(_collator); }

protected:
    void open(const char* locale) { EXPECT_LE(i18n_ucollator_create(locale, &_collator), 0); }

    i18n_ucollator_result_e order(const char* a, const char* b) {
        auto result = I18N_UCOLLATOR_EQUAL;
        EXPECT_EQ(i18n_ucollator_str_collator(_collator, bufferOf(a).data(), -1, bufferOf(b).data(),
                                              -1, &result),
                  I18N_ERROR_NONE);
        return result;
    }

    i18n_ucollator_h _collator = nullptr;
};

TEST_F(I18nCollator, OrdersByTheRulesOfItsLocale) {
    open("de");
    EXPECT_EQ(order("Åbo", "Zürich"), I18N_UCOLLATOR_LESS);
    EXPECT_EQ(order("Zürich", "Åbo"), I18N_UCOLLATOR_GREATER);
    EXPECT_EQ(order("Köln", "Ko\u0308ln"), I18N_UCOLLATOR_EQUAL);
}

TEST_F(I18nCollator, DanishPutsItsLettersLast) {
    open("da");
    EXPECT_EQ(order("Åbo", "Zürich"), I18N_UCOLLATOR_GREATER);
}

TEST_F(I18nCollator, AnUnknownLocaleIsAWarning) {
    EXPECT_EQ(i18n_ucollator_create("xx_YY", &_collator), I18N_ERROR_USING_DEFAULT);
    EXPECT_EQ(order("a", "b"), I18N_UCOLLATOR_LESS);
}

TEST_F(I18nCollator, ComparesAsManyUnitsAsItIsTold) {
    open("en");
    auto result = I18N_UCOLLATOR_GREATER;
    i18n_ucollator_str_collator(_collator, bufferOf("abc").data(), 2, bufferOf("abd").data(), 2,
                                &result);
    EXPECT_EQ(result, I18N_UCOLLATOR_EQUAL);
}

TEST_F(I18nCollator, RefusesWhatIsMissing) {
    open("en");
    const auto text = bufferOf("a");
    auto result = I18N_UCOLLATOR_GREATER;
    const auto compare = [&result](void* collator, const i18n_uchar* a, int length,
                                   const i18n_uchar* b) {
        return i18n_ucollator_str_collator(collator, a, length, b, -1, &result);
    };
    EXPECT_EQ(compare(nullptr, text.data(), -1, text.data()), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(compare(_collator, nullptr, -1, text.data()), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(compare(_collator, text.data(), -1, nullptr), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(compare(_collator, text.data(), -2, text.data()), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(result, I18N_UCOLLATOR_GREATER) << "untouched";
    EXPECT_EQ(i18n_ucollator_str_collator(_collator, text.data(), -1, text.data(), -1, nullptr),
              I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(i18n_ucollator_create("en", nullptr), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(i18n_ucollator_destroy(nullptr), I18N_ERROR_NONE);
}

TEST(I18nString, IsConvertedWithAReplacementForWhatIsNoText) {
    EXPECT_EQ(textOf(bufferOf("Zürich 東 😀").data()), u"Zürich 東 😀");
    EXPECT_EQ(textOf(bufferOf("a\xff\xc3").data()), u"a\ufffd\ufffd");
    EXPECT_EQ(textOf(bufferOf("").data()), u"");
}

TEST(I18nString, IsCutToWholeCharacters) {
    Buffer buffer;
    buffer.fill('x');
    EXPECT_EQ(i18n_ustring_copy_ua_n(buffer.data(), "ab😀", 3), buffer.data());
    EXPECT_EQ(textOf(buffer.data(), 4), std::u16string(u"ab\0x", 4)) << "half of it is nothing";
    buffer.fill('x');
    i18n_ustring_copy_ua_n(buffer.data(), "ab😀c", 4);
    EXPECT_EQ(textOf(buffer.data(), 5), u"ab😀x") << "no room for a terminator";
    buffer.fill('x');
    i18n_ustring_copy_ua_n(buffer.data(), "ab", 0);
    EXPECT_EQ(buffer[0], 'x');
}

TEST(I18nString, RefusesWhatIsMissing) {
    Buffer buffer{};
    EXPECT_EQ(i18n_ustring_copy_ua(nullptr, "a"), nullptr);
    EXPECT_EQ(i18n_ustring_copy_ua(buffer.data(), nullptr), nullptr);
    EXPECT_EQ(i18n_ustring_copy_ua_n(nullptr, "a", 1), nullptr);
    EXPECT_EQ(i18n_ustring_copy_ua_n(buffer.data(), nullptr, 1), nullptr);
    EXPECT_EQ(i18n_ustring_copy_ua_n(buffer.data(), "a", -1), nullptr);
    EXPECT_EQ(i18n_ustring_get_length(nullptr), 0);
}

std::u16string lowered(const char* utf8, const char* locale) {
    Buffer buffer{};
    auto error = I18N_ERROR_NONE;
    const auto text = bufferOf(utf8);
    const int length = i18n_ustring_to_lower(buffer.data(), ROOM, text.data(), -1, locale, &error);
    EXPECT_EQ(error, I18N_ERROR_NONE);
    return textOf(buffer.data(), length);
}

TEST(I18nLower, FollowsTheLocale) {
    EXPECT_EQ(lowered("ISTANBUL", "en"), u"istanbul");
    EXPECT_EQ(lowered("ISPARTA", "tr"), u"ısparta");
    EXPECT_EQ(lowered("İzmir", "tr"), u"izmir");
    EXPECT_EQ(lowered("İzmir", "en"), u"i\u0307zmir");
}

TEST(I18nLower, TellsWhenTheRoomIsTooSmall) {
    Buffer buffer{};
    const auto text = bufferOf("ABC");
    auto error = I18N_ERROR_NONE;
    EXPECT_EQ(i18n_ustring_to_lower(buffer.data(), 2, text.data(), 3, "en", &error), 3);
    EXPECT_EQ(error, I18N_ERROR_BUFFER_OVERFLOW);
    error = I18N_ERROR_NONE;
    i18n_ustring_to_lower(buffer.data(), 3, text.data(), 3, "en", &error);
    EXPECT_EQ(error, I18N_ERROR_STRING_NOT_TERMINATED);
}

TEST(I18nLower, DoesNothingAfterAFailureButAfterAWarning) {
    Buffer buffer{};
    const auto text = bufferOf("A");
    auto error = I18N_ERROR_BUFFER_OVERFLOW;
    EXPECT_EQ(i18n_ustring_to_lower(buffer.data(), ROOM, text.data(), 1, "en", &error), 0);
    EXPECT_EQ(error, I18N_ERROR_BUFFER_OVERFLOW);
    EXPECT_EQ(buffer[0], 0);
    error = I18N_ERROR_STRING_NOT_TERMINATED;
    EXPECT_EQ(i18n_ustring_to_lower(buffer.data(), ROOM, text.data(), 1, "en", &error), 1);
    EXPECT_EQ(buffer[0], 'a');
}

TEST(I18nLower, RefusesWhatIsMissing) {
    Buffer buffer{};
    const auto text = bufferOf("A");
    const auto errorOf = [](i18n_uchar* to, int capacity, const i18n_uchar* from) {
        auto error = I18N_ERROR_NONE;
        i18n_ustring_to_lower(to, capacity, from, 1, "en", &error);
        return error;
    };
    EXPECT_EQ(errorOf(nullptr, ROOM, text.data()), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(errorOf(buffer.data(), -1, text.data()), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(errorOf(buffer.data(), ROOM, nullptr), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(i18n_ustring_to_lower(buffer.data(), ROOM, text.data(), 1, "en", nullptr), 0);
}

class I18nSearch : public testing::Test {
public:
    ~I18nSearch() override { i18n_usearch_destroy(_search); }

protected:
    int open(const char* pattern, const char* text, const char* locale) {
        _pattern = bufferOf(pattern);
        _text = bufferOf(text);
        return i18n_usearch_create_new(_pattern.data(), -1, _text.data(), -1, locale, nullptr,
                                       &_search);
    }

    Buffer _pattern{};
    Buffer _text{};
    i18n_usearch_h _search = nullptr;
    i18n_error_code_e _error = I18N_ERROR_NONE;
};

TEST_F(I18nSearch, FindsAndCopiesTheFirstMatch) {
    ASSERT_LE(open("ü", "bern, zu\u0308rich, ü", "de"), 0);
    EXPECT_EQ(i18n_usearch_first(_search, &_error), 7);
    Buffer matched{};
    EXPECT_EQ(i18n_usearch_get_matched_text(_search, matched.data(), ROOM, &_error), 2);
    EXPECT_EQ(textOf(matched.data()), u"u\u0308");
    EXPECT_LE(_error, I18N_ERROR_NONE);
}

TEST_F(I18nSearch, FindsNoPartOfACharacter) {
    ASSERT_LE(open("u", "zu\u0308rich", "de"), 0);
    Buffer matched{};
    EXPECT_EQ(i18n_usearch_first(_search, &_error), -1);
    EXPECT_EQ(i18n_usearch_get_matched_text(_search, matched.data(), ROOM, &_error), 0);
}

TEST_F(I18nSearch, FollowsTheRulesOfItsLocale) {
    ASSERT_LE(open("-", "a-b", "th"), 0);
    i18n_usearch_first(_search, &_error);
    Buffer matched{};
    EXPECT_EQ(i18n_usearch_get_matched_text(_search, matched.data(), ROOM, &_error), 0)
        << "Thai passes over punctuation";
}

TEST_F(I18nSearch, NeedsAPatternAndAText) {
    EXPECT_EQ(open("", "a", "en"), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(open("a", "", "en"), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(open("a", "a", nullptr), I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(_search, nullptr);
    EXPECT_EQ(i18n_usearch_create_new(_text.data(), 1, _text.data(), 1, "en", nullptr, nullptr),
              I18N_ERROR_INVALID_PARAMETER);
}

TEST_F(I18nSearch, RefusesWhatIsMissing) {
    Buffer matched{};
    EXPECT_EQ(i18n_usearch_first(nullptr, &_error), -1);
    EXPECT_EQ(_error, I18N_ERROR_INVALID_PARAMETER);
    _error = I18N_ERROR_NONE;
    EXPECT_EQ(i18n_usearch_get_matched_text(nullptr, matched.data(), ROOM, &_error), 0);
    EXPECT_EQ(_error, I18N_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(i18n_usearch_destroy(nullptr), I18N_ERROR_NONE);
}

} // namespace

#include "rules/CitySearch.h"

#include <algorithm>
#include <array>
#include <random>
#include <set>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <unicode/ucol.h>
#include <unicode/unistr.h>

#include "rules/CatalogueForTest.h"
#include "rules/EverySearch.h"
#include "rules/WorldCities.h"

namespace {

using Cities = std::vector<ClockWorldClockDbData>;
using Places = std::vector<std::size_t>;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

ClockWorldClockDbData city(const std::string& name, const std::string& country) {
    ClockWorldClockDbData record;
    record.city = name;
    record.country = country;
    return record;
}

struct SearchCase {
    const char* language;
    const char* text;
    const char* name;
    const char* country;
    bool found;
};

class CitySearchTextTest : public testing::TestWithParam<SearchCase> {};

TEST_P(CitySearchTextTest, IsFoundAsTheLanguageReadsIt) {
    const SearchCase& c = GetParam();
    const CatalogueForTest language(c.language);
    const auto record = city(c.name, c.country);
    EXPECT_EQ(rules::isIncludeSearchText(record, c.text), c.found) << c.text << " in " << c.name;
    EXPECT_THAT(rules::CitySearch({record}, rules::searchLocale()).find(c.text),
                SizeIs(c.found ? 1 : 0))
        << c.text << " in " << c.name;
}

INSTANTIATE_TEST_SUITE_P(Anywhere, CitySearchTextTest,
                         testing::Values(SearchCase{"en", "", "Bonn", "Germany", true},
                                         SearchCase{"en", "b", "Bonn", "Germany", true},
                                         SearchCase{"en", "BONN", "Bonn", "Germany", true},
                                         SearchCase{"en", "n, g", "Bonn", "Germany", true},
                                         SearchCase{"en", "many", "Bonn", "Germany", true},
                                         SearchCase{"en", "bonn, germany", "Bonn", "Germany", true},
                                         SearchCase{"en", "bonn, germany ", "Bonn", "Germany",
                                                    false},
                                         SearchCase{"en", "bern", "Bonn", "Germany", false},
                                         SearchCase{"en", "bn", "Bonn", "Germany", false}));

INSTANTIATE_TEST_SUITE_P(Accents, CitySearchTextTest,
                         testing::Values(SearchCase{"de", "zü", "Zürich", "Schweiz", true},
                                         SearchCase{"de", "zu\u0308", "Zürich", "Schweiz", true},
                                         SearchCase{"de", "zü", "Zu\u0308rich", "Schweiz", true},
                                         SearchCase{"de", "zu", "Zürich", "Schweiz", false},
                                         SearchCase{"de", "zu", "Zu\u0308rich", "Schweiz", false},
                                         SearchCase{"de", "\u0308", "Zu\u0308rich", "Schweiz",
                                                    false},
                                         SearchCase{"de", "ss", "Straße", "x", false},
                                         SearchCase{"de", "ß", "Straße", "x", true}));

INSTANTIATE_TEST_SUITE_P(
    Languages, CitySearchTextTest,
    testing::Values(
        SearchCase{"tr", "i", "ISPARTA", "x", false}, SearchCase{"tr", "ı", "ISPARTA", "x", true},
        SearchCase{"tr", "İZ", "izmir", "x", true}, SearchCase{"en", "i", "ISPARTA", "x", true},
        SearchCase{"cs", "c", "Cheb", "x", false}, SearchCase{"en", "c", "Cheb", "x", true},
        SearchCase{"hi", "द", "दिल्ली", "x", true}, SearchCase{"ko", "서", "서울", "x", true},
        SearchCase{"ko", "ㅅ", "서울", "x", false}, SearchCase{"th", "กรุง", "กรุงเทพ", "x", true},
        SearchCase{"th", " ", "a b", "x", false}, SearchCase{"th", "ab", "a b", "x", true},
        SearchCase{"en", "ab", "a b", "x", false}, SearchCase{"en", "a\u00adb", "ab", "x", true},
        SearchCase{"en", "\u00ad", "a\u00adb", "x", false}));

TEST(CitySearch, FindsPlacesInTheListsOrderAndInTranslations) {
    const CatalogueForTest german("de", {{"IDS_C", "Köln"}, {"IDS_DE", "Deutschland"}});
    rules::CitySearch search({city("IDS_C", "IDS_DE"), city("IDS_C", "x"), city("x", "IDS_DE")},
                             "de");
    EXPECT_THAT(search.find("köln"), ElementsAre(0, 1));
    EXPECT_THAT(search.find("DEUTSCH"), ElementsAre(0, 2));
    EXPECT_THAT(search.find("ids"), IsEmpty());
    EXPECT_THAT(search.find(""), ElementsAre(0, 1, 2));
    EXPECT_EQ(search.locale(), "de");
}

TEST(CitySearch, TheTextIsSearchedInUpTo511Bytes) {
    const std::string head(506, 'a');
    for (const auto& [name, found] :
         {std::pair(head + "xyz", true), std::pair(head + "..xyz", true),
          std::pair(head + "...xyz", false)}) {
        const auto record = city(name, "-");
        EXPECT_EQ(rules::isIncludeSearchText(record, "xyz"), found) << name.size();
        EXPECT_THAT(rules::CitySearch({record}, "en").find("xyz"), SizeIs(found ? 1 : 0));
    }
}

TEST(CitySearch, ATextThatGrowsInLowerCaseIsCutToItsLength) {
    const CatalogueForTest language("en");
    for (const char* text : {"i", "z", ", x", "İ", "İz", "i\u0307i"}) {
        const auto record = city("İİz", "x");
        EXPECT_THAT(rules::CitySearch({record}, "en").find(text),
                    SizeIs(rules::isIncludeSearchText(record, text) ? 1 : 0))
            << text;
    }
}

TEST(CitySearch, ATextTooLongForLowerCaseIsLoggedAndNotFound) {
    const CatalogueForTest language("lt");
    std::string grown;
    for (int letter = 0; letter < 250; ++letter)
        grown += "Ì";
    const auto record = city(grown, "x");
    testing::internal::CaptureStderr();
    EXPECT_FALSE(rules::isIncludeSearchText(record, "x"));
    rules::CitySearch search({record}, "lt");
    EXPECT_THAT(testing::internal::GetCapturedStderr(),
                testing::HasSubstr("i18n_ustring_to_lower failed :: uStrLower"));
    EXPECT_THAT(search.find("x"), IsEmpty());
    EXPECT_THAT(search.find(""), SizeIs(1));
}

// The search keeps weights of one strength.
TEST(CitySearch, NoLanguageComparesLessOrMoreThanTheOthers) {
    for (std::int32_t place = 0; place < ucol_countAvailable(); ++place) {
        UErrorCode status = U_ZERO_ERROR;
        UCollator* collator = ucol_open(ucol_getAvailable(place), &status);
        EXPECT_EQ(ucol_getStrength(collator), UCOL_TERTIARY) << ucol_getAvailable(place);
        ucol_close(collator);
    }
}

class CitySearchLanguageTest : public testing::TestWithParam<const char*> {
protected:
    const CatalogueForTest _language{GetParam()};
};

std::vector<std::string> allTexts() {
    auto texts = searchTexts();
    const auto odd = oddSearchTexts();
    texts.insert(texts.end(), odd.begin(), odd.end());
    return texts;
}

TEST_P(CitySearchLanguageTest, FindsWhatThePlainStepsFind) {
    const auto cities = worldCities(GetParam(), 120);
    ASSERT_THAT(cities, SizeIs(120)) << "libtimezonemap-data is needed";
    rules::CitySearch search(cities, rules::searchLocale());
    std::size_t turn = 0;
    for (const auto& text : allTexts()) {
        const auto places = search.find(text);
        // Some of the cities for each text: the plain steps are slow.
        for (std::size_t place = turn++ % 3; place < cities.size(); place += 3) {
            const bool found = std::binary_search(places.begin(), places.end(), place);
            EXPECT_EQ(found, rules::isIncludeSearchText(cities[place], text))
                << '"' << text << "\" in " << cities[place].city << ", " << cities[place].country;
        }
    }
}

TEST_P(CitySearchLanguageTest, FindsWhatTheLanguagesSearchFinds) {
    const auto cities = worldCities(GetParam(), 1000);
    rules::CitySearch search(cities, rules::searchLocale());
    EverySearch every(cities, rules::searchLocale());
    EXPECT_GE(searchTexts().size(), 500U);
    for (const auto& text : allTexts())
        EXPECT_EQ(search.find(text), every.find(text)) << '"' << text << '"';
}

/** Letters, marks and invisible characters in no order that a language would have. */
std::string scrambled(std::mt19937& random, std::size_t longest) {
    static const auto letters = icu::UnicodeString::fromUTF8(
        "aaeiosAIEcChhlldn  ,-.'1゙́̈̇̆ÀéüßİıæøåÅij·ŀﬁěčĆЙиікεάςเแาุ้ำไกงि्षदन்க\u0600\u06dd"
        "\u00ad\u200b\u200c\u200d\u2060\ufe0f가각ㄱ\u1100\u1175\u11a8東カーゕか゛ﾞ🇩🇪😀👨𝔞اللهٕأَّבּיִ"
        "\u0f71\u0f72\u0344"
        "\u0345\u09c7\u09be\r\n");
    icu::UnicodeString text;
    for (auto length = 1 + random() % longest; length > 0; --length)
        text += letters.char32At(static_cast<std::int32_t>(random() % letters.length()));
    std::string utf8;
    text.toUTF8String(utf8);
    return utf8;
}

TEST_P(CitySearchLanguageTest, FindsInAnyRowOfCharactersWhatTheLanguagesSearchFinds) {
    std::mt19937 random(3);
    Cities cities;
    for (int place = 0; place < 400; ++place)
        cities.push_back(city(scrambled(random, 8), scrambled(random, 4)));
    rules::CitySearch search(cities, rules::searchLocale());
    EverySearch every(cities, rules::searchLocale());
    for (int turn = 0; turn < 600; ++turn) {
        const auto text = scrambled(random, 3);
        EXPECT_EQ(search.find(text), every.find(text)) << '"' << text << '"';
    }
}

INSTANTIATE_TEST_SUITE_P(Languages, CitySearchLanguageTest,
                         testing::Values("en", "de", "tr", "cs", "da", "ja", "ko", "th", "hi"));

} // namespace

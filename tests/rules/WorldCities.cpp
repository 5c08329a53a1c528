#include "rules/WorldCities.h"

#include <algorithm>
#include <array>
#include <fstream>
#include <map>
#include <set>
#include <sstream>
#include <string_view>

#include <unicode/locid.h>
#include <unicode/normalizer2.h>
#include <unicode/uchar.h>
#include <unicode/unistr.h>

namespace {

constexpr std::size_t LONGEST_TEXT = 10;

std::vector<std::string> split(const std::string& line, char separator) {
    std::vector<std::string> parts;
    std::istringstream stream(line);
    for (std::string part; std::getline(stream, part, separator);)
        parts.push_back(part);
    return parts;
}

icu::UnicodeString unicode(const std::string& text) {
    return icu::UnicodeString::fromUTF8(text);
}

std::string utf8(const icu::UnicodeString& text) {
    std::string bytes;
    text.toUTF8String(bytes);
    return bytes;
}

const std::vector<std::string>& cityLines() {
    static const auto lines = [] {
        std::vector<std::string> all;
        std::ifstream file(WORLD_CITIES_FILE);
        for (std::string line; std::getline(file, line);)
            all.push_back(line);
        return all;
    }();
    return lines;
}

/** Letters that hardly any other language has. */
icu::UnicodeString ownLetters(const std::string& language) {
    static const std::map<std::string, std::string> letters{
        {"de", "äöüß"},    {"tr", "ığşİĞŞ"}, {"cs", "ěščřžůĚŠČŘŽ"},          {"da", "æøåÆØÅ"},
        {"fr", "éèêçâîô"}, {"es", "áéíóñ"},  {"vi", "ạảấầẩẫậắằẳẵặẹẻẽếềểễệ"},
    };
    const auto found = letters.find(language);
    return found == letters.end() ? icu::UnicodeString() : unicode(found->second);
}

bool isInScript(UChar32 letter, const std::string& language) {
    static const std::map<std::string, std::vector<UBlockCode>> blocks{
        {"ja", {UBLOCK_KATAKANA, UBLOCK_HIRAGANA}},
        {"ko", {UBLOCK_HANGUL_SYLLABLES}},
        {"th", {UBLOCK_THAI}},
        {"ar", {UBLOCK_ARABIC}},
        {"ru", {UBLOCK_CYRILLIC}},
        {"hi", {UBLOCK_DEVANAGARI}},
        {"he", {UBLOCK_HEBREW}},
        {"el", {UBLOCK_GREEK}},
    };
    const auto found = blocks.find(language);
    return found != blocks.end() && std::find(found->second.begin(), found->second.end(),
                                              ublock_getCode(letter)) != found->second.end();
}

bool isOfLanguage(const std::string& name, const std::string& language) {
    const auto text = unicode(name);
    const auto letters = ownLetters(language);
    for (std::int32_t place = 0; place < text.length(); ++place) {
        if (isInScript(text.char32At(place), language) || letters.indexOf(text[place]) >= 0)
            return true;
    }
    return false;
}

std::string nameIn(const std::string& language, const std::string& name,
                   const std::string& otherNames) {
    for (const auto& other : split(otherNames, ',')) {
        if (isOfLanguage(other, language))
            return other;
    }
    return name;
}

std::string countryIn(const std::string& language, const std::string& code) {
    icu::UnicodeString name;
    icu::Locale("und", code.c_str()).getDisplayCountry(icu::Locale(language.c_str()), name);
    return utf8(name);
}

/** An offset that spreads the cities over the day as the real ones do. */
std::string offsetOf(double longitude) {
    static constexpr std::array<const char*, 4> minutes{":00", ":00", ":30", ":45"};
    const int quarter = static_cast<int>(longitude / 15 * 4);
    const int hours = std::abs(quarter) / 4;
    return std::string(quarter < 0 ? "GMT-" : "GMT+") + (hours < 10 ? "0" : "") +
           std::to_string(hours) + minutes[static_cast<std::size_t>(std::abs(quarter) % 4)];
}

class TextCollector {
public:
    void add(const std::string& text) {
        if (!text.empty() && _known.insert(text).second)
            texts.push_back(text);
    }

    std::vector<std::string> texts;

private:
    std::set<std::string> _known;
};

std::string withoutAccents(const icu::UnicodeString& text) {
    UErrorCode status = U_ZERO_ERROR;
    const auto decomposed = icu::Normalizer2::getNFDInstance(status)->normalize(text, status);
    icu::UnicodeString bare;
    for (std::int32_t place = 0; place < decomposed.length(); ++place) {
        if (u_getCombiningClass(decomposed[place]) == 0)
            bare += decomposed[place];
    }
    return utf8(bare);
}

/** A part of a name as different people type it. */
void addPart(TextCollector& collector, const icu::UnicodeString& name, std::size_t seed,
             const char* language) {
    const auto length = static_cast<std::size_t>(name.length());
    const auto start = length > 3 && seed % 3 == 1 ? seed % (length - 2) : 0;
    const auto size = 1 + seed % LONGEST_TEXT;
    const auto part =
        name.tempSubString(static_cast<std::int32_t>(start), static_cast<std::int32_t>(size));
    auto capitals = part;
    collector.add(utf8(part));
    if (seed % 2 == 0)
        collector.add(utf8(capitals.toUpper(icu::Locale(language))));
    if (seed % 5 == 0)
        collector.add(withoutAccents(part));
}

} // namespace

std::vector<ClockWorldClockDbData> worldCities(const std::string& language, std::size_t count) {
    enum Column : std::size_t { Name = 1, OtherNames = 3, Longitude = 5, Country = 8, Zone = 17 };
    std::map<std::string, std::string> countries;
    std::vector<ClockWorldClockDbData> cities;
    const auto& lines = cityLines();
    count = count == 0 ? lines.size() : std::min(count, lines.size());
    for (std::size_t place = 0; place < count; ++place) {
        const auto columns = split(lines[place * lines.size() / count], '\t');
        if (columns.size() <= Zone)
            continue;
        const auto& code = columns[Country];
        if (!countries.contains(code))
            countries[code] = countryIn(language, code);
        ClockWorldClockDbData city;
        city.index = static_cast<std::int32_t>(cities.size());
        city.city = nameIn(language, columns[Name], columns[OtherNames]);
        city.country = countries[code];
        city.timezone = offsetOf(std::stod(columns[Longitude]));
        city.tzPath = columns[Zone];
        cities.push_back(city);
    }
    return cities;
}

namespace {

std::vector<std::string> makeSearchTexts() {
    TextCollector collector;
    for (const char* text :
         {"a",       "A",          "lon",        "LONDON",   "san ",    "são",
          "Sao",     "zürich",     "Zurich",     "straß",    "STRASS",  "ß",
          "ss",      "istanbul",   "İSTANBUL",   "ıstanbul", "i",       "İ",
          "ı",       "I",          "ISPARTA",    "ığdır",    "IĞDIR",   "diyarb",
          "ch",      "ceske",      "České",      "aa",       "å",       "Århus",
          "aarhus",  "æ",          "ae",         "ø",        "köln",    "Koln",
          "東京",    "とうきょう", "トウキョウ", "東",       "서울",    "서",
          "ㅅ",      "한국",       "กรุงเทพ",     "กรุ",       "เชียง",    "เ",
          "القاهرة", "ال",         "مكة",        "दिल्ली",    "दि",      "москва",
          "МОСКВА",  "й",          "αθήνα",      "ΑΘΗΝΑ",    "e\u0301", "z\u0308urich",
          "\u0301",  "\u0308a",    "a\u0308",    "ﬁ",        "\u00ad",  "a\u00adb",
          "\u200b",  "\u200d",     "\u2060",     "\ufeff",   " ",       "  ",
          "   ",     ",",          ", ",         ",a",       "a,",      "n, j",
          "o, u",    " a",         "a ",         "-",        "'",       "’",
          ".",       "(",          "😀",          "🇩🇪",       "🇩",       "a😀",
          "𝔞",       "1",          "%",          "%s",       "<b>",     "&amp;",
          "ĳ",       "ij",         "ǆ",          "dž",       "lj",      "ŀ",
          "l·",      "ñ",          "n\u0303",    "ll",       "rr",      "gy",
          "dzs",     "sz",         "č",          "c\u030c"})
        collector.add(text);
    for (const char* language : {"en", "de", "tr", "cs", "da", "ja", "ko", "th", "ar", "hi"}) {
        std::size_t seed = 0;
        for (const auto& city : worldCities(language, 120)) {
            addPart(collector, unicode(city.city), seed, language);
            if (seed % 4 == 0)
                addPart(collector, unicode(city.country), seed + 7, language);
            ++seed;
        }
    }
    return collector.texts;
}

} // namespace

const std::vector<std::string>& searchTexts() {
    static const auto texts = makeSearchTexts();
    return texts;
}

std::vector<std::string> oddSearchTexts() {
    const auto repeated = [](const std::string& text, std::size_t times) {
        std::string result;
        for (std::size_t time = 0; time < times; ++time)
            result += text;
        return result;
    };
    return {"",
            "\xff",
            "a\xc3",
            "\xe2\x82",
            "\xed\xa0\x80",
            "\xf0\x9f\x98",
            "\xc0\x80",
            repeated("a", 20),
            repeated("a", 511),
            repeated("a", 512),
            repeated("a", 5000),
            repeated("İ", 300),
            repeated("İ", 511),
            repeated("ı", 512),
            repeated("😀", 256),
            repeated("\u0301", 20),
            repeated(" ", 20),
            repeated("\u00ad", 511),
            std::string("lon\0don", 7)};
}

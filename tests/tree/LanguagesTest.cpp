// The catalogues of all languages have what the English one has.

#include <algorithm>
#include <array>
#include <map>
#include <optional>
#include <regex>
#include <sstream>
#include <string>
#include <string_view>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tree.h"

namespace fs = std::filesystem;

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

namespace {

constexpr std::array HEADER_FIELDS = {
    "Project-Id-Version", "PO-Revision-Date", "Last-Translator",
    "Language-Team",      "MIME-Version",     "Plural-Forms",
    "Language",           "Content-Type",     "Content-Transfer-Encoding"};

/** Words that a language shares with English. */
const std::map<std::string, std::vector<std::string>> SHARED = {
    {"de", {"IDS_ALM_BODY_ALERTTYEP_VIBRATION", "IDS_ALM_BODY_IN_PS"}},
    {"fr", {"IDS_COM_BODY_DATE", "IDS_ALM_BODY_TYPE"}},
    {"pl", {"IDS_COM_BODY_ALARM"}},
    {"tr", {"IDS_COM_BODY_ALARM"}},
};

struct Entry {
    std::string id;
    std::string text;
    std::vector<std::string> comments;
};

using Faults = std::vector<std::string>;

/** What is between the quotation marks of a line; nothing when it is not a text. */
std::optional<std::string> quotedIn(std::string_view line) {
    static const std::regex form(R"re(\s*"((?:[^"\\]|\\.)*)"\s*)re");
    std::match_results<std::string_view::const_iterator> match;
    if (!std::regex_match(line.begin(), line.end(), match, form))
        return std::nullopt;
    std::string text;
    const std::string raw = match[1];
    for (std::size_t i = 0; i < raw.size(); ++i)
        text += raw[i] != '\\' ? raw[i] : raw[++i] == 'n' ? '\n' : raw[i];
    return text;
}

/** Reads a catalogue line by line. */
class Reader {
public:
    explicit Reader(const std::string& catalogue) {
        std::istringstream lines(catalogue);
        for (std::string line; std::getline(lines, line);)
            if (!take(line))
                faults.push_back("cannot be read: " + line);
        if (_field == Field::Id)
            faults.push_back("an entry without an end: " + entries.back().id);
    }

    std::vector<Entry> entries;
    Faults faults;

private:
    enum class Field { None, Id, Text };

    bool take(const std::string& line) {
        if (line.empty())
            return _field != Field::Id;
        if (line.starts_with('#')) {
            // Machine comments, such as "#, fuzzy", tell of work that is not done.
            _comments.push_back(line);
            return _field != Field::Id && (line == "#" || line.starts_with("# "));
        }
        if (line.starts_with("msgid "))
            return begin(quotedIn(std::string_view(line).substr(6)));
        if (line.starts_with("msgstr ")) {
            if (_field != Field::Id)
                return false;
            _field = Field::Text;
            return append(quotedIn(std::string_view(line).substr(7)));
        }
        return append(quotedIn(line));
    }

    bool begin(const std::optional<std::string>& id) {
        const bool isExpected = _field != Field::Id;
        _field = Field::Id;
        entries.push_back({id.value_or(""), "", std::move(_comments)});
        _comments.clear();
        return isExpected && id.has_value();
    }

    bool append(const std::optional<std::string>& text) {
        if (!text || _field == Field::None)
            return false;
        (_field == Field::Id ? entries.back().id : entries.back().text) += *text;
        return true;
    }

    Field _field = Field::None;
    std::vector<std::string> _comments;
};

/** The conversions of a format by their number, and what makes them unusable. */
struct Conversions {
    std::map<int, char> types;
    bool isSound = true;
};

Conversions conversionsOf(const std::string& format) {
    static const std::regex form(R"(%(?:%|(?:(\d+)\$)?[-+ 0#]*\d*([dis])|))");
    Conversions result;
    int plain = 0;
    bool hasNumbers = false;
    for (std::sregex_iterator match(format.begin(), format.end(), form), end; match != end;
         ++match) {
        if (match->str() == "%%")
            continue;
        if (!(*match)[2].matched)
            return {{}, false};
        const bool isNumbered = (*match)[1].matched;
        hasNumbers = hasNumbers || isNumbered;
        const char type = *(*match)[2].first == 'i' ? 'd' : *(*match)[2].first;
        const int number = isNumbered ? std::stoi((*match)[1]) : ++plain;
        result.isSound = result.types.emplace(number, type).second && result.isSound;
    }
    result.isSound = result.isSound && !(hasNumbers && plain > 0);
    return result;
}

void checkHeader(const std::string& language, const std::string& header, Faults& faults) {
    std::map<std::string, std::string> fields;
    std::istringstream lines(header);
    for (std::string line; std::getline(lines, line);) {
        const auto colon = line.find(": ");
        if (colon != std::string::npos)
            fields[line.substr(0, colon)] = line.substr(colon + 2);
    }
    for (const char* field : HEADER_FIELDS)
        if (fields[field].empty())
            faults.push_back(std::string("no header field ") + field);
    if (fields["Language"] != language)
        faults.push_back("is of the language " + fields["Language"]);
    if (fields["Content-Type"] != "text/plain; charset=UTF-8")
        faults.push_back("is not in UTF-8");
    static const std::regex plural(R"(nplurals=[1-6]; plural=[^;]+;)");
    if (!std::regex_match(fields["Plural-Forms"], plural))
        faults.push_back("no rule of plurals: " + fields["Plural-Forms"]);
}

void checkEntry(const Entry& english, const Entry& entry, Faults& faults) {
    if (entry.text.empty())
        faults.push_back(entry.id + " is empty");
    if (entry.text.find("IDS_") != std::string::npos)
        faults.push_back(entry.id + " is an identifier");
    const auto conversions = conversionsOf(entry.text);
    if (!conversions.isSound || conversions.types != conversionsOf(english.text).types)
        faults.push_back(entry.id + " has other conversions: " + entry.text);
    if (entry.comments != english.comments)
        faults.push_back(entry.id + " has other comments");
}

void checkEntries(const std::vector<Entry>& english, const std::vector<Entry>& entries,
                  Faults& faults) {
    std::map<std::string, const Entry*> byId;
    for (const Entry& entry : entries)
        if (!byId.emplace(entry.id, &entry).second)
            faults.push_back(entry.id + " is there twice");
    for (const Entry& entry : english) {
        const auto found = byId.find(entry.id);
        if (found == byId.end())
            faults.push_back(entry.id + " is missing");
        else if (!entry.id.empty())
            checkEntry(entry, *found->second, faults);
        byId.erase(entry.id);
    }
    for (const auto& [id, entry] : byId)
        faults.push_back(id + " is no text of the clock");
}

std::vector<std::string> languagesOf(const fs::path& root) {
    std::vector<std::string> languages;
    for (const auto& file : filesOf(root))
        if (file.starts_with("po/") && file.ends_with(".po") && file != "po/en.po")
            languages.push_back(fs::path(file).stem());
    return languages;
}

std::string headerOf(const Reader& catalogue) {
    const bool hasHeader = !catalogue.entries.empty() && catalogue.entries.front().id.empty();
    return hasHeader ? catalogue.entries.front().text : "";
}

/** What was copied and not translated. A text of conversions alone has nothing to translate. */
void checkWords(const std::string& language, const std::vector<Entry>& english,
                const std::vector<Entry>& entries, Faults& faults) {
    std::map<std::string, std::string> words;
    for (const Entry& entry : english)
        words[entry.id] = entry.text;
    const auto shared = SHARED.find(language);
    for (const Entry& entry : entries) {
        const bool isShared = shared != SHARED.end() &&
                              std::ranges::find(shared->second, entry.id) != shared->second.end();
        if (!entry.id.empty() && !isShared && !entry.text.empty() && words[entry.id] == entry.text)
            faults.push_back(entry.id + " is English");
    }
}

/** What is wrong with the catalogues of a tree. */
Faults catalogueFaults(const fs::path& root) {
    const Reader english(contentsOf(root / "po/en.po"));
    Faults all = english.faults;
    checkHeader("en", headerOf(english), all);
    for (const auto& language : languagesOf(root)) {
        const Reader reader(contentsOf(root / "po" / (language + ".po")));
        Faults faults = reader.faults;
        checkHeader(language, headerOf(reader), faults);
        checkEntries(english.entries, reader.entries, faults);
        checkWords(language, english.entries, reader.entries, faults);
        for (const auto& fault : faults)
            all.push_back(std::string(language).append(": ").append(fault));
    }
    return all;
}

/** A small tree of an English catalogue and one of another language. */
class LanguagesTest : public testing::Test {
protected:
    static std::string header(const std::string& language) {
        return "msgid \"\"\nmsgstr \"\"\n"
               "\"Project-Id-Version: a\\n\"\n\"PO-Revision-Date: b\\n\"\n"
               "\"Last-Translator: c\\n\"\n\"Language-Team: d\\n\"\n\"Language: " +
               language +
               "\\n\"\n\"MIME-Version: 1.0\\n\"\n"
               "\"Content-Type: text/plain; charset=UTF-8\\n\"\n"
               "\"Content-Transfer-Encoding: 8bit\\n\"\n"
               "\"Plural-Forms: nplurals=2; plural=(n != 1);\\n\"\n";
    }
    static std::string entry(const std::string& id, const std::string& text) {
        return "\nmsgid \"" + id + "\"\nmsgstr \"" + text + "\"\n";
    }
    static const std::string GOOD;

    Faults faultsOf(const std::string& entries) { return faultsOf(header("xx"), entries); }
    Faults faultsOf(const std::string& head, const std::string& entries) {
        _tree.plant("po/en.po", header("en") + entry("IDS_A", "A") + "\n# Says it." +
                                    entry("IDS_N", "%1$d of %2$s"));
        _tree.plant("po/xx.po", head + entries);
        return catalogueFaults(_tree.root());
    }

private:
    PlantedTree _tree;
};

const std::string LanguagesTest::GOOD = entry("IDS_A", "Ä") + "\n# Says it.";

} // namespace

TEST(Languages, HaveEveryTextInItsForm) {
    EXPECT_THAT(catalogueFaults(CLOCK_SOURCE_DIR), IsEmpty());
}

TEST(Languages, AreThoseOfTheClock) {
    EXPECT_THAT(languagesOf(CLOCK_SOURCE_DIR),
                testing::IsSupersetOf({"ar", "de", "es", "fr", "hi", "it", "ja", "ko", "pl",
                                       "pt_BR", "ru", "tr", "zh_CN"}));
}

TEST_F(LanguagesTest, ACatalogueThatIsRightHasNoFaults) {
    EXPECT_THAT(faultsOf(GOOD + entry("IDS_N", "%2$s: %1$d, 5%%")), IsEmpty());
    EXPECT_THAT(faultsOf(GOOD + entry("IDS_N", "%i\"\n\" %s")), IsEmpty());
}

TEST_F(LanguagesTest, MissingAndStrangeAndRepeatedTextsAreFound) {
    EXPECT_THAT(faultsOf("\n# Says it." + entry("IDS_N", "%d %s")),
                ElementsAre("xx: IDS_A is missing"));
    EXPECT_THAT(faultsOf(GOOD + entry("IDS_N", "%d %s") + entry("IDS_Z", "z")),
                ElementsAre("xx: IDS_Z is no text of the clock"));
    EXPECT_THAT(faultsOf(GOOD + entry("IDS_N", "%d %s") + entry("IDS_A", "z")),
                ElementsAre("xx: IDS_A is there twice"));
    EXPECT_THAT(faultsOf("", ""), testing::Contains("xx: IDS_A is missing"));
}

TEST_F(LanguagesTest, EmptyTextsAndIdentifiersAreFound) {
    const std::string rest = "\n# Says it." + entry("IDS_N", "%d %s");
    EXPECT_THAT(faultsOf(entry("IDS_A", "") + rest), ElementsAre("xx: IDS_A is empty"));
    EXPECT_THAT(faultsOf(entry("IDS_A", "IDS_A") + rest),
                ElementsAre("xx: IDS_A is an identifier"));
}

TEST_F(LanguagesTest, TextsThatWereNotTranslatedAreFound) {
    EXPECT_THAT(faultsOf(entry("IDS_A", "A") + "\n# Says it." + entry("IDS_N", "%d %s")),
                ElementsAre("xx: IDS_A is English"));
}

TEST_F(LanguagesTest, OtherConversionsAreFound) {
    for (const char* text :
         {"%d", "%d %d", "%s %d", "%d %s %s", "%1$s %2$d", "%1$d %1$s", "%1$d %s", "%d %s %",
          "%d %s 5%", "%d %*s", "%d %f", "%ld %s", "%2$d %3$s", "%%d %s", "of"})
        EXPECT_THAT(faultsOf(GOOD + entry("IDS_N", text)),
                    ElementsAre(std::string("xx: IDS_N has other conversions: ") + text));
}

TEST_F(LanguagesTest, LostCommentsAreFound) {
    EXPECT_THAT(faultsOf(entry("IDS_A", "a") + entry("IDS_N", "%d %s")),
                ElementsAre("xx: IDS_N has other comments"));
}

TEST_F(LanguagesTest, EntriesThatCannotBeReadAreFound) {
    const std::string last = entry("IDS_N", "%d %s");
    EXPECT_THAT(faultsOf(GOOD + last + "msgtext \"a\"\n"),
                ElementsAre("xx: cannot be read: msgtext \"a\""));
    EXPECT_THAT(faultsOf(GOOD + last + "\n\"a\" b\n"), ElementsAre("xx: cannot be read: \"a\" b"));
    EXPECT_THAT(faultsOf(GOOD + last + "msgstr \"a\"\n"),
                ElementsAre("xx: cannot be read: msgstr \"a\""));
    EXPECT_THAT(faultsOf(GOOD + last + "\n#, fuzzy\n"),
                ElementsAre("xx: cannot be read: #, fuzzy"));
    EXPECT_THAT(faultsOf(GOOD + last + "\nmsgid \"IDS_Z\"\n"),
                testing::Contains("xx: an entry without an end: IDS_Z"));
}

TEST_F(LanguagesTest, AHeaderThatLacksSomethingIsFound) {
    const std::string entries = GOOD + entry("IDS_N", "%d %s");
    for (const char* field : HEADER_FIELDS) {
        const std::regex line(std::string("\"") + field + ": [^\n]*\n");
        EXPECT_THAT(faultsOf(std::regex_replace(header("xx"), line, ""), entries),
                    testing::Contains(std::string("xx: no header field ") + field));
    }
    EXPECT_THAT(faultsOf(header("de"), entries), ElementsAre("xx: is of the language de"));
    const std::string latin = std::regex_replace(header("xx"), std::regex("UTF-8"), "ISO-8859-1");
    EXPECT_THAT(faultsOf(latin, entries), ElementsAre("xx: is not in UTF-8"));
    const std::string plural = std::regex_replace(header("xx"), std::regex("nplurals=2"), "n");
    EXPECT_THAT(faultsOf(plural, entries), ElementsAre(HasSubstr("xx: no rule of plurals")));
}

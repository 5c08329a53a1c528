// The screens in every language that the clock has a catalogue for.

#include <algorithm>
#include <array>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <map>
#include <memory>
#include <numeric>
#include <set>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include <Elementary.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <libintl.h>
#include <unicode/plurrule.h>
#include <unicode/unistr.h>
#include <unicode/ures.h>

#include <clock/ClockStringUtil.h>
#include <clock/ClockText.h>
#include <clock/ClockWorldClockDbModel.h>

#include "screens/CityPickerFixture.h"
#include "screens/EditorFixture.h"
#include "screens/TestCatalogue.h"
#include "support/LiveLanguage.h"
#include "support/TextFaults.h"

namespace fs = std::filesystem;

using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

namespace {

constexpr const char* HOURS_KEY = "db/menu_widget/regionformat_time1224";

std::string nameOf(const testing::TestParamInfo<std::string>& language) {
    return language.param;
}

/** The editor and what opens over it. */
class EditorLanguageTest : public EditorFixture, public testing::WithParamInterface<std::string> {
protected:
    void speak(const std::string& language) {
        _language = std::make_unique<LiveLanguage>();
        _language->choose(language);
    }
    void TearDown() override {
        EditorFixture::TearDown();
        _language.reset();
    }

    /** The faults of the face at every row of the list. */
    std::set<std::string> faults() {
        std::set<std::string> all;
        for (Elm_Object_Item* row = elm_genlist_first_item_get(genlist()); row;
             row = elm_genlist_item_next_get(row)) {
            stage().showRow(row);
            stage().settle();
            all.merge(faultsNow());
        }
        return all;
    }
    std::set<std::string> faultsNow() {
        const auto found = faultsOf(stage().texts());
        return {found.begin(), found.end()};
    }
    void take(const std::string& name) { stage().screenshot("language-" + GetParam() + name); }

private:
    std::unique_ptr<LiveLanguage> _language;
};

TEST_P(EditorLanguageTest, EveryRowIsTranslatedAndFits) {
    speak(GetParam());
    device().setSetting(HOURS_KEY, 1);
    createAlarm();
    take("-editor");
    for (const char* id : {"IDS_COM_BODY_CREATE", "IDS_TPLATFORM_ACBUTTON_CANCEL_ABB",
                           "IDS_TPLATFORM_ACBUTTON_DONE_ABB"})
        EXPECT_TRUE(stage().shows(clockText(id))) << id;
    EXPECT_THAT(faults(), IsEmpty());
    take("-name");
}

TEST_P(EditorLanguageTest, AnAlarmWithADateIsTranslatedAndFits) {
    speak(GetParam());
    auto alarm = storedAlarm(7, 30);
    alarm.repeatWeekly = 0;
    alarm.autoDate = alarm.manualDate = static_cast<std::int32_t>(at("2026-11-19 00:00:00"));
    editAlarm(alarm);
    take("-date");
    EXPECT_TRUE(stage().shows(clockText("IDS_COM_SK_EDIT")));
    EXPECT_THAT(faultsNow(), IsEmpty());
}

TEST_P(EditorLanguageTest, TheQuestionBeforeDiscardingIsTranslatedAndFits) {
    speak(GetParam());
    createAlarm();
    pick(7, 30);
    stage().backKey();
    stage().settle();
    take("-discard");
    EXPECT_TRUE(stage().shows(clockText("IDS_CLD_HEADER_DISCARD_CHANGES_ABB")));
    EXPECT_TRUE(stage().shows(clockText("IDS_CLD_BUTTON_DISCARD_ABB")));
    EXPECT_THAT(faultsNow(), IsEmpty());
}

TEST_P(EditorLanguageTest, TheRepeatScreenIsTranslatedAndFits) {
    speak(GetParam());
    createAlarm();
    stage().tapRow(elm_genlist_nth_item_get(genlist(), 1));
    stage().settle();
    take("-repeat");
    EXPECT_TRUE(stage().shows(clockText("IDS_ALM_BODY_EVERYDAY")));
    EXPECT_THAT(faultsNow(), IsEmpty());
    for (Evas_Object* list : stage().widgets("Elm_Genlist"))
        stage().showRow(elm_genlist_last_item_get(list));
    EXPECT_TRUE(stage().shows(clockText("IDS_ALM_BODY_EVERY_SATURDAY")));
    EXPECT_THAT(faultsNow(), IsEmpty());
    stage().backKey();
    stage().settle();
}

TEST_P(EditorLanguageTest, TheTypePopupIsTranslatedAndFits) {
    speak(GetParam());
    createAlarm();
    stage().tapRow(elm_genlist_nth_item_get(genlist(), 2));
    stage().settle();
    take("-type");
    EXPECT_TRUE(stage().shows(clockText("IDS_ALM_BODY_TYPE")));
    EXPECT_THAT(faultsNow(), IsEmpty());
    stage().backKey();
    stage().settle();
}

TEST_P(EditorLanguageTest, TheDatePopupIsTranslatedAndFits) {
    speak(GetParam());
    createAlarm();
    stage().tap(timePickerRow().getCalendarObj());
    stage().settle();
    take("-set-date");
    EXPECT_TRUE(stage().shows(clockText("IDS_COM_SK_SET")));
    EXPECT_TRUE(stage().shows(clockText("IDS_COM_SK_CANCEL")));
    EXPECT_THAT(faultsNow(), IsEmpty());
    stage().backKey();
    stage().settle();
}

INSTANTIATE_TEST_SUITE_P(Language, EditorLanguageTest, testing::ValuesIn(catalogueLanguages()),
                         nameOf);

class LanguageFaultTest : public EditorFixture {};

TEST_F(LanguageFaultTest, ATextThatIsCutIsFound) {
    const TestCatalogue catalogue(
        {{"IDS_TPLATFORM_ACBUTTON_DONE_ABB", "Completed and done with"},
         {"IDS_COM_BODY_CREATE", "Create another alarm for a certain day"}});
    createAlarm();
    const auto faults = faultsOf(stage().texts());
    EXPECT_THAT(faults, testing::Contains("Completed and done with is cut"));
    EXPECT_THAT(faults, testing::Contains("Create another alarm for a certain day is cut"));
}

TEST_F(LanguageFaultTest, ATextWithoutATranslationIsFound) {
    const TestCatalogue catalogue({{"IDS_TPLATFORM_ACBUTTON_DONE_ABB", "Done"}});
    createAlarm();
    const auto faults = faultsOf(stage().texts());
    EXPECT_THAT(faults, testing::Contains("IDS_COM_BODY_CREATE has no translation"));
    EXPECT_THAT(faults, testing::Each(Not(HasSubstr("Done"))));
}

/** What a toast says of the time until an alarm rings. */
std::string toast(const char* language, int days, int hours, int minutes) {
    const CatalogueLanguage catalogue(language);
    std::string text;
    ClockStringUtil::generateAlertOffsetToastPopupText(days, hours, minutes, text);
    return text;
}

class SpanTest : public ScreenTest {};

TEST_F(SpanTest, CountsHaveTheFormsOfTheirLanguage) {
    EXPECT_EQ(toast("de", 1, 1, 0), "Noch 1 Tag, 1 Stunde bis zum Wecken.");
    EXPECT_EQ(toast("de", 2, 0, 5), "Noch 2 Tage, 5 Minuten bis zum Wecken.");
    EXPECT_EQ(toast("pl", 0, 1, 1), "Czas do alarmu: 1 godzina i 1 minuta.");
    EXPECT_EQ(toast("pl", 0, 2, 5), "Czas do alarmu: 2 godziny i 5 minut.");
    EXPECT_EQ(toast("ru", 1, 1, 1), "До сигнала: 1 день 1 час 1 минута.");
    EXPECT_EQ(toast("ru", 3, 2, 21), "До сигнала: 3 дня 2 часа 21 минута.");
    EXPECT_EQ(toast("ru", 5, 5, 11), "До сигнала: 5 дней 5 часов 11 минут.");
    EXPECT_EQ(toast("ar", 0, 1, 2), "الوقت المتبقي للمنبّه: ساعة ودقيقتان.");
    EXPECT_EQ(toast("tr", 1, 1, 2), "Alarm 1 gün 1 saat 2 dakika sonra çalacak.");
    EXPECT_EQ(toast("zh_CN", 1, 1, 2), "闹钟将在1天1小时2分钟后响起。");
}

constexpr std::array COUNTS = {1, 2, 3, 5, 11, 21, 100};

/** "few", "other" and so on. */
std::string pluralForm(const std::string& language, int count) {
    UErrorCode status = U_ZERO_ERROR;
    const std::unique_ptr<icu::PluralRules> rules(
        icu::PluralRules::forLocale(icu::Locale(language.c_str()), status));
    std::string form;
    if (U_SUCCESS(status))
        rules->select(count).toUTF8String(form);
    return form;
}

/** How a count of days is written, "{0} days", in the language's own table. */
std::string daysPattern(const std::string& language, const std::string& form) {
    using Bundle = std::unique_ptr<UResourceBundle, decltype(&ures_close)>;
    UErrorCode status = U_ZERO_ERROR;
    Bundle bundle(ures_open(U_ICUDATA_NAME "-unit", language.c_str(), &status), &ures_close);
    for (const char* key : {"units", "duration", "day"})
        bundle.reset(ures_getByKey(bundle.get(), key, nullptr, &status));
    int32_t length = 0;
    const UChar* text = ures_getStringByKey(bundle.get(), form.c_str(), &length, &status);
    std::string pattern;
    if (U_SUCCESS(status))
        icu::UnicodeString(text, length).toUTF8String(pattern);
    return pattern;
}

class PluralTest : public ScreenTest, public testing::WithParamInterface<std::string> {};

TEST_P(PluralTest, TheToastCountsAsTheLanguageDoes) {
    for (const int count : COUNTS) {
        const std::string text = toast(GetParam().c_str(), count, 0, 0);
        std::string pattern = daysPattern(GetParam(), pluralForm(GetParam(), count));
        ASSERT_NE(pattern, "") << GetParam() << ' ' << count;
        if (const auto place = pattern.find("{0}"); place != std::string::npos)
            pattern.replace(place, 3, std::to_string(count));
        EXPECT_THAT(text, HasSubstr(pattern)) << count;
        EXPECT_THAT(text, Not(HasSubstr("IDS_")));
    }
}

INSTANTIATE_TEST_SUITE_P(Language, PluralTest, testing::ValuesIn(catalogueLanguages()), nameOf);

/** Counts as the rule of a catalogue's header does: the number of the form. */
class CountingCatalogue {
public:
    explicit CountingCatalogue(const std::string& language) {
        _folder = fs::temp_directory_path() / "plural-XXXXXX";
        if (!mkdtemp(_folder.data()))
            ADD_FAILURE() << "no temporary folder";
        const std::string messages = _folder + "/" + language + "/LC_MESSAGES";
        fs::create_directories(messages);
        const std::string source = _folder + "/plural.po";
        std::ofstream(source) << withForms(CLOCK_SOURCE_DIR "/po/" + language + ".po");
        const std::string compile = "msgfmt -o " + messages + "/plural.mo " + source;
        EXPECT_EQ(std::system(compile.c_str()), 0) << language;
        setenv("LANGUAGE", language.c_str(), 1);
        bindtextdomain("plural", _folder.c_str());
        textdomain("clock");
    }
    ~CountingCatalogue() {
        setenv("LANGUAGE", "en", 1);
        textdomain("clock");
        std::error_code ignored;
        fs::remove_all(_folder, ignored);
    }
    CountingCatalogue(const CountingCatalogue&) = delete;
    CountingCatalogue& operator=(const CountingCatalogue&) = delete;

    static std::string form(int count) {
        return dngettext("plural", "one", "many", static_cast<unsigned long>(count));
    }

private:
    /** The header alone, and one text that says which form it has. */
    static std::string withForms(const std::string& catalogue) {
        std::ifstream file(catalogue);
        std::string header;
        for (std::string line; std::getline(file, line) && !line.empty();)
            header += line + "\n";
        int forms = 0;
        std::sscanf(header.c_str() + header.find("nplurals="), "nplurals=%d", &forms);
        header += "\nmsgid \"one\"\nmsgid_plural \"many\"\n";
        for (int form = 0; form < forms; ++form)
            header += "msgstr[" + std::to_string(form) + "] \"" + std::to_string(form) + "\"\n";
        return header;
    }

    std::string _folder;
};

TEST_P(PluralTest, TheRuleOfTheCatalogueIsTheLanguages) {
    const CountingCatalogue catalogue(GetParam());
    std::map<std::string, std::string> names;
    std::set<std::string> forms;
    for (int count = 0; count <= 1000; ++count) {
        const std::string form = CountingCatalogue::form(count);
        const std::string name = pluralForm(GetParam(), count);
        EXPECT_EQ(names.emplace(form, name).first->second, name) << count;
        forms.insert(name);
    }
    EXPECT_EQ(names.size(), forms.size());
}

/** The city picker. */
class CitiesLanguageTest : public CityPickerFixture,
                           public testing::WithParamInterface<std::string> {
protected:
    void TearDown() override {
        CityPickerFixture::TearDown();
        _language.reset();
    }

    void open() {
        _language = std::make_unique<LiveLanguage>();
        _language->choose(GetParam());
        worldOf({"IDS_CITY_DE_BERLIN_BERLIN", "IDS_CITY_JP_TOKYO", "IDS_CITY_IN_NEW_DELHI"});
        openPicker();
    }
    std::vector<std::string> faults() { return faultsOf(stage().texts()); }

    /** The cities whose rows say most. */
    static std::vector<std::string> longestCities(std::size_t count) {
        std::vector<ClockWorldClockDbData> all;
        ClockWorldClockDbModel().getWorldClockAllCityList(all);
        const auto length = [](const ClockWorldClockDbData& city) {
            const std::string name = clockText(city.city.c_str());
            return icu::UnicodeString::fromUTF8(name + clockText(city.country.c_str()))
                .countChar32();
        };
        std::ranges::sort(all, std::ranges::greater(), length);
        std::vector<std::string> ids;
        for (std::size_t place = 0; place < std::min(count, all.size()); ++place)
            ids.push_back(all[place].city);
        return ids;
    }
    /** A row of which nothing is scrolled out. */
    std::vector<std::string> faultsAt(Elm_Object_Item* row) {
        stage().showRow(row);
        stage().settle();
        return faults();
    }

    std::unique_ptr<LiveLanguage> _language;
};

TEST_P(CitiesLanguageTest, ThePickerIsTranslatedAndFits) {
    open();
    stage().screenshot("language-" + GetParam() + "-cities");
    EXPECT_TRUE(stage().shows(clockText("IDS_WCL_OPT_ADDCITY")));
    EXPECT_TRUE(stage().shows(clockText("IDS_TPLATFORM_ACBUTTON_CANCEL_ABB")));
    EXPECT_TRUE(std::ranges::any_of(stage().texts(), [](const FoundText& found) {
        return found.text.ends_with(clockText("IDS_COM_BODY_SEARCH"));
    }));
    EXPECT_THAT(faults(), IsEmpty());
}

TEST_P(CitiesLanguageTest, TheWordsThatNothingWasFoundAreTranslatedAndFit) {
    open();
    search("qqxx");
    stage().key("Return");
    stage().settle();
    stage().screenshot("language-" + GetParam() + "-nothing");
    EXPECT_TRUE(stage().shows(clockText("IDS_CLOCK_NPBODY_NO_SEARCH_RESULTS")));
    EXPECT_THAT(faults(), IsEmpty());
}

TEST_P(CitiesLanguageTest, TheLongestNamesAreWholeOnTwoLines) {
    _language = std::make_unique<LiveLanguage>();
    _language->choose(GetParam());
    worldOf(longestCities(12));
    openPicker();
    for (Elm_Object_Item* row : items())
        EXPECT_THAT(faultsAt(row), IsEmpty()) << markupOf(row, "elm.text.main.left.top");
    stage().showRow(items().at(5));
    stage().screenshot("language-" + GetParam() + "-long-cities");
}

INSTANTIATE_TEST_SUITE_P(Language, CitiesLanguageTest, testing::ValuesIn(catalogueLanguages()),
                         nameOf);

/** First and last of some characters. */
using Range = std::pair<Eina_Unicode, Eina_Unicode>;

/** What the fonts of this machine can draw between them. */
std::vector<Range> drawable() {
    FILE* const list = popen("fc-list --format '%{charset}\n'", "r");
    std::vector<Range> ranges;
    for (char word[64]; list && std::fscanf(list, "%63s", word) == 1;) {
        unsigned first = 0;
        unsigned last = 0;
        const int count = std::sscanf(word, "%x-%x", &first, &last);
        if (count > 0)
            ranges.emplace_back(first, count == 2 ? last : first);
    }
    if (list)
        pclose(list);
    return ranges;
}

/** The characters of a text that no font has. */
std::string undrawable(const std::string& text) {
    static const auto ranges = drawable();
    std::set<std::string> missing;
    for (int next = 0, start = 0; start < static_cast<int>(text.size()); start = next) {
        const Eina_Unicode character = eina_unicode_utf8_next_get(text.c_str(), &next);
        const bool isDrawable = std::ranges::any_of(ranges, [&](const Range& range) {
            return character >= range.first && character <= range.second;
        });
        if (!isDrawable && character != '\n')
            missing.insert(text.substr(static_cast<std::size_t>(start),
                                       static_cast<std::size_t>(next - start)));
    }
    return std::accumulate(missing.begin(), missing.end(), std::string());
}

class FontTest : public testing::TestWithParam<std::string> {};

TEST_P(FontTest, EveryCharacterCanBeDrawn) {
    std::ifstream file(CLOCK_SOURCE_DIR "/po/" + GetParam() + ".po");
    const std::string texts(std::istreambuf_iterator<char>(file), {});
    ASSERT_NE(texts, "");
    EXPECT_EQ(undrawable(texts), "") << "install what scripts/packages.txt names";
}

INSTANTIATE_TEST_SUITE_P(Language, FontTest, testing::ValuesIn(catalogueLanguages()), nameOf);

TEST(FontFaultTest, ACharacterThatNoFontHasIsFound) {
    EXPECT_EQ(undrawable("a\xf4\x80\x80\x81z"), "\xf4\x80\x80\x81");
}

} // namespace

/**
 * @file
 * @brief Another language is chosen while a screen is open: it then reads as if it had been opened
 * so.
 */
#pragma once

#include <functional>
#include <optional>
#include <ostream>
#include <string>
#include <vector>

#include <Elementary.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "support/LiveLanguage.h"
#include "support/ScreenReader.h"
#include "support/Stage.h"

struct LanguageChange {
    const char* name;
    const char* from;
    const char* to;
};

inline void PrintTo(const LanguageChange& change, std::ostream* out) {
    *out << change.name;
}

/** To another language, and to one that is read from the other side. */
inline auto languageChanges() {
    return testing::Values(LanguageChange{"EnglishToGerman", "en", "de"},
                           LanguageChange{"GermanToArabic", "de", "ar"});
}

/** A screen test whose screens a screen reader reads. */
template <class Fixture>
class ReadingSwitch : public Fixture, public testing::WithParamInterface<LanguageChange> {
protected:
    void SetUp() override {
        Fixture::SetUp();
        _language.emplace();
    }
    void TearDown() override {
        // What the screens tell of themselves is their own affair.
        this->takeStageDown();
        this->takeErrors();
        Fixture::TearDown();
        _language.reset();
    }
    /** @param open Opens the screen on a new face. */
    void expectTheSame(const std::function<void()>& open) {
        _language->choose(change().to);
        const auto wanted = opened(open);
        this->takeStageDown();
        _language->choose(change().from);
        EXPECT_NE(opened(open), wanted);
        _language->choose(change().to);
        this->stage().settle();
        EXPECT_THAT(read(), testing::UnorderedElementsAreArray(wanted));
        EXPECT_THAT(wanted, testing::Not(testing::IsEmpty()));
    }
    LiveLanguage& language() { return *_language; }
    /** Roles and names: the state of a row is known once it has been drawn. */
    std::vector<std::string> read() {
        std::vector<std::string> names;
        for (const ReadThing& thing : ScreenReader::things(nearest()))
            names.push_back(thing.role + " | " + thing.name);
        return names;
    }

private:
    static const LanguageChange& change() {
        return testing::WithParamInterface<LanguageChange>::GetParam();
    }
    std::vector<std::string> opened(const std::function<void()>& open) {
        open();
        this->stage().settle();
        return read();
    }
    /** The popup on top, or else the page with its title's buttons. */
    Evas_Object* nearest() {
        const auto popups = this->stage().widgets("Popup");
        if (!popups.empty())
            return popups.back();
        Evas_Object* const pages = this->stage().widgets("Naviframe").back();
        Elm_Object_Item* const top = elm_naviframe_top_item_get(pages);
        return elm_object_parent_widget_get(elm_object_item_content_get(top));
    }

    ScreenReader _reader;
    std::optional<LiveLanguage> _language;
};

#include <cstdlib>
#include <memory>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "AlarmNameItem.h"
#include "screens/RowPage.h"
#include "screens/TestCatalogue.h"
#include "support/ScreenTest.h"

using testing::Contains;
using testing::Each;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

namespace {

constexpr const char* TOO_LONG = "IDS_CLOCK_TPOP_CANT_SAVE_MORE_THAN_PD_CHARACTERS";
constexpr const char* NO_FOCUS = "Focus is not set for entry !!";

class NameRowTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        alarm.name = "Gym";
    }

    void TearDown() override {
        takeStageDown();
        for (const std::string& line : takeErrors())
            EXPECT_TRUE(line == NO_FOCUS || line == "Alarm Name is NULL !!") << line;
        ScreenTest::TearDown();
    }

    void show() {
        row = new AlarmNameItem(alarm);
        page = new RowPage(row);
        stage().push(page);
    }

    /** Shows the row, taps the field and puts the cursor at its end. */
    void showForTyping() {
        show();
        stage().tap(entry());
        stage().settle();
        stage().key("End");
        takeErrors();
    }

    Evas_Object* entry() const { return row->getNameEntryObj(); }

    std::string text() const {
        const std::unique_ptr<char, decltype(&std::free)> utf8(
            elm_entry_markup_to_utf8(elm_entry_entry_get(entry())), &std::free);
        return utf8.get();
    }

    bool clearsSelectionOnBack() const { return evas_object_data_get(entry(), "eext_entry"); }

    ClockAlarmDbData alarm{};
    AlarmNameItem* row = nullptr;
    RowPage* page = nullptr;
};

TEST_F(NameRowTest, ShowsItsTitleAndTheName) {
    show();
    EXPECT_TRUE(stage().shows("Alarm name"));
    EXPECT_TRUE(stage().shows("Gym"));
    EXPECT_FALSE(stage().shows("Alarm"));
}

TEST_F(NameRowTest, AnEmptyNameShowsTheGuideAndIsLogged) {
    alarm.name = "";
    show();
    EXPECT_TRUE(stage().shows("Alarm"));
    EXPECT_EQ(text(), "");
    EXPECT_THAT(takeErrors(), Contains("Alarm Name is NULL !!"));
}

TEST_F(NameRowTest, TheGuideFollowsTheLanguage) {
    alarm.name = "";
    show();
    const TestCatalogue german{{"IDS_COM_BODY_ALARM", "Wecker"}};
    stage().settle();
    EXPECT_TRUE(stage().shows("Wecker"));
}

TEST_F(NameRowTest, MarkupCharactersAreShownAsTheyAre) {
    alarm.name = "<b>Tom & Jerry</b>";
    show();
    EXPECT_EQ(text(), "<b>Tom & Jerry</b>");
    EXPECT_EQ(row->getTypedName(), "<b>Tom & Jerry</b>");
}

TEST_F(NameRowTest, AStoredNameThatIsTooLongIsShownWhole) {
    alarm.name = "A name of twenty-five letters";
    show();
    EXPECT_EQ(text(), alarm.name);
    EXPECT_THAT(device().toasts(), IsEmpty());
}

TEST_F(NameRowTest, TypingDoesNotTouchTheRecord) {
    showForTyping();
    stage().type(" & run");
    EXPECT_EQ(text(), "Gym & run");
    EXPECT_EQ(row->getTypedName(), "Gym & run");
    EXPECT_EQ(alarm.name, "Gym");
    EXPECT_THAT(takeErrors(), IsEmpty());
}

TEST_F(NameRowTest, TheTwentyFirstCharacterIsRefusedWithAToast) {
    alarm.name = "";
    showForTyping();
    stage().type("12345678901234567890");
    EXPECT_EQ(text(), "12345678901234567890");
    EXPECT_THAT(device().toasts(), IsEmpty());
    stage().type("x");
    EXPECT_EQ(text(), "12345678901234567890");
    EXPECT_THAT(device().toasts(), ElementsAre("Names have at most 20 characters."));
}

TEST_F(NameRowTest, CharactersAreCountedNotBytes) {
    alarm.name = "";
    showForTyping();
    stage().type("가나다라마바사아자차가나다라마바사아자차");
    EXPECT_EQ(text(), "가나다라마바사아자차가나다라마바사아자차");
    stage().type("카");
    EXPECT_EQ(text(), "가나다라마바사아자차가나다라마바사아자차");
    EXPECT_EQ(device().toasts().size(), 1U);
}

TEST_F(NameRowTest, AHostileTranslationOfTheToastIsShownAsItIs) {
    show();
    const TestCatalogue hostile{{TOO_LONG, "%s%n%d"}};
    AlarmNameItem::_alarmNameMaxLengthCb(row, entry(), nullptr);
    EXPECT_THAT(device().toasts(), ElementsAre("%s%n%d"));
}

TEST_F(NameRowTest, ALongTranslationOfTheToastIsCut) {
    show();
    const TestCatalogue wordy{{TOO_LONG, "%d " + std::string(3000, 'x')}};
    AlarmNameItem::_alarmNameMaxLengthCb(row, entry(), nullptr);
    ASSERT_EQ(device().toasts().size(), 1U);
    EXPECT_EQ(device().toasts()[0].size(), 1023U);
}

TEST_F(NameRowTest, TheFieldTakesOneLineOfPlainTextAndOffersDone) {
    show();
    EXPECT_THAT(device().callsTo("ea_editfield_add"), Each(HasSubstr("EA_EDITFIELD_SINGLELINE")));
    EXPECT_TRUE(elm_entry_single_line_get(entry()));
    EXPECT_EQ(elm_entry_cnp_mode_get(entry()), ELM_CNP_MODE_PLAINTEXT);
    EXPECT_EQ(elm_entry_input_panel_return_key_type_get(entry()),
              ELM_INPUT_PANEL_RETURN_KEY_TYPE_DONE);
    EXPECT_FALSE(evas_object_propagate_events_get(entry()));
}

TEST_F(NameRowTest, DoneOnTheKeyboardTakesTheFocusAway) {
    showForTyping();
    ASSERT_TRUE(elm_object_focus_get(entry()));
    stage().key("Return");
    stage().settle();
    EXPECT_FALSE(elm_object_focus_get(entry()));
    EXPECT_EQ(text(), "Gym");
}

TEST_F(NameRowTest, AChangeWithoutFocusIsLogged) {
    show();
    takeErrors();
    elm_entry_entry_set(entry(), "Other");
    Stage::frames(3);
    EXPECT_THAT(takeErrors(), Contains(NO_FOCUS));
    evas_object_smart_callback_call(entry(), "preedit,changed", nullptr);
    expectLog(NO_FOCUS);
}

TEST_F(NameRowTest, AChangeWithFocusIsNotLogged) {
    showForTyping();
    stage().type("a");
    evas_object_smart_callback_call(entry(), "preedit,changed", nullptr);
    EXPECT_THAT(takeErrors(), IsEmpty());
}

// Selection and the back key.

TEST_F(NameRowTest, WithASelectionTheBackKeyClearsItAndOnlyThat) {
    showForTyping();
    elm_entry_select_all(entry());
    Stage::frames(3);
    ASSERT_NE(elm_entry_selection_get(entry()), nullptr);
    EXPECT_TRUE(clearsSelectionOnBack());
    stage().backKey();
    stage().settle();
    EXPECT_EQ(elm_entry_selection_get(entry()), nullptr);
    EXPECT_FALSE(clearsSelectionOnBack());
    EXPECT_TRUE(stage().shows("Alarm name"));
    EXPECT_EQ(text(), "Gym");
}

TEST_F(NameRowTest, TheSecondBackKeyIsThePagesOwn) {
    showForTyping();
    const auto alive = page->getWeakPtr();
    elm_entry_select_all(entry());
    Stage::frames(3);
    stage().backKey();
    stage().settle();
    EXPECT_TRUE(alive);
    stage().backKey();
    stage().settle();
    EXPECT_FALSE(alive);
}

TEST_F(NameRowTest, ASelectionThatWentByItselfLeavesTheBackKeyAlone) {
    showForTyping();
    const auto alive = page->getWeakPtr();
    elm_entry_select_all(entry());
    Stage::frames(3);
    ASSERT_TRUE(clearsSelectionOnBack());
    elm_entry_select_none(entry());
    Stage::frames(3);
    EXPECT_FALSE(clearsSelectionOnBack());
    stage().backKey();
    stage().settle();
    EXPECT_FALSE(alive);
}

TEST_F(NameRowTest, SelectingTwiceListensToTheBackKeyOnce) {
    showForTyping();
    device().clearCalls();
    evas_object_smart_callback_call(entry(), "selection,start", nullptr);
    evas_object_smart_callback_call(entry(), "selection,start", nullptr);
    EXPECT_EQ(device().callsTo("eext_object_event_callback_add").size(), 1U);
    evas_object_smart_callback_call(entry(), "selection,cleared", nullptr);
    evas_object_smart_callback_call(entry(), "selection,cleared", nullptr);
    EXPECT_EQ(device().callsTo("eext_object_event_callback_del").size(), 1U);
}

// Content that comes and goes.

TEST_F(NameRowTest, TheFieldAndWhatWasTypedOutliveAnUpdateOfTheRow) {
    showForTyping();
    stage().type(" & <run>");
    Evas_Object* before = entry();
    elm_genlist_item_update(page->item());
    stage().settle();
    EXPECT_EQ(entry(), before);
    EXPECT_EQ(text(), "Gym & <run>");
    EXPECT_TRUE(stage().canBeSeen(entry()));
}

TEST_F(NameRowTest, AnEmptiedFieldStaysEmptyAfterAnUpdate) {
    showForTyping();
    for (int i = 0; i < 3; ++i)
        stage().key("BackSpace");
    ASSERT_EQ(text(), "");
    elm_genlist_item_update(page->item());
    stage().settle();
    EXPECT_EQ(text(), "");
    EXPECT_EQ(row->getTypedName(), "");
}

TEST_F(NameRowTest, WhatWasTypedOutlivesTheField) {
    showForTyping();
    stage().type("!");
    elm_genlist_item_all_contents_unset(page->item(), nullptr);
    while (entry())
        evas_object_del(entry());
    EXPECT_EQ(entry(), nullptr);
    EXPECT_EQ(row->getTypedName(), "Gym!");
}

TEST_F(NameRowTest, BeforeThereIsAFieldTheRecordsNameCounts) {
    const AlarmNameItem item(alarm);
    EXPECT_EQ(item.getNameEntryObj(), nullptr);
    EXPECT_EQ(item.getTypedName(), "Gym");
}

TEST_F(NameRowTest, AFieldThatOutlivesTheRowNoLongerCallsIt) {
    auto* lonely = new AlarmNameItem(alarm);
    Evas_Object* field =
        AlarmNameItem::_getNameItemIcon(lonely, stage().window(), "elm.icon.entry");
    delete lonely;
    for (const char* signal : {"focused", "activated", "changed", "preedit,changed",
                               "maxlength,reached", "language,changed"})
        evas_object_smart_callback_call(field, signal, nullptr);
    evas_object_del(field);
    EXPECT_THAT(device().toasts(), IsEmpty());
}

TEST_F(NameRowTest, WithoutAFieldTheRowStandsAndSaysSo) {
    device().fail("ea_editfield_add");
    show();
    EXPECT_EQ(entry(), nullptr);
    EXPECT_THAT(takeErrors(), Each("Entry is NULL !!"));
    EXPECT_EQ(row->getTypedName(), "Gym");
}

TEST_F(NameRowTest, SelectingTheRowCallsItsOwner) {
    int calls = 0;
    AlarmNameItem item(alarm);
    item.onSelect(nullptr);
    item.setSelectedCb([&] { ++calls; });
    item.onSelect(nullptr);
    EXPECT_EQ(calls, 1);
}

TEST_F(NameRowTest, OtherPartsAreEmpty) {
    show();
    EXPECT_EQ(AlarmNameItem::_getNameItemText(row, page->genlist(), "elm.text.sub"), nullptr);
    EXPECT_EQ(AlarmNameItem::_getNameItemText(row, page->genlist(), nullptr), nullptr);
    EXPECT_EQ(AlarmNameItem::_getNameItemIcon(row, page->genlist(), "elm.icon"), nullptr);
    EXPECT_EQ(AlarmNameItem::_getNameItemIcon(row, page->genlist(), nullptr), nullptr);
}

TEST_F(NameRowTest, TheItemClassIsThatOfAnEntryRow) {
    AlarmNameItem item(alarm);
    Elm_Genlist_Item_Class* itemClass = item.getItemClassNew();
    EXPECT_STREQ(itemClass->item_style, "entry.main");
    EXPECT_EQ(itemClass->decorate_item_style, nullptr);
    elm_genlist_item_class_free(itemClass);
}

TEST_F(NameRowTest, EveryCallbackToleratesMissingData) {
    for (const Evas_Smart_Cb callback :
         {AlarmNameItem::_alarmNameFocusedCb, AlarmNameItem::_alarmNameActivatedCb,
          AlarmNameItem::_alarmNameChangedCb, AlarmNameItem::_alarmNamePreeditChangedCb,
          AlarmNameItem::_alarmNameMaxLengthCb, AlarmNameItem::_entryLangChangedCb}) {
        callback(nullptr, nullptr, nullptr);
        EXPECT_THAT(takeErrors(), ElementsAre("Data is NULL !!"));
    }
    EXPECT_EQ(AlarmNameItem::_getNameItemText(nullptr, nullptr, "elm.text.main"), nullptr);
    EXPECT_EQ(AlarmNameItem::_getNameItemIcon(nullptr, nullptr, "elm.icon.entry"), nullptr);
    EXPECT_THAT(takeErrors(), ElementsAre("Data is NULL !!", "Data is NULL !!"));
    EXPECT_THAT(device().toasts(), IsEmpty());
}

} // namespace

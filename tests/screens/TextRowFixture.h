/**
 * @file
 * @brief One of the editor's rows that show a title and what is chosen.
 */
#pragma once

#include <cstdlib>
#include <memory>
#include <string>
#include <vector>

#include <clock/ClockAlarmDbData.h>

#include "screens/RowPage.h"
#include "support/ScreenTest.h"

template <class RowClass>
class TextRowFixture : public ScreenTest {
protected:
    void show() {
        row = new RowClass(alarm);
        row->setSelectedCb([this] { ++selections; });
        page = new RowPage(row);
        stage().push(page);
    }

    std::vector<std::string> texts() { return Stage::rows(page->genlist()).front().texts; }

    /** What the row answers for a part; "(null)" for nothing. */
    std::string answer(const char* part) {
        const std::unique_ptr<Elm_Genlist_Item_Class, decltype(&elm_genlist_item_class_free)>
            itemClass(row->getItemClassNew(), &elm_genlist_item_class_free);
        const std::unique_ptr<char, decltype(&std::free)> text(
            itemClass->func.text_get(row, page->genlist(), part), &std::free);
        return text ? text.get() : "(null)";
    }

    ClockAlarmDbData alarm{};
    RowClass* row = nullptr;
    RowPage* page = nullptr;
    int selections = 0;
};

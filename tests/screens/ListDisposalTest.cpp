// Old lists, deleted bit by bit.

#include <cstring>
#include <memory>

#include <gtest/gtest.h>

#include "ListDisposal.h"
#include "support/ScreenTest.h"

namespace {

constexpr int MANY = 1000;
constexpr int FEW = 3;

int rowsDeleted = 0;
int listsDeleted = 0;

char* rowText(void*, Evas_Object*, const char*) {
    return strdup("row");
}

void rowDeletedCb(void*, Evas_Object*) {
    ++rowsDeleted;
}

void listDeletedCb(void*, Evas*, Evas_Object*, void*) {
    ++listsDeleted;
}

class ListDisposalTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        rowsDeleted = 0;
        listsDeleted = 0;
    }

    void TearDown() override {
        _disposal.reset();
        ScreenTest::TearDown();
    }

    Evas_Object* addList(int rows, Evas_Object* parent = nullptr) {
        Evas_Object* genlist = elm_genlist_add(parent ? parent : stage().window());
        Elm_Genlist_Item_Class* itemClass = elm_genlist_item_class_new();
        itemClass->item_style = "2line.top";
        itemClass->func.text_get = rowText;
        itemClass->func.del = rowDeletedCb;
        for (int row = 0; row < rows; ++row)
            elm_genlist_item_append(genlist, itemClass, nullptr, nullptr, ELM_GENLIST_ITEM_NONE,
                                    nullptr, nullptr);
        elm_genlist_item_class_free(itemClass);
        evas_object_event_callback_add(genlist, EVAS_CALLBACK_DEL, listDeletedCb, nullptr);
        evas_object_resize(genlist, Stage::SIZE, Stage::SIZE);
        evas_object_show(genlist);
        return genlist;
    }

    std::unique_ptr<ListDisposal> _disposal = std::make_unique<ListDisposal>();
};

TEST_F(ListDisposalTest, AListVanishesAtOnceAndIsDeletedBitByBit) {
    Evas_Object* genlist = addList(MANY);
    Stage::frames(2);
    _disposal->add(genlist);
    EXPECT_FALSE(evas_object_visible_get(genlist));
    EXPECT_EQ(rowsDeleted, 0);
    Stage::frames(6);
    EXPECT_GT(rowsDeleted, 0);
    EXPECT_LT(rowsDeleted, MANY) << "all in one turn";
    Stage::frames(60);
    EXPECT_EQ(rowsDeleted, MANY);
    EXPECT_EQ(listsDeleted, 1);
}

TEST_F(ListDisposalTest, SeveralListsAreDeletedOneAfterTheOther) {
    _disposal->add(addList(MANY));
    Stage::frames(6);
    _disposal->add(addList(FEW));
    _disposal->add(addList(0));
    Stage::frames(60);
    EXPECT_EQ(rowsDeleted, MANY + FEW);
    EXPECT_EQ(listsDeleted, 3);
    _disposal->add(addList(FEW));
    Stage::frames(60);
    EXPECT_EQ(listsDeleted, 4) << "it had come to an end before";
}

TEST_F(ListDisposalTest, NoListIsNoWork) {
    _disposal->add(nullptr);
    Stage::frames(10);
    EXPECT_EQ(listsDeleted, 0);
}

TEST_F(ListDisposalTest, WhatIsLeftGoesWithTheDisposal) {
    _disposal->add(addList(MANY));
    _disposal->add(addList(MANY));
    Stage::frames(6);
    _disposal.reset();
    EXPECT_EQ(listsDeleted, 2);
    EXPECT_EQ(rowsDeleted, 2 * MANY);
    Stage::frames(10);
}

TEST_F(ListDisposalTest, AListMayGoWithItsParentInBetween) {
    Evas_Object* parent = elm_box_add(stage().window());
    _disposal->add(addList(MANY, parent));
    _disposal->add(addList(FEW));
    Stage::frames(6);
    evas_object_del(parent);
    Stage::frames(60);
    EXPECT_EQ(listsDeleted, 2);
    EXPECT_EQ(rowsDeleted, MANY + FEW);
}

TEST_F(ListDisposalTest, TheWindowMayGoWithListsPending) {
    _disposal->add(addList(MANY));
    _disposal->add(addList(MANY));
    Stage::frames(6);
    takeStageDown();
    EXPECT_EQ(listsDeleted, 2);
    Stage::frames(10);
    _disposal.reset();
    EXPECT_EQ(listsDeleted, 2);
}

} // namespace

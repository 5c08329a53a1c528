// Rows of the city list that come over several turns of the main loop.

#include <cstring>
#include <memory>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "CityRows.h"
#include "clock/ClockWorldClockDbData.h"
#include "support/ScreenTest.h"

using testing::ElementsAreArray;

namespace {

constexpr std::size_t MANY = 1000;
constexpr std::size_t FEW = 5;

using Cities = std::vector<ClockWorldClockDbData*>;

char* rowText(void*, Evas_Object*, const char*) {
    return strdup("row");
}

class CityRowsTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        _cities.resize(MANY);
        _itemClass = elm_genlist_item_class_new();
        _itemClass->item_style = "2line.top";
        _itemClass->func.text_get = rowText;
        _genlist = addList();
        _index = elm_index_add(stage().window());
    }

    void TearDown() override {
        _rows.reset();
        takeStageDown();
        EXPECT_EQ(_itemClass->refcount, 1) << "somebody still holds the item class";
        elm_genlist_item_class_free(_itemClass);
        ScreenTest::TearDown();
    }

    Evas_Object* addList() {
        Evas_Object* genlist = elm_genlist_add(stage().window());
        elm_genlist_mode_set(genlist, ELM_LIST_COMPRESS);
        elm_genlist_homogeneous_set(genlist, EINA_TRUE);
        evas_object_resize(genlist, Stage::SIZE, Stage::SIZE);
        evas_object_show(genlist);
        return genlist;
    }

    Cities first(std::size_t count) {
        Cities cities;
        for (std::size_t place = 0; place < count; ++place)
            cities.push_back(&_cities[place]);
        return cities;
    }

    static Cities shownIn(const Evas_Object* genlist) {
        Cities cities;
        for (const Elm_Object_Item* item = elm_genlist_first_item_get(genlist); item;
             item = elm_genlist_item_next_get(item))
            cities.push_back(static_cast<ClockWorldClockDbData*>(elm_object_item_data_get(item)));
        return cities;
    }

    void show(std::size_t count) { _rows->show(_genlist, _itemClass, first(count)); }
    std::size_t shown() const { return elm_genlist_items_count(_genlist); }
    const ClockWorldClockDbData* target(const Elm_Object_Item* indexItem) const {
        auto* row = static_cast<Elm_Object_Item*>(elm_object_item_data_get(indexItem));
        return row ? static_cast<ClockWorldClockDbData*>(elm_object_item_data_get(row)) : nullptr;
    }
    Elm_Object_Item* addIndexItem() { return elm_index_item_append(_index, "1", nullptr, nullptr); }

    int _filled = 0;
    std::unique_ptr<CityRows> _rows = std::make_unique<CityRows>([this] { ++_filled; });
    std::vector<ClockWorldClockDbData> _cities;
    Elm_Genlist_Item_Class* _itemClass = nullptr;
    Evas_Object* _genlist = nullptr;
    Evas_Object* _index = nullptr;
};

TEST_F(CityRowsTest, TheFirstRowsAreThereAtOnceAndTheRestFollowsInOrder) {
    show(MANY);
    const std::size_t atOnce = shown();
    EXPECT_GE(atOnce, 20U);
    EXPECT_LT(atOnce, MANY / 2);
    Stage::frames(2);
    EXPECT_GT(shown(), atOnce);
    EXPECT_LT(shown(), MANY) << "all in one turn";
    Stage::frames(30);
    EXPECT_THAT(shownIn(_genlist), ElementsAreArray(first(MANY)));
}

TEST_F(CityRowsTest, FewRowsAreThereAtOnce) {
    show(FEW);
    EXPECT_THAT(shownIn(_genlist), ElementsAreArray(first(FEW)));
    Stage::frames(5);
    EXPECT_EQ(shown(), FEW);
    EXPECT_EQ(_filled, 0);
}

TEST_F(CityRowsTest, NoCityMakesNoRow) {
    show(0);
    Stage::frames(5);
    EXPECT_EQ(shown(), 0U);
}

TEST_F(CityRowsTest, ItTellsOnceWhenALongListIsThere) {
    show(MANY);
    Stage::frames(3);
    EXPECT_EQ(_filled, 0);
    Stage::frames(60);
    EXPECT_EQ(_filled, 1);
    EXPECT_EQ(shown(), MANY);
}

TEST_F(CityRowsTest, AnIndexItemLeadsToItsRowAtOnceOrWhenThatComes) {
    show(MANY);
    Elm_Object_Item* near = addIndexItem();
    Elm_Object_Item* far = addIndexItem();
    _rows->link(near, 2);
    _rows->link(far, MANY - 1);
    EXPECT_EQ(target(near), &_cities[2]);
    EXPECT_EQ(target(far), nullptr);
    Stage::frames(30);
    EXPECT_EQ(target(near), &_cities[2]);
    EXPECT_EQ(target(far), &_cities[MANY - 1]);
}

TEST_F(CityRowsTest, CompletingAppendsTheRestAtOnceAndNothingTwice) {
    show(MANY);
    Elm_Object_Item* far = addIndexItem();
    _rows->link(far, MANY - 1);
    _rows->complete();
    EXPECT_THAT(shownIn(_genlist), ElementsAreArray(first(MANY)));
    EXPECT_EQ(target(far), &_cities[MANY - 1]);
    Stage::frames(30);
    EXPECT_EQ(shown(), MANY);
}

TEST_F(CityRowsTest, CompletingBeforeAnythingWasShownDoesNothing) {
    _rows->complete();
    EXPECT_EQ(shown(), 0U);
}

TEST_F(CityRowsTest, NothingComesAfterAStop) {
    show(MANY);
    Stage::frames(2);
    _rows->stop();
    const std::size_t before = shown();
    Stage::frames(30);
    EXPECT_EQ(shown(), before);
    _rows->complete();
    EXPECT_EQ(shown(), before);
    EXPECT_EQ(_filled, 0);
}

TEST_F(CityRowsTest, AListThatIsDeletedInBetweenEndsTheFilling) {
    show(MANY);
    Stage::frames(2);
    evas_object_del(_genlist);
    Stage::frames(30);
    _rows->complete();
    _genlist = addList();
    show(FEW);
    EXPECT_EQ(shown(), FEW);
}

TEST_F(CityRowsTest, AnotherListMayTakeOverWhileRowsAreComing) {
    show(MANY);
    Stage::frames(2);
    Evas_Object* old = _genlist;
    const std::size_t before = shown();
    _genlist = addList();
    show(MANY / 2);
    Stage::frames(30);
    EXPECT_THAT(shownIn(_genlist), ElementsAreArray(first(MANY / 2)));
    EXPECT_EQ(elm_genlist_items_count(old), before);
    EXPECT_EQ(_filled, 1);
}

TEST_F(CityRowsTest, TheSameListMayBeClearedAndFilledAgain) {
    show(MANY);
    Stage::frames(2);
    _rows->stop();
    elm_genlist_clear(_genlist);
    show(MANY);
    Stage::frames(30);
    EXPECT_THAT(shownIn(_genlist), ElementsAreArray(first(MANY)));
}

TEST_F(CityRowsTest, ItMayDieWhileRowsAreComing) {
    show(MANY);
    Stage::frames(2);
    const std::size_t before = shown();
    _rows.reset();
    Stage::frames(30);
    EXPECT_EQ(shown(), before);
}

TEST_F(CityRowsTest, TheWindowMayGoWhileRowsAreComing) {
    show(MANY);
    Stage::frames(2);
    takeStageDown();
    _rows->complete();
    EXPECT_EQ(_filled, 0);
}

} // namespace

// Rows of a list: who owns them and what they are told.

#include <algorithm>
#include <cstring>
#include <string>
#include <vector>

#include "app_assist/WGenlistItem.h"
#include "screens/FrameworkProbe.h"
#include "support/ScreenTest.h"

using app_assist::WGenlistItem;

namespace {

class ProbeRow : public WGenlistItem {
public:
    ProbeRow(Trace& trace, const std::string& name) : probe(trace, name) {}
    ~ProbeRow() override { probe.note("gone"); }

    Elm_Genlist_Item_Class* getItemClassNew() override {
        Elm_Genlist_Item_Class* const itemClass = elm_genlist_item_class_new();
        itemClass->item_style = "default";
        itemClass->func.text_get = [](void* data, Evas_Object*, const char*) {
            return strdup(static_cast<ProbeRow*>(data)->probe.name().c_str());
        };
        itemClass->func.del = deleteCb;
        return itemClass;
    }
    void onSelect(Elm_Object_Item* item) override {
        selected = item;
        probe.note("selected");
    }
    void onSetElmObjectItem(Elm_Object_Item* item) override {
        EXPECT_EQ(getElmObjectItem(), item) << "it is recorded first";
        probe.note("item");
    }

    Probe probe;
    Elm_Object_Item* selected = nullptr;
};

class ListPage : public app_assist::WContentViewController {
public:
    explicit ListPage(Trace& trace) : _trace(trace) {}
    ~ListPage() override { _trace.emplace_back("page gone"); }

    ProbeRow* append(const std::string& name) {
        auto* const row = new ProbeRow(_trace, name);
        Elm_Genlist_Item_Class* const itemClass = row->getItemClassNew();
        row->setElmObjectItem(elm_genlist_item_append(list, itemClass, row, nullptr,
                                                      ELM_GENLIST_ITEM_NONE,
                                                      WGenlistItem::getSelectCb(), row));
        elm_genlist_item_class_free(itemClass);
        return row;
    }

    Evas_Object* list = nullptr;

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void* /*param*/) override {
        list = elm_genlist_add(parent);
        elm_genlist_mode_set(list, ELM_LIST_COMPRESS);
        return list;
    }

private:
    Trace& _trace;
};

class FrameworkRowTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        page = new ListPage(trace);
        stage().push(page);
    }
    Trace trace;
    ListPage* page = nullptr;
};

} // namespace

TEST_F(FrameworkRowTest, aRowLearnsItsItem) {
    ProbeRow* const row = page->append("Row");
    EXPECT_EQ(trace, Trace{"Row item"});
    EXPECT_EQ(row->getElmObjectItem(), elm_genlist_first_item_get(page->list));
    ProbeRow loose(trace, "loose");
    EXPECT_EQ(loose.getElmObjectItem(), nullptr);
}

TEST_F(FrameworkRowTest, aTappedRowIsSelected) {
    page->append("one");
    ProbeRow* const row = page->append("two");
    stage().settle();
    trace.clear();
    stage().tapText("two");
    EXPECT_EQ(trace, Trace{"two selected"});
    EXPECT_EQ(row->selected, row->getElmObjectItem());
}

TEST_F(FrameworkRowTest, selectingWithoutARowIsLogged) {
    WGenlistItem::getSelectCb()(nullptr, page->list, nullptr);
    expectLog("Data is NULL !!");
}

TEST_F(FrameworkRowTest, aPlainRowHasNothing) {
    WGenlistItem row;
    EXPECT_EQ(row.getItemClassStatic(), nullptr);
    EXPECT_EQ(row.getItemClassNew(), nullptr);
    EXPECT_EQ(row.getElmObjectItem(), nullptr);
    row.onSelect(nullptr);
    row.setElmObjectItem(nullptr);
    WGenlistItem::deleteCb(nullptr, nullptr);
}

TEST_F(FrameworkRowTest, aRowGoesWithItsItem) {
    page->append("one");
    ProbeRow* const row = page->append("two");
    page->append("three");
    stage().settle();
    trace.clear();
    elm_object_item_del(row->getElmObjectItem());
    stage().frames(2);
    EXPECT_EQ(trace, Trace{"two gone"});
}

TEST_F(FrameworkRowTest, allRowsGoWhenTheListIsCleared) {
    page->append("one");
    page->append("two");
    stage().settle();
    trace.clear();
    elm_genlist_clear(page->list);
    stage().frames(2);
    EXPECT_EQ(trace, (Trace{"one gone", "two gone"}));
}

TEST_F(FrameworkRowTest, allRowsGoWithTheListAndBeforeThePage) {
    page->append("one");
    page->append("two");
    stage().settle();
    trace.clear();
    page->destroy();
    stage().frames(2);
    EXPECT_EQ(trace, (Trace{"one gone", "two gone", "page gone"}));
}

TEST_F(FrameworkRowTest, allRowsGoWithTheWindow) {
    page->append("one");
    for (int i = 0; i < 100; ++i) {
        page->append("more");
    }
    stage().settle();
    trace.clear();
    takeStageDown();
    EXPECT_EQ(std::ranges::count(trace, "one gone"), 1);
    EXPECT_EQ(std::ranges::count(trace, "more gone"), 100);
    EXPECT_EQ(trace.back(), "page gone");
}

TEST_F(FrameworkRowTest, rowsGoWhenOthersDeleteTheList) {
    page->append("one");
    stage().settle();
    trace.clear();
    evas_object_del(page->list);
    stage().frames(2);
    EXPECT_EQ(trace, (Trace{"one gone", "page gone"}));
}

TEST_F(FrameworkRowTest, aDyingRowMayStillAskItsPage) {
    ProbeRow* const row = page->append("one");
    row->probe.on("gone", [this] {
        EXPECT_TRUE(page->isDying());
        EXPECT_EQ(page->getEvasObj(), nullptr);
        EXPECT_EQ(page->getWindowController(), nullptr);
        trace.emplace_back("asked");
    });
    stage().settle();
    trace.clear();
    page->destroy();
    stage().frames(2);
    EXPECT_EQ(trace, (Trace{"one gone", "asked", "page gone"}));
}

TEST_F(FrameworkRowTest, aSelectedRowMayTakeItsPageAway) {
    ProbeRow* const row = page->append("one");
    row->probe.on("selected", [this] { page->popOut(); });
    stage().settle();
    stage().tapText("one");
    stage().advance(1);
    EXPECT_EQ(trace.back(), "page gone");
}

TEST_F(FrameworkRowTest, aSelectedRowMayDeleteAnother) {
    ProbeRow* const row = page->append("one");
    ProbeRow* const other = page->append("two");
    row->probe.on("selected", [other] { elm_object_item_del(other->getElmObjectItem()); });
    stage().settle();
    trace.clear();
    stage().tapText("one");
    stage().frames(2);
    EXPECT_EQ(trace, (Trace{"one selected", "two gone"}));
}

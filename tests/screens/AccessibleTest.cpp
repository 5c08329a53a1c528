// What a screen reader is told of the editor. The tree is walked as the toolkit shows it on the
// bus.
#define EFL_BETA_API_SUPPORT
#define EFL_ACCESS_OBJECT_PROTECTED
#include <Elementary.h>

#include <map>

#include <gmock/gmock.h>

#include "screens/EditorFixture.h"

namespace {

struct Thing {
    Efl_Access_Role role = EFL_ACCESS_ROLE_INVALID;
    std::string name;
    bool checked = false;
};

class AccessibleTest : public EditorFixture {
protected:
    void SetUp() override {
        EditorFixture::SetUp();
        elm_config_atspi_mode_set(EINA_TRUE);
    }
    void TearDown() override {
        takeErrors();
        EditorFixture::TearDown();
        elm_config_atspi_mode_set(EINA_FALSE);
    }
    static void collect(Eo* object, std::vector<Thing>& things) {
        const char* name = efl_access_object_i18n_name_get(object);
        const Efl_Access_State_Set states = efl_access_object_state_set_get(object);
        things.push_back({efl_access_object_role_get(object), name ? name : "",
                          (states & (1ULL << EFL_ACCESS_STATE_TYPE_CHECKED)) != 0});
        Eina_List* children = efl_access_object_access_children_get(object);
        while (children) {
            collect(static_cast<Eo*>(eina_list_data_get(children)), things);
            children = eina_list_remove_list(children, children);
        }
    }
    std::vector<Thing> things() {
        std::vector<Thing> all;
        collect(stage().window(), all);
        return all;
    }
    std::vector<std::string> named(Efl_Access_Role role) {
        std::vector<std::string> names;
        for (const Thing& thing : things())
            if (thing.role == role)
                names.push_back(thing.name);
        return names;
    }
};

using testing::Contains;
using testing::Each;
using testing::Not;
using testing::StartsWith;

TEST_F(AccessibleTest, EveryControlOfTheEditorHasAName) {
    createAlarm();
    pick(7, 30);
    stage().settle();
    EXPECT_THAT(named(EFL_ACCESS_ROLE_PUSH_BUTTON),
                testing::UnorderedElementsAre("Cancel", "Done", "DATE"));
    EXPECT_THAT(named(EFL_ACCESS_ROLE_SPIN_BUTTON), Contains("hour, 07"));
    EXPECT_THAT(named(EFL_ACCESS_ROLE_SPIN_BUTTON), Contains("minute, 30"));
    for (const Efl_Access_Role role :
         {EFL_ACCESS_ROLE_PUSH_BUTTON, EFL_ACCESS_ROLE_SPIN_BUTTON, EFL_ACCESS_ROLE_SLIDER,
          EFL_ACCESS_ROLE_CHECK_BOX, EFL_ACCESS_ROLE_ENTRY})
        EXPECT_THAT(named(role), Each(Not("")));
    EXPECT_THAT(named(EFL_ACCESS_ROLE_LIST_ITEM), Contains(StartsWith("Repeat weekly, ")));
    EXPECT_THAT(named(EFL_ACCESS_ROLE_LIST_ITEM), Contains(StartsWith("Snooze, ")));
}

TEST_F(AccessibleTest, AWheelTellsItsNewValue) {
    createAlarm();
    pick(7, 30);
    pick(8, 5);
    EXPECT_THAT(named(EFL_ACCESS_ROLE_SPIN_BUTTON), Contains("hour, 08"));
    EXPECT_THAT(named(EFL_ACCESS_ROLE_SPIN_BUTTON), Contains("minute, 05"));
}

TEST_F(AccessibleTest, ASwitchTellsItsState) {
    createAlarm();
    stage().showRow(elm_genlist_item_prev_get(nameRow().getElmObjectItem()));
    bool found = false;
    for (const Thing& thing : things())
        if (thing.role == EFL_ACCESS_ROLE_CHECK_BOX && thing.name.starts_with("Snooze, ")) {
            EXPECT_TRUE(thing.checked);
            found = true;
        }
    EXPECT_TRUE(found);
}

} // namespace

/**
 * @file
 * @brief Tests that nothing which matters is cut by the circle of the face.
 */
#pragma once

#include <memory>
#include <string>

#include <Elementary.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "screens/TestCatalogue.h"
#include "support/DeviceFake.h"
#include "support/FaceInk.h"
#include "support/Stage.h"

/** The languages that differ most: long words, the other direction, tall letters, wide ones. */
inline const auto FACE_LANGUAGES = testing::Values("en", "de", "ar", "hi", "ja");

/** @brief A fixture in one of these languages, with twelve hours, which take the most room. */
template <class Fixture>
class FaceFixture : public Fixture, public testing::WithParamInterface<const char*> {
protected:
    void SetUp() override {
        Fixture::SetUp();
        _language = std::make_unique<CatalogueLanguage>(GetParam());
        elm_config_mirrored_set(std::string(GetParam()) == "ar" ? EINA_TRUE : EINA_FALSE);
        device().setSetting("db/menu_widget/regionformat_time1224", 1);
    }
    void TearDown() override {
        this->takeStageDown();
        elm_config_mirrored_set(EINA_FALSE);
        Fixture::TearDown();
        _language.reset();
    }

    using testing::WithParamInterface<const char*>::GetParam;

    /** Looks at the face as it is, and leaves a picture of it. */
    void look(const std::string& name) {
        EXPECT_THAT(cutByCircle(this->stage().canvas()), testing::IsEmpty()) << name;
        this->stage().screenshot(std::string("face-") + GetParam() + "-" + name);
    }
    /** Looks at a list at its upper end, wherever it may come to rest, and at its lower end. */
    void lookAtList(Evas_Object* list, const std::string& name) {
        int height = 0;
        int shown = 0;
        elm_scroller_child_size_get(list, nullptr, &height);
        elm_scroller_region_get(list, nullptr, nullptr, nullptr, &shown);
        const int steps = 8;
        for (int step = 0; step <= steps; ++step) {
            elm_scroller_region_show(list, 0, (height - shown) * step / steps, 1, shown);
            this->stage().settle();
            look(name + "-" + std::to_string(step));
        }
    }
    /** Looks at the face after each of so many steps of the focus: rings must not be cut either. */
    void lookAtFocus(int steps, const std::string& name) {
        for (int step = 1; step <= steps; ++step) {
            this->stage().keySettled("Tab");
            look(name + "-" + std::to_string(step));
        }
    }

private:
    std::unique_ptr<CatalogueLanguage> _language;
};

/** The name of a language, as a test's. */
inline std::string languageOf(const testing::TestParamInfo<const char*>& language) {
    return language.param;
}

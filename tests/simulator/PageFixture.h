/**
 * @file
 * @brief The simulator's own pages, with their theme.
 */
#pragma once

#include <string>

#include <Elementary.h>

#include "support/ScreenTest.h"

/** A face on which pages of the simulator look as they should. */
class PageFixture : public ScreenTest {
protected:
    static std::string theme() { return CLOCK_RESOURCE_DIR "/edje/simulator.edj"; }

    void SetUp() override {
        ScreenTest::SetUp();
        elm_theme_extension_add(nullptr, theme().c_str());
    }
    void TearDown() override {
        takeStageDown();
        elm_theme_extension_del(nullptr, theme().c_str());
        ScreenTest::TearDown();
    }
};

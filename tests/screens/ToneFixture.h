/**
 * @file
 * @brief The page of the device's tone picker on the face, filled as its program does it.
 */
#pragma once

#include <memory>
#include <string>
#include <utility>
#include <vector>

#include "TonePage.h"
#include "support/ScreenTest.h"

class ToneFixture : public ScreenTest {
protected:
    void TearDown() override {
        closeTones();
        ScreenTest::TearDown();
    }
    /** @param marked Position of the tone that is marked at first, or -1. */
    void openTones(const std::vector<std::string>& titles, int marked) {
        std::vector<tone_picker::Tone> tones;
        tones.reserve(titles.size());
        for (const std::string& title : titles)
            tones.push_back({title + ".wav", title});
        _page = std::make_unique<tone_picker::TonePage>(
            std::move(tones), marked,
            tone_picker::TonePage::Actions{.marked = [this](int position) { heard = position; },
                                           .done = [this](int position) { chosen = position; },
                                           .cancelled =
                                               [this] {
                                                   ++cancels;
                                               }});
        _page->show(stage().window());
        stage().settle();
    }
    void closeTones() {
        // The window goes before the page.
        takeStageDown();
        _page.reset();
    }

    int heard = -1;
    int chosen = -1;
    int cancels = 0;

private:
    std::unique_ptr<tone_picker::TonePage> _page;
};

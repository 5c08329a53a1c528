/**
 * @file
 * @brief Base of every test that uses screens.
 */
#pragma once

#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "support/DeviceFake.h"
#include "support/Stage.h"
#include "support/VirtualClock.h"

/**
 * @brief A fresh device, an empty data folder, and 18 November 2026, 09:41 in Berlin.
 *
 * A log line at error priority that the test does not consume fails it, and so does a view
 * controller or a framework timer that outlives the window.
 */
class ScreenTest : public testing::Test {
protected:
    void SetUp() override;
    void TearDown() override;

    /** The watch face; made on first use, taken down after the test. */
    Stage& stage();
    /** Takes the face down before the test ends. */
    void takeStageDown();

    /**
     * @brief Expects an error line that has this message; consumes one such line.
     *
     * Works for lines that are there already; the rest fails the test at its end.
     */
    void expectLog(const std::string& message);
    /** Consumes every error line so far and hands them out. */
    std::vector<std::string> takeErrors();

private:
    void collectErrors();

    std::unique_ptr<Stage> _stage;
    std::vector<std::string> _errors;
    int _controllersBefore = 0;
    int _timersBefore = 0;
};

/**
 * @file
 * @brief How applications hear of the quick panel.
 */
#pragma once

#include <Evas.h>

namespace simulator {

/** @brief Makes the message known where there is no X server to ask; before the first window. */
void prepareQuickPanelMessage();

/** @brief Tells a window that the panel was opened (true) or closed, as the system's own does. */
void sendQuickPanelMessage(Evas_Object* window, bool shown);

} // namespace simulator

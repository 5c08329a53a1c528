/**
 * @file
 * @brief A row of the clock application's lists.
 */
#pragma once

#include "app_assist/WGenlistItem.h"

namespace simulator {

/** @brief A row that can be tapped, and held. */
class ListRow : public app_assist::WGenlistItem {
public:
    /** @brief A finger has rested on the row. */
    virtual void onHold() = 0;
};

} // namespace simulator

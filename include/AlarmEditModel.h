/**
 * @file
 * @brief Model of the alarm editor.
 */
#pragma once

#include "ClockUiExport.h"

/** @brief Has nothing to keep: the rows work on the alarm record itself. */
class CLOCK_UI_EXPORT AlarmEditModel {
public:
    AlarmEditModel() = default;
    virtual ~AlarmEditModel();
};

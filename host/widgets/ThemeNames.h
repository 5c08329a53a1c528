/**
 * @file
 * @brief Names of the device theme's groups, parts, signals and data that the widgets use.
 */
#pragma once

namespace host::theme {

/** Class and group of every layout of the time picker: elm/layout/timepicker/STYLE. */
inline constexpr const char* LAYOUT_CLASS = "layout";
inline constexpr const char* PICKER_GROUP = "timepicker";

inline constexpr const char* STYLE_12_HOURS = "time_layout";
inline constexpr const char* STYLE_24_HOURS = "time_layout_24hr";
inline constexpr const char* STYLE_WHEEL = "wheel";

inline constexpr const char* PART_HOUR = "wheel.hour";
inline constexpr const char* PART_MINUTE = "wheel.minute";
inline constexpr const char* PART_HALF = "wheel.half";
inline constexpr const char* PART_SEPARATOR = "separator";

inline constexpr const char* SIGNAL_HALF_FIRST = "device,half,first";
inline constexpr const char* SIGNAL_HALF_LAST = "device,half,last";
inline constexpr const char* SIGNAL_SOURCE = "device";

/** Where a wheel's values are drawn, and its measures in the theme's data. */
inline constexpr const char* PART_VALUES = "values";
inline constexpr const char* DATA_STEP = "step";
inline constexpr const char* DATA_VALUE_HEIGHT = "value_height";

/** Groups of one value, and their text. */
inline constexpr const char* GROUP_NUMBER = "device/timepicker/number";
inline constexpr const char* GROUP_WORD = "device/timepicker/word";
inline constexpr const char* PART_VALUE = "value";
/** A float: how far the value is from the middle, in values. */
inline constexpr int MESSAGE_DISTANCE = 1;

/** Class and group of edit fields, and the style of those to search with. */
inline constexpr const char* FIELD_GROUP = "editfield";
inline constexpr const char* STYLE_SEARCH = "search";
inline constexpr const char* STYLE_CLEAR_BUTTON = "editfield/clear";

inline constexpr const char* PART_FIELD_ENTRY = "elm.swallow.content";
inline constexpr const char* PART_FIELD_BUTTON = "elm.swallow.button";

inline constexpr const char* SIGNAL_FIELD_BUTTON_SHOW = "device,state,button,show";
inline constexpr const char* SIGNAL_FIELD_BUTTON_HIDE = "device,state,button,hide";
inline constexpr const char* SIGNAL_FIELD_FOCUSED = "device,state,focused";
inline constexpr const char* SIGNAL_FIELD_UNFOCUSED = "device,state,unfocused";

/** Where an index has its labels, and the text of a label. */
inline constexpr const char* PART_INDEX_LABELS = "elm.swallow.index.0";
inline constexpr const char* PART_INDEX_LABEL = "elm.text";
/** A float: how far a label is moved in from the edge, as a share of its way. */
inline constexpr int MESSAGE_INDENT = 1;

/** Where a list has its rows. */
inline constexpr const char* PART_LIST_ROWS = "elm.swallow.content";
/** Of an entry: what it says while it is empty. */
inline constexpr const char* PART_GUIDE = "elm.guide";
/** Names the parts of a row that must not be cut by the rim, in the theme's data. */
inline constexpr const char* DATA_RIM = "rim";
/** In the theme's data of a row: its switch does something else than the row. */
inline constexpr const char* DATA_OWN_FOCUS = "own_focus";
/** To a row, from "device": it rests in the middle of the face, or no longer does. */
inline constexpr const char* SIGNAL_ROW_CENTRED = "device,state,centred";
inline constexpr const char* SIGNAL_ROW_MOVED = "device,state,moved";
/** A float: how far the upper end of a list is softened, 0 to 1. */
inline constexpr int MESSAGE_FADE = 1;

/** Where a finger takes hold of an index, and what it says in the middle. */
inline constexpr const char* PART_INDEX_TOUCH = "elm.swallow.event.0";
inline constexpr const char* PART_INDEX_SAID = "elm.text";
/** Where a slider is touched. */
inline constexpr const char* PART_SLIDER_BAR = "elm.swallow.bar";
/** The days of a calendar. */
inline constexpr const char* PART_CALENDAR_WEEKS = "weeks";

/** To what keys have reached, from "elm"; and while steps change its value, from "device". */
inline constexpr const char* SIGNAL_RING_SHOW = "elm,action,focus_highlight,show";
inline constexpr const char* SIGNAL_RING_HIDE = "elm,action,focus_highlight,hide";
inline constexpr const char* SIGNAL_TURNING = "device,state,turning";
inline constexpr const char* SIGNAL_RESTING = "device,state,resting";
inline constexpr const char* TOOLKIT_SOURCE = "elm";

} // namespace host::theme

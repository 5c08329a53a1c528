/**
 * @file
 * @brief The few widgets that the control panel is made of.
 *
 * Each is owned by its parent, reads from left to right in every language, can be reached with the
 * Tab key and has a name for accessibility.
 */
#pragma once

#include <functional>
#include <string>

#include <Evas.h>

namespace simulator::control {

using Action = std::function<void()>;

/** @brief Calls an action for each event of a widget's, for as long as the widget lives. */
void onEvent(Evas_Object* widget, const char* event, Action action);

/** @brief Rows below each other. */
Evas_Object* addColumn(Evas_Object* parent);

/** Heights of rows in pixels. */
inline constexpr int CONTROL_HEIGHT = 28;
inline constexpr int KEY_HEIGHT = 38;

/** @brief A row, which gives its children their sizes: they are smaller than a finger. */
Evas_Object* addRow(Evas_Object* column, int height = CONTROL_HEIGHT);

/** @brief Puts a widget at the end of a row. @param width In pixels; 0 = a share of what is left.
 */
void place(Evas_Object* row, Evas_Object* widget, int width = 0);

/** @brief A titled part of the panel. @return The column inside it. */
Evas_Object* addSection(Evas_Object* column, const char* title);

/** @brief A word before a control, in a row. */
void addCaption(Evas_Object* row, const char* text, int width = 52);

/** Looks of buttons. */
inline constexpr const char* PLAIN = "control";
inline constexpr const char* KEY = "control.key";
inline constexpr const char* SET = "control.set";

Evas_Object* addButton(Evas_Object* row, const char* label, const std::string& name,
                       const char* look = PLAIN, int width = 0);
Evas_Object* addSwitch(Evas_Object* row, const char* label, const std::string& name, int width = 0);
/** @param group The first radio of the same choice, or null. */
Evas_Object* addRadio(Evas_Object* row, const char* label, const std::string& name,
                      Evas_Object* group, int value, int width = 0);
Evas_Object* addField(Evas_Object* row, const char* hint, const std::string& name);

/** @brief The text of a field, as it was typed. */
std::string textOf(Evas_Object* field);
/** @brief Shows a text in a field, unless somebody is typing there or it shows it already. */
void showText(Evas_Object* field, const std::string& text);

/** @brief What somebody typed into a field has been used: the field may show other texts again. */
void confirm(Evas_Object* field);

/** @brief Makes a widget fit for the panel; the others call it. */
void prepare(Evas_Object* widget, const std::string& name);

} // namespace simulator::control

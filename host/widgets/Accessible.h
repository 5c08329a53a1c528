/**
 * @file
 * @brief What screen readers are told about widgets.
 */
#pragma once

#include <string>
#include <vector>

#include <Elementary.h>

namespace host {

/** @brief Sets what a widget is called; its value belongs to it where readers have no other. */
void setReadName(Evas_Object* widget, const std::string& name);
/** @brief What a widget is called; empty when it has no name. */
std::string readName(const Evas_Object* widget);
/** @brief Sets the name to a text of the default domain, looked up each time it is read. */
void setReadTextId(Evas_Object* widget, const char* textId);
/** @brief Says that a widget's value is turned up and down. */
void setReadAsSpinner(Evas_Object* widget);

/** @brief Tells that keys have reached a widget or a row. */
void tellFocus(Eo* thing);

/** @brief Gives a widget the toolkit's focus without a word about it. */
void focusSilently(Evas_Object* widget);

/** @brief Buttons, switches, fields and the like in a row; empty while it has no picture. */
std::vector<Evas_Object*> controlsOfRow(const Elm_Object_Item* row);

/** @brief Gives switches, marks and fields in a row the name of the row, if it has one. */
void nameControlsInRow(const Elm_Object_Item* row);

/**
 * @brief Gives switches, marks and fields in the rows of a list the names of their rows.
 *
 * While a screen reader is on: they have no text of their own.
 */
void nameControlsInRows(Evas_Object* list);

} // namespace host

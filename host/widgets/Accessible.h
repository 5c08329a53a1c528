/**
 * @file
 * @brief What screen readers are told about widgets.
 */
#pragma once

#include <string>

#include <Evas.h>

namespace host {

/** @brief Sets what a widget is called; its value belongs to it where readers have no other. */
void setReadName(Evas_Object* widget, const std::string& name);
/** @brief The same, with a text of the default domain that is looked up each time it is read. */
void setReadTextId(Evas_Object* widget, const char* textId);
/** @brief Says that a widget's value is turned up and down. */
void setReadAsSpinner(Evas_Object* widget);

/**
 * @brief Gives switches, marks and fields in the rows of a list the names of their rows.
 *
 * While a screen reader is on: they have no text of their own.
 */
void nameRowsForReaders(Evas_Object* list);

} // namespace host

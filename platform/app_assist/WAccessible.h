/**
 * @file
 * @brief What screen readers are told.
 */
#pragma once

#include <string>

#include <Evas.h>

#include <app_assist/Export.h>

namespace app_assist {

/**
 * @brief Names a widget that has no text of its own.
 * @param name Translated; set it anew when the language changes.
 */
APP_ASSIST_EXPORT void setAccessibleName(Evas_Object* widget, const std::string& name);

/**
 * @brief The same, with a text of the default domain that is looked up each time it is read.
 * @param textId Lives as long as the widget.
 */
APP_ASSIST_EXPORT void setAccessibleTextId(Evas_Object* widget, const char* textId);

/** @brief Says that a widget will show announcements: readers ask but once what it is. */
APP_ASSIST_EXPORT void prepareAnnouncements(Evas_Object* widget);

/** @brief Lets screen readers say a text that comes and goes by itself. @param widget Shows it. */
APP_ASSIST_EXPORT void announce(Evas_Object* widget, const std::string& text);

/** @brief Tells screen readers that the text has gone. @param widget Has shown it. */
APP_ASSIST_EXPORT void endAnnouncement(Evas_Object* widget);

} // namespace app_assist

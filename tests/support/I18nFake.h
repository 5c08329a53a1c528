/**
 * @file
 * @brief Collation and search of a test: calls are noted in device().calls() and then do their real
 * work; device().fail() makes them fail.
 *
 * A call is noted with its texts in UTF-8: i18n_ucollator_str_collator("Bonn", "Köln"). Functions
 * without an error to return fail by returning nothing: null, or 0 and the error in their last
 * argument.
 */
#pragma once

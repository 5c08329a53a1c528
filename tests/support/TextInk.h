/**
 * @file
 * @brief The pixels that texts colour, and what becomes of them.
 *
 * A text is drawn once more beside the face with room all around it: marks above and below letters
 * reach out of the line that the toolkit reckons with.
 */
#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "support/Stage.h"

/** The pixels of the face that a text would colour if nothing cut it. */
struct TextInk {
    std::string text;
    const Evas_Object* object = nullptr;
    const Evas_Object* surface = nullptr; ///< The page or popup that it stands on.
    std::vector<Spot> pixels;
    std::size_t lost = 0;       ///< How many of them are outside of what the text is clipped by.
    bool isScrolledOut = false; ///< Its row is not wholly in sight.
};

std::vector<TextInk> textInkOf(const std::vector<FoundText>& texts);

/** Texts whose pixels are lost, and pairs of texts on one surface that colour the same ones. */
std::vector<std::string> inkFaultsOf(const std::vector<FoundText>& texts);

/** True when a text block leaves something out and has dots instead. */
bool endsInDots(const FoundText& found);

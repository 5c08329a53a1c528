/**
 * @file
 * @brief Finding a text on the face as a person reads it.
 */
#pragma once

#include <cstddef>
#include <string>
#include <vector>

namespace simulator {

/** A rectangle on the face in pixels. */
struct FaceArea {
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;

    bool operator==(const FaceArea&) const = default;
    int middleX() const { return x + width / 2; }
    int middleY() const { return y + height / 2; }
};

/** A text that can be seen, at least in part. */
struct VisibleText {
    std::string text;
    FaceArea area;        ///< All of it, as large as it is drawn.
    FaceArea seen;        ///< What can be seen of it.
    bool covered = false; ///< A touch of its middle gets something else.
    bool faint = false;   ///< It has faded toward the rim.

    /** True when all of it lies on the round face, and it can be read and touched. */
    bool isFullySeen() const;
};

/** What was found. */
struct TextMatch {
    std::size_t index = 0;
    std::string problem; ///< One sentence when there is none, or more than one; else empty.
};

/** @brief A text with single blanks and no line breaks, as it is compared. */
std::string asRead(const std::string& text);

/** Whether the beginning of a text is enough to find it. */
enum class Match { Whole, Beginning };

/**
 * @brief Finds the text that reads so; if there is none, the only one that begins so.
 * @param texts From the top to the bottom.
 */
TextMatch matchText(const std::vector<VisibleText>& texts, const std::string& wanted,
                    Match match = Match::Beginning);

/** @brief "the face shows "Cancel" (124 60), ...", or that it shows no text. */
std::string describeTexts(const std::vector<VisibleText>& texts);

} // namespace simulator

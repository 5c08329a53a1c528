/**
 * @file
 * @brief What a person can read on the face.
 */
#pragma once

#include <string>
#include <vector>

#include <Evas.h>

namespace host {

struct Area {
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;
    bool isEmpty() const { return width <= 0 || height <= 0; }
};

/** A text that can be seen, at least in part. */
struct FaceText {
    std::string text;
    Area area;            ///< All of it, where and as large as it is drawn.
    Area seen;            ///< What is left of it inside the face and its clippers.
    bool covered = false; ///< A touch of its middle gets something else that lies above.
    bool faint = false;   ///< It has faded so far toward the rim that it can hardly be read.
};

/** @brief The texts from the top to the bottom. */
std::vector<FaceText> faceTexts(Evas* canvas);

/** What is left of an object inside the face and its clippers; nothing while it is hidden. */
Area seenArea(const Evas_Object* object);

/** Calls a function for every object of a canvas, from the bottom to the top. */
void walkCanvas(Evas* canvas, void (*visit)(Evas_Object* object, void* data), void* data);

} // namespace host

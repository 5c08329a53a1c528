/**
 * @file
 * @brief Whether anything on the face still moves, or is about to.
 */
#pragma once

#include <functional>
#include <string>

#include <Ecore.h>
#include <Ecore_Evas.h>

#include "MainLoopWork.h"

namespace host {

/**
 * @brief Waits until the face stands still.
 *
 * That is: it is drawn, no animation runs, and the main loop has slept for a while, so that no job
 * and no idle work waits either.
 */
class FaceStill {
public:
    /** @param why Empty, or what still moved when the time was over. */
    using Done = std::function<void(const std::string& why)>;

    /** @param done May destroy this object. */
    FaceStill(double seconds, Done done);
    ~FaceStill();
    FaceStill(const FaceStill&) = delete;
    FaceStill& operator=(const FaceStill&) = delete;

private:
    static Eina_Bool _lookCb(void* data);
    static void _renderedCb(void* data, Evas* canvas, void* info);
    /** @return What moves, or an empty text. */
    std::string look();
    void follow(Ecore_Evas* window);
    std::string describeChange() const;

    double _end;
    Done _done;
    Ecore_Timer* _timer;
    Evas* _canvas = nullptr; ///< Null when it has gone, too.
    Turns _seen;
    int _rendered = 0;
    Eina_Rectangle _changed{};
    int _quietLooks = 0;
};

} // namespace host

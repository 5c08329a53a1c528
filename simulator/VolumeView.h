/**
 * @file
 * @brief The system's volume on the face.
 */
#pragma once

#include <memory>
#include <string>

#include <Ecore.h>
#include <Evas.h>

namespace simulator {

/** @brief Sets the bar, the number and the icon of a layout that shows a volume level. */
void setVolumeLevel(Evas_Object* layout, int level);

/** @brief Shows the alarm's level for a moment, over everything in a window but lets input through.
 *
 * It must go before its window. */
class VolumeView {
public:
    /** @param window Owner of what is drawn. @param theme Path of the simulator's theme. */
    VolumeView(Evas_Object* window, const std::string& theme);
    ~VolumeView();
    VolumeView(const VolumeView&) = delete;
    VolumeView& operator=(const VolumeView&) = delete;

    void show(int level);

private:
    struct TimerDeleter {
        void operator()(Ecore_Timer* timer) const { ecore_timer_del(timer); }
    };
    static Eina_Bool _timeOverCb(void* data);

    Evas_Object* _layout;
    std::unique_ptr<Ecore_Timer, TimerDeleter> _timer;
};

} // namespace simulator

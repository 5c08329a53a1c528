/**
 * @file
 * @brief The panel that a person pulls down over the face.
 */
#pragma once

#include <functional>
#include <memory>
#include <string>

#include <Ecore.h>
#include <Evas.h>

namespace simulator {

/** @brief A panel with the alarm's level over everything in a window. It must go before its window.
 */
class QuickPanel {
public:
    /**
     * @param window Owner of what is drawn.
     * @param theme Path of the simulator's theme.
     * @param changed Told when the panel opens (true) and when it closes.
     */
    QuickPanel(Evas_Object* window, const std::string& theme,
               std::function<void(bool shown)> changed);
    ~QuickPanel();
    QuickPanel(const QuickPanel&) = delete;
    QuickPanel& operator=(const QuickPanel&) = delete;

    bool isShown() const { return _timer != nullptr; }
    /** @brief Pulls the panel down, or pushes it up again. */
    void toggle();
    /** @brief Shows the alarm's level as it is now. */
    void refresh();

private:
    struct TimerDeleter {
        void operator()(Ecore_Timer* timer) const { ecore_timer_del(timer); }
    };
    static Eina_Bool _refreshCb(void* data);
    static void _closeCb(void* data, Evas_Object* layout, const char* signal, const char* source);
    static void _bezelCb(void* data, Evas* canvas, Evas_Object* layout, void* info);
    static void _languageChangedCb(void* data, Evas_Object* layout, void* info);
    static void _backCb(void* data, Evas_Object* layout, void* info);
    void open();
    void close();
    /** What screen readers are told. */
    std::string readText() const;

    Evas_Object* _layout;
    std::function<void(bool)> _changed;
    int _level = -1; ///< As drawn.
    /** Runs while the panel is shown: another process may change the level. */
    std::unique_ptr<Ecore_Timer, TimerDeleter> _timer;
};

} // namespace simulator

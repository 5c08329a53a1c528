/**
 * @file
 * @brief Who has the keys where no window manager tells.
 */
#pragma once

#include <string>

#include <Ecore.h>

#include "../FolderWatch.h"

namespace host {

/**
 * @brief Gives the window of this process the focus while no later application listens.
 *
 * For windows in memory alone: on a display that is the window manager's work.
 */
class FrontWatch {
public:
    /** @param folder Where the device's applications listen. @param name That of this one. */
    FrontWatch(const std::string& folder, std::string name);
    ~FrontWatch();
    FrontWatch(const FrontWatch&) = delete;
    FrontWatch& operator=(const FrontWatch&) = delete;

private:
    static Eina_Bool _windowCb(void* data);
    bool isInFront() const;
    void update();

    std::string _folder;
    std::string _name;
    FolderWatch _watch;
    bool _wasTakenAway = false; ///< The focus, once.
    Ecore_Timer* _timer;        ///< Until the window is there.
};

/** @brief Takes away what an application of a device has left behind that ended too early. */
void forgetFace(int process);

} // namespace host

#include "FrontWatch.h"

#include <algorithm>
#include <cstring>
#include <filesystem>
#include <utility>

#include <sys/inotify.h>

#include "FaceAgent.h"
#include "FaceWindow.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace fs = std::filesystem;

namespace host {

namespace {

constexpr double LOOK_SECONDS = 0.02;

} // namespace

FrontWatch::FrontWatch(const std::string& folder, std::string name)
    : _folder(folder), _name(std::move(name)), _watch([this](const std::string&) { update(); }),
      _timer(ecore_timer_add(LOOK_SECONDS, _windowCb, this)) {
    if (const int problem = _watch.add(folder, IN_CREATE))
        LOG_ERROR("Other applications go unseen: %s", std::strerror(problem));
}

FrontWatch::~FrontWatch() {
    if (_timer)
        ecore_timer_del(_timer);
}

bool FrontWatch::isInFront() const {
    std::error_code ignored;
    const fs::directory_iterator all(_folder, ignored);
    return std::none_of(begin(all), end(all), [this](const fs::directory_entry& entry) {
        std::error_code unseen;
        return entry.is_socket(unseen) && entry.path().filename().string() > _name;
    });
}

void FrontWatch::update() {
    Ecore_Evas* window = faceWindow();
    if (window && isInMemory(window))
        ecore_evas_focus_set(window, isInFront());
}

Eina_Bool FrontWatch::_windowCb(void* data) {
    auto* self = static_cast<FrontWatch*>(data);
    Ecore_Evas* window = faceWindow();
    if (!window)
        return ECORE_CALLBACK_RENEW;
    // It takes itself to have the focus from the start, but tells the toolkit of changes only.
    if (isInMemory(window) && !std::exchange(self->_wasTakenAway, true)) {
        ecore_evas_focus_set(window, EINA_FALSE);
        return ECORE_CALLBACK_RENEW;
    }
    self->_timer = nullptr;
    self->update();
    return ECORE_CALLBACK_CANCEL;
}

void forgetFace(int process) {
    const FaceAgent* own = FaceAgent::get();
    if (!own)
        return;
    std::string ending("-");
    ending += std::to_string(process);
    std::error_code ignored;
    for (const auto& entry : fs::directory_iterator(own->folder(), ignored)) {
        const std::string name = entry.path().filename();
        std::error_code unremoved;
        if (name.ends_with(ending))
            fs::remove(entry.path(), unremoved);
    }
}

} // namespace host

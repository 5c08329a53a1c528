#include "app_assist/WUiTimer.h"

#include <cmath>

#define LOG_TAG "app-assist"
#include "base/Log.h"

namespace app_assist {

WUiTimer::WUiTimer(const Function& function, void* data) : _function(function), _data(data) {}

WUiTimer::~WUiTimer() {
    if (_timer != nullptr) {
        ecore_timer_del(_timer);
    }
}

WWeakPtr<WUiTimer> WUiTimer::addTimer(double interval, const Function& function, void* data) {
    if (!std::isfinite(interval) || interval <= 0 || !function) {
        LOG_ERROR("A timer needs a function and an interval above 0, not %f", interval);
        return {};
    }
    auto* const timer = new WUiTimer(function, data);
    timer->_timer = ecore_timer_add(interval, _timerCb, timer);
    if (timer->_timer == nullptr) {
        LOG_ERROR("No timer of %f s", interval);
        delete timer;
        return {};
    }
    return {timer, *timer->_life};
}

void WUiTimer::destroy(const WWeakPtr<WUiTimer>& timer) {
    WUiTimer* const self = timer.get();
    if (self == nullptr) {
        return;
    }
    if (self->_firing) {
        self->_life.reset();
    } else {
        delete self;
    }
}

Eina_Bool WUiTimer::_timerCb(void* data) {
    auto* const self = static_cast<WUiTimer*>(data);
    self->_firing = true;
    const bool again = self->_function(self->_data);
    self->_firing = false;
    if (again && self->_life) {
        return ECORE_CALLBACK_RENEW;
    }
    self->_timer = nullptr;
    delete self;
    return ECORE_CALLBACK_CANCEL;
}

} // namespace app_assist

#include "app_assist/WDeferredDeletion.h"

#include <algorithm>
#include <vector>

#include <Ecore.h>

#include "app_assist/WViewController.h"

namespace app_assist {

namespace {

struct Queue {
    std::vector<WViewController*> waiting;
    Ecore_Job* job = nullptr;
};

Queue& queue() {
    static Queue instance;
    return instance;
}

void disarm() {
    if (queue().job != nullptr) {
        ecore_job_del(queue().job);
        queue().job = nullptr;
    }
}

void jobCb(void* /*data*/) {
    queue().job = nullptr;
    WDeferredDeletion::flush();
}

} // namespace

void WDeferredDeletion::add(WViewController* controller) {
    queue().waiting.push_back(controller);
    if (queue().job == nullptr) {
        queue().job = ecore_job_add(jobCb, nullptr);
    }
}

void WDeferredDeletion::finishNow(WViewController* controller) {
    forget(controller);
    controller->_dying = true;
    controller->finish();
}

void WDeferredDeletion::forget(const WViewController* controller) {
    std::erase(queue().waiting, controller);
    if (queue().waiting.empty()) {
        disarm();
    }
}

void WDeferredDeletion::flush() {
    auto& waiting = queue().waiting;
    while (!waiting.empty()) {
        WViewController* const controller = waiting.front();
        waiting.erase(waiting.begin());
        controller->finish();
    }
    disarm();
}

} // namespace app_assist

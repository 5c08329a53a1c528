#include "app_assist/WWindowController.h"

#include <utility>

#include <Ecore_Evas.h>
#include <Elementary.h>

#include "app_assist/WDeferredDeletion.h"

#define LOG_TAG "app-assist"
#include "base/Log.h"

namespace app_assist {

namespace {

constexpr const char* WINDOW_KEY = "app_assist.window";

} // namespace

WWindowController::WWindowController(std::string name, int width, int height)
    : _name(std::move(name)), _width(width), _height(height) {
    _ownedByApplication = true;
    _detach = [this] {
        finishBase();
    };
}

WWindowController::~WWindowController() {
    finishPopups();
    finishBase();
    deleteView();
    // With the window the loop's last turn may have passed: nobody else ends those that wait.
    WDeferredDeletion::flush();
}

void WWindowController::finishBase() {
    if (_base) {
        WDeferredDeletion::finishNow(_base.get());
    }
}

WWindowController* WWindowController::ofCanvas(const Evas* canvas) {
    const Ecore_Evas* const ee = ecore_evas_ecore_evas_get(canvas);
    return ee == nullptr ? nullptr
                         : static_cast<WWindowController*>(ecore_evas_data_get(ee, WINDOW_KEY));
}

void WWindowController::setBaseController(WViewController* controller) {
    if (controller == nullptr || controller->_attached || controller == this) {
        LOG_ERROR("A window needs a controller that nobody else owns");
        return;
    }
    controller->_attached = true;
    if (_base) {
        _base->destroy();
    }
    _base = controller->getWeakPtr();
    Evas_Object* const window = getEvasObj();
    if (window == nullptr || (!controller->_created && !controller->create(window, nullptr)) ||
        controller->getEvasObj() == nullptr) {
        LOG_ERROR("%s cannot fill the window", controller->getClassName());
        controller->destroy();
        return;
    }
    Evas_Object* const view = controller->getEvasObj();
    evas_object_size_hint_weight_set(view, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_set(view, EVAS_HINT_FILL, EVAS_HINT_FILL);
    elm_win_resize_object_add(window, view);
    evas_object_show(view);
}

Evas_Object* WWindowController::onCreateView(Evas_Object* /*parent*/, void* /*param*/) {
    Evas_Object* const window = elm_win_util_standard_add(_name.c_str(), _name.c_str());
    if (window == nullptr) {
        LOG_ERROR("No window");
        return nullptr;
    }
    Ecore_Evas* const ee = ecore_evas_ecore_evas_get(evas_object_evas_get(window));
    ecore_evas_data_set(ee, WINDOW_KEY, this);
    evas_object_resize(window, _width, _height);
    evas_object_show(window);
    return window;
}

} // namespace app_assist

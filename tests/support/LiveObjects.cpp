#include "support/LiveObjects.h"

#include <cstdio>
#include <cstdlib>

#include <dlfcn.h>

// The library calls its own constructors and destructors through the dynamic linker. Defining them
// here lets tests count objects without a counter in the product.

namespace {

int controllers = 0;
int timers = 0;

template <class... Arguments>
void forward(const char* symbol, Arguments... arguments) {
    void* const address = dlsym(RTLD_NEXT, symbol);
    if (address == nullptr) {
        std::fprintf(stderr, "the framework has no %s\n", symbol);
        std::abort();
    }
    reinterpret_cast<void (*)(Arguments...)>(address)(arguments...);
}

} // namespace

// NOLINTBEGIN(bugprone-reserved-identifier): these are the names that the compiler gives.
#define INTERPOSED extern "C" __attribute__((visibility("default")))

#define COUNT_CONSTRUCTOR(symbol, counter)                                                         \
    INTERPOSED void symbol(void* self, const void* a, void* b);                                    \
    INTERPOSED void symbol(void* self, const void* a, void* b) {                                   \
        ++(counter);                                                                               \
        forward(#symbol, self, a, b);                                                              \
    }
#define COUNT_DESTRUCTOR(symbol, counter)                                                          \
    INTERPOSED void symbol(void* self);                                                            \
    INTERPOSED void symbol(void* self) {                                                           \
        --(counter);                                                                               \
        forward(#symbol, self);                                                                    \
    }

COUNT_CONSTRUCTOR(_ZN10app_assist15WViewControllerC1Ev, controllers)
COUNT_CONSTRUCTOR(_ZN10app_assist15WViewControllerC2Ev, controllers)
COUNT_DESTRUCTOR(_ZN10app_assist15WViewControllerD1Ev, controllers)
COUNT_DESTRUCTOR(_ZN10app_assist15WViewControllerD2Ev, controllers)
COUNT_CONSTRUCTOR(_ZN10app_assist8WUiTimerC1ERKSt8functionIFbPvEES2_, timers)
COUNT_CONSTRUCTOR(_ZN10app_assist8WUiTimerC2ERKSt8functionIFbPvEES2_, timers)
COUNT_DESTRUCTOR(_ZN10app_assist8WUiTimerD1Ev, timers)
COUNT_DESTRUCTOR(_ZN10app_assist8WUiTimerD2Ev, timers)
// NOLINTEND(bugprone-reserved-identifier)

int liveControllers() {
    return controllers;
}
int liveTimers() {
    return timers;
}

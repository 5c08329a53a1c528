// The guard of callbacks against a missing owner.
#pragma once

#include <base/Log.h>

// Logs under the name of the callback itself, so it has to be a macro.
#define RETURN_IF_NULL(data, ...)                                                                  \
    do {                                                                                           \
        if ((data) == nullptr) {                                                                   \
            LOG_ERROR("Data is NULL !!");                                                          \
            return __VA_ARGS__;                                                                    \
        }                                                                                          \
    } while (false)

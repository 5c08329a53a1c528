/**
 * @file
 * @brief What the fakes of the device's functions have in common: how calls read, and the way on.
 */
#pragma once

#include <cstdio>
#include <cstdlib>
#include <string>

#include <Evas.h>
#include <dlfcn.h>

namespace fakes {

/** A text in quotes. */
inline std::string quoted(const char* text) {
    return text ? '"' + std::string(text) + '"' : std::string("null");
}

/** The type of an object. */
inline std::string typeOf(const Evas_Object* object) {
    const char* type = object ? evas_object_type_get(object) : nullptr;
    return type ? type : "null";
}

/** The function of the same name in the library behind the test executable. */
template <typename Function>
Function* real(const char* name) {
    // Only a caller inside the executable has the libraries behind it.
    void* address = dlsym(RTLD_NEXT, name);
    if (!address) {
        std::fprintf(stderr, "no library defines %s\n", name);
        std::abort();
    }
    return reinterpret_cast<Function*>(address);
}

} // namespace fakes

#include <string>

#include <dlfcn.h>

#include <Ecore_File.h>

#include "ToneFolder.h"
#include "device/export.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

// The device's tones are elsewhere on this machine. This function comes before the toolkit's own:
// it looks for them there and hands every other path on.

extern "C" DEVICE_API Eina_Bool ecore_file_exists(const char* file) {
    static auto* const stock =
        reinterpret_cast<decltype(&ecore_file_exists)>(dlsym(RTLD_NEXT, "ecore_file_exists"));
    if (!stock) {
        LOG_ERROR("The toolkit has no such function");
        return EINA_FALSE;
    }
    return stock(file ? host::pathHere(file).c_str() : nullptr);
}

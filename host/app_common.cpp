#include "device/app_common.h"

#include <cstring>

#include "Folders.h"

char* app_get_data_path(void) {
    return strdup((host::folders().data + "/").c_str());
}

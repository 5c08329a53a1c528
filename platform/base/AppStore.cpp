#include "base/AppStore.h"

#include <cstdlib>
#include <memory>

#include "device/app_common.h"

// Under the name of the library that opens the store.
#define LOG_TAG tag
#include "base/Log.h"

namespace base {

std::string appDataPath(const char* fileName, const char* tag) {
    const std::unique_ptr<char, decltype(&std::free)> folder(app_get_data_path(), &std::free);
    if (!folder) {
        LOG_ERROR("app_get_data_path() is NULL !!");
        return {};
    }
    return std::string(folder.get()) + fileName;
}

bool openAppStore(SqliteDatabase& database, const char* owner,
                  const std::vector<std::string>& migrations, const char* tag) {
    const bool opened = database.open(owner, migrations);
    if (!database.quarantinePath().empty())
        LOG_ERROR("%s was damaged, it is kept as %s", database.path().c_str(),
                  database.quarantinePath().c_str());
    return opened;
}

} // namespace base

/**
 * @file
 * @brief Tells on the main loop which files of some folders have changed, whoever changed them.
 */
#pragma once

#include <functional>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include <Ecore.h>

namespace host {

/** Watches folders with inotify. It may be destroyed from inside its callback. */
class FolderWatch {
public:
    /** Receives the name of a changed file, or an empty name when any file may have changed. */
    using Changed = std::function<void(const std::string& fileName)>;

    explicit FolderWatch(Changed changed);
    ~FolderWatch();
    FolderWatch(const FolderWatch&) = delete;
    FolderWatch& operator=(const FolderWatch&) = delete;

    /**
     * @brief Watches a folder, which is created when it is missing.
     * @param more Events of inotify to be told of besides files that were written or deleted.
     * @return 0 or an errno.
     */
    int add(const std::string& folder, unsigned more = 0);

    /** @brief Tells of all changes up to now, without waiting for the main loop. */
    void deliver();

private:
    static Eina_Bool _readableCb(void* data, Ecore_Fd_Handler* handler);
    std::vector<std::string> readChanges();
    void watchAgain(int watch);

    Changed _changed;
    int _inotify = -1;
    Ecore_Fd_Handler* _handler = nullptr;
    struct Watched {
        std::string folder;
        unsigned more = 0;
    };
    std::map<int, Watched> _folders;
    std::shared_ptr<bool> _alive = std::make_shared<bool>(true);
};

} // namespace host

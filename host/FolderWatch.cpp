#include "FolderWatch.h"

#include <cerrno>
#include <cstring>
#include <utility>

#include <sys/inotify.h>
#include <unistd.h>

#include "Folders.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace host {

namespace {

constexpr auto changes = IN_MOVED_TO | IN_CLOSE_WRITE | IN_DELETE | IN_ONLYDIR;

} // namespace

FolderWatch::FolderWatch(Changed changed) : _changed(std::move(changed)) {
    ecore_init();
    _inotify = inotify_init1(IN_NONBLOCK | IN_CLOEXEC);
    if (_inotify >= 0)
        _handler =
            ecore_main_fd_handler_add(_inotify, ECORE_FD_READ, _readableCb, this, nullptr, nullptr);
}

FolderWatch::~FolderWatch() {
    *_alive = false;
    if (_handler)
        ecore_main_fd_handler_del(_handler);
    if (_inotify >= 0)
        close(_inotify);
    ecore_shutdown();
}

int FolderWatch::add(const std::string& folder, unsigned more) {
    if (!_handler)
        return EMFILE;
    if (const int problem = createFolder(folder))
        return problem;
    const int watch = inotify_add_watch(_inotify, folder.c_str(), changes | more);
    if (watch < 0)
        return errno;
    _folders[watch] = {folder, more};
    return 0;
}

void FolderWatch::watchAgain(int watch) {
    const auto found = _folders.find(watch);
    if (found == _folders.end())
        return;
    const Watched watched = found->second;
    _folders.erase(found);
    if (const int problem = add(watched.folder, watched.more))
        LOG_ERROR("Changes in %s go unseen: %s", watched.folder.c_str(), std::strerror(problem));
}

std::vector<std::string> FolderWatch::readChanges() {
    std::vector<std::string> names;
    alignas(inotify_event) char buffer[16 * 1024];
    for (ssize_t size = 0; (size = read(_inotify, buffer, sizeof buffer)) > 0;) {
        for (ssize_t at = 0; at < size;) {
            const auto* event = reinterpret_cast<const inotify_event*>(buffer + at);
            at += static_cast<ssize_t>(sizeof(inotify_event)) + event->len;
            if (event->mask & IN_IGNORED)
                watchAgain(event->wd);
            if (event->mask & (IN_IGNORED | IN_Q_OVERFLOW))
                names.emplace_back();
            else if (event->len > 0)
                names.emplace_back(event->name);
        }
    }
    return names;
}

void FolderWatch::deliver() {
    // Copies: the callback may destroy the watch.
    const auto alive = _alive;
    const auto changed = _changed;
    for (const std::string& name : readChanges()) {
        changed(name);
        if (!*alive)
            break;
    }
}

Eina_Bool FolderWatch::_readableCb(void* data, Ecore_Fd_Handler* /*handler*/) {
    auto* self = static_cast<FolderWatch*>(data);
    if (!self) {
        LOG_ERROR("Data is NULL !!");
        return ECORE_CALLBACK_CANCEL;
    }
    self->deliver();
    return ECORE_CALLBACK_RENEW;
}

} // namespace host

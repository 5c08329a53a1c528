#include "WatchProcess.h"

#include <array>
#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <utility>

#include <sys/socket.h>
#include <sys/wait.h>
#include <unistd.h>

namespace simulator {

WatchProcess::WatchProcess(const Options& options, int (*runWatch)(const Options& options)) {
    std::array<int, 2> ends{-1, -1};
    if (socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends.data()) != 0)
        return;
    std::fflush(nullptr);
    _process = fork();
    if (_process == 0) {
        close(ends[0]);
        Options watch = options;
        watch.channel = ends[1];
        const int status = runWatch(watch);
        std::fflush(nullptr);
        // What the parent set up for its own end is not this process's to undo.
        _exit(status);
    }
    close(ends[1]);
    _channel = ends[0];
}

WatchProcess::~WatchProcess() {
    end();
}

std::string WatchProcess::waitForFolder() const {
    std::string folder;
    while (!folder.ends_with('\n')) {
        std::array<char, 256> bytes{};
        const ssize_t size = recv(_channel, bytes.data(), bytes.size(), 0);
        if (size < 0 && errno == EINTR)
            continue;
        if (size <= 0)
            return "";
        folder.append(bytes.data(), static_cast<std::size_t>(size));
    }
    folder.pop_back();
    return folder;
}

int WatchProcess::end() {
    if (_channel >= 0)
        close(std::exchange(_channel, -1));
    if (_process < 0)
        return EXIT_FAILURE;
    int status = 0;
    while (waitpid(_process, &status, 0) < 0 && errno == EINTR) {
    }
    _process = -1;
    constexpr int KILLED = 128;
    return WIFEXITED(status) ? WEXITSTATUS(status) : KILLED + WTERMSIG(status);
}

} // namespace simulator

#include "SoundFile.h"

#include <cerrno>
#include <utility>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace host {

namespace {

int refusalOf(int descriptor) {
    struct stat status {};
    if (fstat(descriptor, &status) != 0)
        return errno;
    if (S_ISDIR(status.st_mode))
        return EISDIR;
    return S_ISREG(status.st_mode) ? 0 : EINVAL;
}

} // namespace

SoundFile::SoundFile(const std::string& path) {
    // Opening a pipe would wait for somebody who writes into it.
    _descriptor = open(path.c_str(), O_RDONLY | O_NONBLOCK | O_NOCTTY | O_CLOEXEC);
    _problem = _descriptor < 0 ? errno : refusalOf(_descriptor);
    if (_descriptor >= 0 && _problem != 0) {
        close(_descriptor);
        _descriptor = -1;
    }
}

SoundFile::~SoundFile() {
    if (_descriptor >= 0)
        close(_descriptor);
}

int SoundFile::release() {
    return std::exchange(_descriptor, -1);
}

} // namespace host

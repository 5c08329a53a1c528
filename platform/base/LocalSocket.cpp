#include "base/LocalSocket.h"

#include <cerrno>

#include <fcntl.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>

namespace base {

namespace {

/** A descriptor that is closed at the end of its scope, unless it is taken. */
class Descriptor {
public:
    explicit Descriptor(int number) : _number(number) {}
    ~Descriptor() {
        if (_number >= 0)
            close(_number);
    }
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;

    int number() const { return _number; }
    int take() {
        const int number = _number;
        _number = -1;
        return number;
    }

private:
    int _number;
};

/** An address has room for a hundred characters only: the open folder gives it a short name. */
bool makeAddress(int folder, const std::string& name, sockaddr_un& address) {
    const std::string path = "/proc/self/fd/" + std::to_string(folder) + "/" + name;
    if (path.size() >= sizeof address.sun_path)
        return false;
    address.sun_family = AF_UNIX;
    path.copy(address.sun_path, path.size());
    return true;
}

template <typename Use>
int withAddress(const std::string& folder, const std::string& name, int flags, Use&& use) {
    const Descriptor directory(open(folder.c_str(), O_PATH | O_DIRECTORY | O_CLOEXEC));
    if (directory.number() < 0)
        return -errno;
    sockaddr_un address{};
    if (!makeAddress(directory.number(), name, address))
        return -ENAMETOOLONG;
    Descriptor channel(socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | flags, 0));
    if (channel.number() < 0 || !use(channel.number(), reinterpret_cast<const sockaddr*>(&address)))
        return -errno;
    return channel.take();
}

} // namespace

int listenAt(const std::string& folder, const std::string& name) {
    constexpr int WAITING = 16;
    return withAddress(folder, name, SOCK_NONBLOCK, [](int channel, const sockaddr* address) {
        return bind(channel, address, sizeof(sockaddr_un)) == 0 && listen(channel, WAITING) == 0;
    });
}

int connectTo(const std::string& folder, const std::string& name) {
    return withAddress(folder, name, 0, [](int channel, const sockaddr* address) {
        return connect(channel, address, sizeof(sockaddr_un)) == 0;
    });
}

} // namespace base

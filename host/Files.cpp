#include "Files.h"

#include <cctype>
#include <cerrno>
#include <chrono>
#include <cstdlib>
#include <filesystem>

#include <fcntl.h>
#include <limits.h>
#include <sys/stat.h>
#include <unistd.h>

namespace fs = std::filesystem;

namespace host {

namespace {

constexpr std::string_view temporaryPrefix = ".new-";
constexpr std::string_view hexDigits = "0123456789ABCDEF";

class Descriptor {
public:
    explicit Descriptor(int descriptor) : _descriptor(descriptor) {}
    ~Descriptor() {
        if (_descriptor >= 0)
            ::close(_descriptor);
    }
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;

    int get() const { return _descriptor; }
    /** Some file systems report a failed write only here. */
    int close() {
        const int result = ::close(_descriptor) == 0 ? 0 : errno;
        _descriptor = -1;
        return result;
    }

private:
    int _descriptor;
};

bool isPlain(char letter) {
    return std::isalnum(static_cast<unsigned char>(letter)) || letter == '_' || letter == '-' ||
           letter == '.';
}

int writeAll(int file, std::string_view contents) {
    while (!contents.empty()) {
        const ssize_t written = write(file, contents.data(), contents.size());
        if (written < 0 && errno != EINTR)
            return errno;
        if (written > 0)
            contents.remove_prefix(static_cast<std::size_t>(written));
    }
    return 0;
}

int writeTemporary(std::string& path, std::string_view contents) {
    Descriptor file(mkostemp(path.data(), O_CLOEXEC));
    if (file.get() < 0)
        return errno;
    int problem = writeAll(file.get(), contents);
    if (problem == 0 && fsync(file.get()) != 0)
        problem = errno;
    const int closed = file.close();
    return problem == 0 ? closed : problem;
}

void flushFolder(const std::string& folder) {
    const Descriptor opened(open(folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
    if (opened.get() >= 0)
        fsync(opened.get());
}

} // namespace

std::optional<std::string> fileNameFor(std::string_view name) {
    std::string fileName;
    for (const char letter : name) {
        const bool leadingDot = letter == '.' && fileName.empty();
        if (isPlain(letter) && !leadingDot) {
            fileName += letter;
            continue;
        }
        const auto byte = static_cast<unsigned char>(letter);
        fileName += {'%', hexDigits[byte >> 4], hexDigits[byte & 15]};
    }
    if (fileName.empty() || fileName.size() > NAME_MAX)
        return std::nullopt;
    return fileName;
}

std::optional<std::string> nameOfFile(std::string_view fileName) {
    std::string name;
    for (std::size_t at = 0; at < fileName.size(); ++at) {
        if (fileName[at] != '%') {
            name += fileName[at];
            continue;
        }
        if (at + 2 >= fileName.size())
            return std::nullopt;
        const auto high = hexDigits.find(fileName[at + 1]);
        const auto low = hexDigits.find(fileName[at + 2]);
        if (high == std::string_view::npos || low == std::string_view::npos)
            return std::nullopt;
        name += static_cast<char>(high << 4 | low);
        at += 2;
    }
    return fileNameFor(name) == std::string(fileName) ? std::optional(name) : std::nullopt;
}

int replaceFile(const std::string& folder, const std::string& fileName, std::string_view contents) {
    std::string temporary = folder + "/" + std::string(temporaryPrefix) + "XXXXXX";
    int problem = writeTemporary(temporary, contents);
    if (problem == 0 && rename(temporary.c_str(), (folder + "/" + fileName).c_str()) != 0)
        problem = errno;
    if (problem != 0) {
        unlink(temporary.c_str());
        return problem;
    }
    flushFolder(folder);
    return 0;
}

int readFile(const std::string& path, std::size_t limit, std::string& contents) {
    // Non-blocking: a named pipe in the file's place must not stop the program.
    const Descriptor file(open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK));
    if (file.get() < 0)
        return errno;
    struct stat status {};
    if (fstat(file.get(), &status) != 0)
        return errno;
    if (S_ISDIR(status.st_mode))
        return EISDIR;
    if (!S_ISREG(status.st_mode))
        return EINVAL;
    contents.clear();
    char buffer[4096];
    for (;;) {
        const ssize_t count = read(file.get(), buffer, sizeof buffer);
        if (count == 0)
            return 0;
        if (count < 0 && errno != EINTR)
            return errno;
        if (count > 0)
            contents.append(buffer, static_cast<std::size_t>(count));
        if (contents.size() > limit)
            return EFBIG;
    }
}

void removeLeftovers(const std::string& folder) {
    // A minute: no living writer takes that long.
    const auto oldest = fs::file_time_type::clock::now() - std::chrono::minutes(1);
    std::error_code problem;
    for (fs::directory_iterator entry(folder, problem), end; !problem && entry != end;
         entry.increment(problem)) {
        std::error_code ignored;
        if (entry->path().filename().string().starts_with(temporaryPrefix) &&
            entry->last_write_time(ignored) < oldest)
            fs::remove(entry->path(), ignored);
    }
}

} // namespace host

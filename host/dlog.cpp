#include "device/dlog.h"

#include <cerrno>
#include <cstdarg>
#include <cstdio>
#include <mutex>
#include <string>
#include <utility>

#include <unistd.h>

#include "device_host.h"

namespace {

struct Listener {
    device_host_log_cb callback = nullptr;
    void* data = nullptr;
};

std::mutex& listenerMutex() {
    // Never destroyed: threads may log until the process ends.
    static auto* const mutex = new std::mutex;
    return *mutex;
}

Listener listener;

/** The formatted text, or nothing to print when the format cannot be followed. */
bool format(std::string& text, const char* format, va_list arguments) {
    va_list again;
    va_copy(again, arguments);
    const int length = std::vsnprintf(nullptr, 0, format, arguments);
    if (length >= 0) {
        text.resize(static_cast<std::size_t>(length) + 1);
        std::vsnprintf(text.data(), text.size(), format, again);
        text.resize(static_cast<std::size_t>(length));
    }
    va_end(again);
    return length >= 0;
}

void removeColours(std::string& text) {
    for (auto start = text.find("\033["); start != std::string::npos;
         start = text.find("\033[", start)) {
        const auto end = text.find_first_not_of("0123456789;", start + 2);
        if (end != std::string::npos && text[end] == 'm')
            text.erase(start, end - start + 1);
        else
            start += 2;
    }
}

/** A name typed by a person must not look like a line of its own. */
void keepOnOneLine(std::string& text) {
    for (char& letter : text) {
        if (letter == '\n' || letter == '\r')
            letter = ' ';
    }
}

void tellListener(int priority, const char* tag, std::string message) {
    // What a listener logs is not told to it again.
    thread_local bool telling = false;
    if (std::exchange(telling, true))
        return;
    removeColours(message);
    keepOnOneLine(message);
    {
        const std::scoped_lock lock(listenerMutex());
        if (listener.callback)
            listener.callback(priority, tag, message.c_str(), listener.data);
    }
    telling = false;
}

} // namespace

void device_host_set_log_callback(device_host_log_cb callback, void* data) {
    const std::scoped_lock lock(listenerMutex());
    listener = {callback, data};
}

int __dlog_print(log_id_t /*id*/, int priority, const char* tag, const char* format, ...) {
    if (!tag || !format)
        return -1;
    const int savedError = errno;
    std::string message;
    va_list arguments;
    va_start(arguments, format);
    const bool formatted = ::format(message, format, arguments);
    va_end(arguments);
    if (!formatted)
        return -1;
    std::string line = std::string(tag) + " " + message;
    if (!isatty(STDERR_FILENO))
        removeColours(line);
    keepOnOneLine(line);
    line += '\n';
    // One write: lines of several processes do not mix. Whoever is told finds it written.
    const ssize_t written = write(STDERR_FILENO, line.data(), line.size());
    tellListener(priority, tag, message);
    errno = savedError;
    return written < 0 ? -1 : static_cast<int>(written);
}

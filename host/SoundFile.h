/**
 * @file
 * @brief Opens files that others name, without ever waiting for one.
 */
#pragma once

#include <string>

namespace host {

/** A file that is open for reading, or why it is not. */
class SoundFile {
public:
    /** Opens a regular file; a pipe, a device or a folder is refused. */
    explicit SoundFile(const std::string& path);
    ~SoundFile();
    SoundFile(const SoundFile&) = delete;
    SoundFile& operator=(const SoundFile&) = delete;

    /** The open file, -1 for none. */
    int descriptor() const { return _descriptor; }
    /** The open file, now the caller's to close. */
    int release();
    /** 0 or an errno. */
    int problem() const { return _problem; }

private:
    int _descriptor = -1;
    int _problem = 0;
};

} // namespace host

#pragma once

#include "Value.h"

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <span>
#include <string>

namespace orvex {

// A regular file, open for reading. Anything else is refused: a pipe may never get a writer, and a device may
// never end.
class RegularFile {
public:
    explicit RegularFile(const std::string& path);
    ~RegularFile();
    RegularFile(const RegularFile&) = delete;
    RegularFile& operator=(const RegularFile&) = delete;

    // Why the file cannot be read, without its path. Empty if there is no error.
    const std::string& error() const { return _error; }
    std::uint64_t size() const { return _size; }
    // Fills the buffer from the offset on. Returns the number of bytes read, short only at the end of the
    // file or after an error.
    std::size_t readAt(std::uint64_t place, std::span<std::uint8_t> buffer);
    // A stream of the whole file, which the caller closes. Null after an error.
    std::FILE* openStream();

private:
    void fail();

    int _descriptor;
    std::uint64_t _size = 0;
    std::string _error;
};

struct FileContent {
    Bytes bytes;
    std::string error; // as in RegularFile; empty if the whole file was read
};

// Reads the whole file, but never more than the limit; a longer file is an error.
FileContent readFile(const std::string& path, std::size_t limit);

} // namespace orvex

#pragma once

#include "MessagePort.h"

#include <string>

namespace orvex::fuzz {

// A file in memory for code that takes a path. Destroyed with the object.
class MemoryFile {
public:
    explicit MemoryFile(ByteView content = {});
    ~MemoryFile();
    MemoryFile(const MemoryFile&) = delete;
    MemoryFile& operator=(const MemoryFile&) = delete;

    const std::string& path() const { return _path; }

private:
    int _descriptor;
    std::string _path;
};

} // namespace orvex::fuzz

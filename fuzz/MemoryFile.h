#pragma once

#include "MessagePort.h"

#include <string>

namespace orvex::fuzz {

// A file without a disk, for readers and writers that want a path. It goes when the object goes.
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

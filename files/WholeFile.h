#pragma once

#include "OutputFile.h"

#include <optional>
#include <ostream>
#include <string>
#include <vector>

namespace orvex {

// A file that appears under its name once it is whole. Until then it is written beside that name, with mode
// 0600; without commit() nothing of it is left, and a file that was there before stays.
//
// Devices, pipes and streams such as /dev/stdout are written in place. Files and links of other users are
// refused as by openOutputFile().
class WholeFile {
public:
    explicit WholeFile(const std::string& path);
    ~WholeFile();
    WholeFile(const WholeFile&) = delete;
    WholeFile& operator=(const WholeFile&) = delete;

    // Why the file could not be created, without the path; empty if it could.
    const std::string& error() const { return _error; }
    // There unless the file could not be created.
    std::ostream& stream() { return *_stream; }
    // Gives the file its name. Returns why not everything reached it; empty if it did.
    std::string commit();

private:
    void createBeside(const std::string& target);

    std::string _target;
    std::string _temporary; // empty while there is none
    std::string _error;
    std::vector<char> _storage; // of the file's buffer, which it outlives
    FilePointer _file;
    std::optional<FileBuffer> _buffer;
    std::optional<std::ostream> _stream;
};

} // namespace orvex

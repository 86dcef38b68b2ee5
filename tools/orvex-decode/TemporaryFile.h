#pragma once

#include "OutputFile.h"

#include <optional>
#include <stdexcept>
#include <string>

namespace orvex {

// A file without a name, gone when nobody has it open any more. A worker process writes into it what its
// parent reads afterwards.
class TemporaryFile {
public:
    struct Failure : std::runtime_error {
        using std::runtime_error::runtime_error;
    };

    // In $TMPDIR, else in /tmp. Throws Failure, with one line for the user.
    TemporaryFile();

    // Makes it what the descriptor, of standard output say, leads to.
    void takePlaceOf(int descriptor) const;
    // A path under which this process and its children can open it.
    std::string path() const;

    std::string contents() const;
    // The number of bytes; none when the stream could not be written.
    std::optional<std::size_t> appendTo(std::FILE* stream) const;
    std::FILE* stream() const { return _file.get(); }

private:
    FilePointer _file;
};

} // namespace orvex

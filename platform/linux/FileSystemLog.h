#pragma once

#include "OutputFile.h"
#include "SystemLog.h"

#include <string>

namespace orvex {

// A log that keeps every line, in a file of lines of the form "<PRIORITY>TEXT". Buffered, and written by
// whoever logs.
class FileSystemLog final : public SystemLog {
public:
    // Replaces a file that is there.
    explicit FileSystemLog(const std::string& path);
    ~FileSystemLog() override;
    FileSystemLog(const FileSystemLog&) = delete;
    FileSystemLog& operator=(const FileSystemLog&) = delete;

    void write(Priority priority, std::string_view line) override;
    void flush() override;

    // Why the file could not be opened or written; empty while all is well. Ask after flush().
    const std::string& error() const { return _error; }

private:
    void writePending();
    void fail();

    std::string _path;
    FilePointer _file;
    std::string _error;
    std::string _pending; // lines to be written; keeps its storage
};

} // namespace orvex

#pragma once

#include "SystemLog.h"

#include <cstdio>
#include <memory>
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
    struct Close {
        void operator()(std::FILE* file) const
        {
            std::fclose(file);
        } // NOLINT(cppcoreguidelines-owning-memory)
    };

    void writePending();
    void fail();

    std::string _path;
    std::unique_ptr<std::FILE, Close> _file;
    std::string _error;
    std::string _pending; // lines to be written; keeps its storage
};

} // namespace orvex

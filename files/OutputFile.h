#pragma once

#include <cerrno>
#include <cstdio>
#include <memory>
#include <streambuf>
#include <string>

namespace orvex {

struct CloseFile {
    void operator()(std::FILE* file) const { std::fclose(file); } // NOLINT(cppcoreguidelines-owning-memory)
};
using FilePointer = std::unique_ptr<std::FILE, CloseFile>;

struct OutputFile {
    FilePointer file;  // null after an error
    std::string error; // why, without the path
};

// Opens an empty file for writing. Its mode is 0600 because it may identify a subscriber; an existing file is
// truncated and gets that mode too, unless it is reached through /dev/stdout and the like. Files and links
// owned by other users, except root, are refused: in a shared directory anyone could have planted them.
OutputFile openOutputFile(const std::string& path);

enum class FollowedLinks { all, trusted }; // trusted: those of this user and root

// Where a path leads through links. The target need not exist.
struct LinkEnd {
    std::string path;
    bool isOpenFile = false; // a link such as /proc/self/fd/1, whose text may not name the file
    std::string error;       // why a link was not followed
};
LinkEnd followLinks(const std::string& path, FollowedLinks links);

// Closes the file. Returns an error if not everything reached it, else an empty text.
std::string closeOutputFile(FilePointer file);

// Stream buffer over a file it does not own.
class FileBuffer final : public std::streambuf {
public:
    explicit FileBuffer(std::FILE& file)
        : _file(file)
    {
    }

    // The errno of the first write that failed; 0 if none did.
    int error() const { return _error; }

protected:
    std::streamsize xsputn(const char* text, std::streamsize length) override
    {
        const std::size_t written = std::fwrite(text, 1, static_cast<std::size_t>(length), &_file);
        noteError(written == static_cast<std::size_t>(length));
        return static_cast<std::streamsize>(written);
    }
    int overflow(int character) override
    {
        const int written = std::fputc(character, &_file);
        noteError(written != EOF);
        return written;
    }
    int sync() override
    {
        const int status = std::fflush(&_file);
        noteError(status == 0);
        return status;
    }

private:
    void noteError(bool isGood)
    {
        if (!isGood && _error == 0)
            _error = errno;
    }

    std::FILE& _file;
    int _error = 0;
};

} // namespace orvex

#pragma once

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

// Opens an empty file for writing, readable by its owner only because it may name a subscriber. An existing
// file is emptied and gets mode 0600, unless it is reached through /dev/stdout and the like, whose mode the
// user chose. Files and links of other users except root are refused: in a shared directory anybody can put
// one there.
OutputFile openOutputFile(const std::string& path);

enum class FollowedLinks { all, trusted }; // trusted: those of this user and root

// Where a path leads through links; a file need not exist there.
struct LinkEnd {
    std::string path;
    bool isOpenFile = false; // still a link such as /proc/self/fd/1, whose text need not name the file
    std::string error;       // why the links were not followed to their end
};
LinkEnd followLinks(const std::string& path, FollowedLinks links);

// Closes the file. Returns why it does not hold all that was written to it; empty when it does.
std::string closeOutputFile(FilePointer file);

// Lets an output stream write to a file that it does not own.
class FileBuffer final : public std::streambuf {
public:
    explicit FileBuffer(std::FILE& file)
        : _file(file)
    {
    }

protected:
    std::streamsize xsputn(const char* text, std::streamsize length) override
    {
        return static_cast<std::streamsize>(std::fwrite(text, 1, static_cast<std::size_t>(length), &_file));
    }
    int overflow(int character) override { return std::fputc(character, &_file); }
    int sync() override { return std::fflush(&_file); }

private:
    std::FILE& _file;
};

} // namespace orvex

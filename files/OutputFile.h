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

// Opens a file for writing, from its beginning, readable by its owner only: what is written may name a
// subscriber. An existing file is emptied and gets mode 0600, unless it is reached through /dev/stdout and
// the like, whose mode the user chose. A file of another user is refused, and so is a link of another user,
// root excepted: in a shared directory anybody can put one there.
OutputFile openOutputFile(const std::string& path);

// Closes the file. Returns why it does not hold all that was written to it; empty when it does.
std::string closeOutputFile(FilePointer file);

// Lets an output stream write to a file, which stays its owner's.
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

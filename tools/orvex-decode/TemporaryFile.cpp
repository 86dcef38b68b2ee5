#include "TemporaryFile.h"

#include <array>
#include <cerrno>
#include <cstdlib>
#include <cstring>

#include <fcntl.h>
#include <unistd.h>

namespace orvex {

namespace {
using Chunk = std::array<char, 65536>;
} // namespace

TemporaryFile::TemporaryFile()
{
    const char* const chosen = std::getenv("TMPDIR");
    const std::string directory = chosen && *chosen ? chosen : "/tmp";
    std::string name = directory + "/orvex-decode-XXXXXX";
    const int descriptor = ::mkostemp(name.data(), O_CLOEXEC);
    if (descriptor >= 0) {
        ::unlink(name.c_str());
        _file.reset(::fdopen(descriptor, "w+b"));
    }
    if (!_file)
        throw Failure("no temporary file in " + directory + ": "
            + std::strerror(errno)); // NOLINT(concurrency-mt-unsafe)
}

void TemporaryFile::takePlaceOf(int descriptor) const
{
    dup2(fileno(_file.get()), descriptor);
}

std::string TemporaryFile::path() const
{
    return "/dev/fd/" + std::to_string(fileno(_file.get()));
}

std::string TemporaryFile::contents() const
{
    std::string result;
    Chunk chunk;
    std::rewind(_file.get());
    while (const std::size_t length = std::fread(chunk.data(), 1, chunk.size(), _file.get()))
        result.append(chunk.data(), length);
    return result;
}

std::optional<std::size_t> TemporaryFile::appendTo(std::FILE* stream) const
{
    Chunk chunk;
    std::size_t total = 0;
    std::rewind(_file.get());
    while (const std::size_t length = std::fread(chunk.data(), 1, chunk.size(), _file.get())) {
        if (std::fwrite(chunk.data(), 1, length, stream) != length)
            return std::nullopt;
        total += length;
    }
    return total;
}

} // namespace orvex

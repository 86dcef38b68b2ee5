#include "RegularFile.h"

#include "TextFormat.h"

#include <cerrno>
#include <cstring>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace orvex {

RegularFile::RegularFile(const std::string& path)
    : _descriptor(::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NOCTTY | O_NONBLOCK))
{
    struct stat status { };
    if (_descriptor < 0 || ::fstat(_descriptor, &status) != 0) {
        fail();
        return;
    }
    if (S_ISDIR(status.st_mode))
        _error = std::strerror(EISDIR); // NOLINT(concurrency-mt-unsafe)
    else if (!S_ISREG(status.st_mode))
        _error = "not a regular file";
    _size = static_cast<std::uint64_t>(status.st_size);
}

RegularFile::~RegularFile()
{
    if (_descriptor >= 0)
        ::close(_descriptor);
}

std::size_t RegularFile::readAt(std::uint64_t place, std::span<std::uint8_t> buffer)
{
    std::size_t total = 0;
    while (_error.empty() && total < buffer.size()) {
        const ssize_t count = ::pread(
            _descriptor, buffer.data() + total, buffer.size() - total, static_cast<off_t>(place + total));
        if (count < 0 && errno != EINTR)
            fail();
        if (count == 0)
            break;
        total += count > 0 ? static_cast<std::size_t>(count) : 0;
    }
    return total;
}

std::FILE* RegularFile::openStream()
{
    if (!_error.empty())
        return nullptr;
    const int copy = ::fcntl(_descriptor, F_DUPFD_CLOEXEC, 0);
    std::FILE* stream = copy < 0 ? nullptr : ::fdopen(copy, "rb");
    if (!stream) {
        fail();
        if (copy >= 0)
            ::close(copy);
    }
    return stream;
}

void RegularFile::fail()
{
    _error = std::strerror(errno); // NOLINT(concurrency-mt-unsafe)
}

FileContent readFile(const std::string& path, std::size_t limit)
{
    RegularFile file(path);
    if (file.error().empty() && file.size() <= limit) {
        Bytes bytes;
        bytes.reserve(static_cast<std::size_t>(file.size()) + 2); // room for a parser's end mark
        bytes.resize(static_cast<std::size_t>(file.size()));
        bytes.resize(file.readAt(0, bytes));
        if (file.error().empty())
            return {std::move(bytes), {}};
    }
    return {{}, file.error().empty() ? text("longer than %zu MiB", limit >> 20) : file.error()};
}

} // namespace orvex

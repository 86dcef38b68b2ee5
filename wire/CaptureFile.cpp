#include "CaptureFile.h"

#include <algorithm>
#include <array>
#include <cerrno>

#include <unistd.h>

namespace orvex {

namespace {

constexpr std::size_t kBeginning = std::size_t{1} << 20;
constexpr std::size_t kLongestMagic = 6;

ssize_t readOn(void* file, char* buffer, std::size_t size)
{
    auto& capture = *static_cast<CaptureFile*>(file);
    const std::size_t count = capture.read({reinterpret_cast<std::uint8_t*>(buffer), size});
    errno = EIO; // the reader asks error() for the reason
    return count == 0 && !capture.error().empty() ? -1 : static_cast<ssize_t>(count);
}

} // namespace

CaptureFile::CaptureFile(const std::string& path)
    : _file(std::make_unique<RegularFile>(path))
{
    std::array<std::uint8_t, kLongestMagic> magic{};
    if (!DecompressedStream::isCompressed(std::span(magic).first(_file->readAt(0, magic))))
        return;
    decompress([this, place = std::uint64_t{0}](std::span<std::uint8_t> buffer) mutable {
        const std::size_t count = _file->readAt(place, buffer);
        place += count;
        return count == 0 && !_file->error().empty() ? -1 : static_cast<std::ptrdiff_t>(count);
    });
}

std::unique_ptr<CaptureFile> CaptureFile::standardInput()
{
    return std::unique_ptr<CaptureFile>(new CaptureFile([](std::span<std::uint8_t> buffer) {
        ssize_t count = 0;
        do {
            count = ::read(STDIN_FILENO, buffer.data(), buffer.size());
        } while (count < 0 && errno == EINTR);
        return count;
    }));
}

void CaptureFile::decompress(DecompressedStream::Source source)
{
    _stream = std::make_unique<DecompressedStream>(std::move(source));
    _beginning.resize(kBeginning);
    _beginning.resize(_stream->read(_beginning));
}

std::size_t CaptureFile::peekAt(std::uint64_t place, std::span<std::uint8_t> buffer)
{
    if (!_stream)
        return _file->readAt(place, buffer);
    const auto start = static_cast<std::size_t>(std::min<std::uint64_t>(place, _beginning.size()));
    const auto peeked = ByteView(_beginning).subspan(start);
    const std::size_t count = std::min(peeked.size(), buffer.size());
    std::ranges::copy(peeked.first(count), buffer.begin());
    return count;
}

std::size_t CaptureFile::read(std::span<std::uint8_t> buffer)
{
    std::size_t count = peekAt(_place, buffer);
    if (_stream)
        count += _stream->read(buffer.subspan(count));
    _place += count;
    return count;
}

std::FILE* CaptureFile::openStream()
{
    if (!_stream)
        return _file->openStream();
    return ::fopencookie(this, "rb", {.read = &readOn, .write = nullptr, .seek = nullptr, .close = nullptr});
}

} // namespace orvex

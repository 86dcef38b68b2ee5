#include "DecompressedStream.h"

#include <archive.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstring>
#include <utility>

namespace orvex {

namespace {
constexpr std::size_t kBufferSize = std::size_t{64} << 10;
constexpr std::array<std::uint8_t, 2> kGzipMagic{0x1F, 0x8B};
constexpr std::array<std::uint8_t, 6> kXzMagic{0xFD, '7', 'z', 'X', 'Z', 0};

bool beginsWith(std::span<const std::uint8_t> bytes, std::span<const std::uint8_t> magic)
{
    return bytes.size() >= magic.size() && std::ranges::equal(bytes.first(magic.size()), magic);
}
} // namespace

struct DecompressedStream::Callbacks {
    static la_ssize_t read(archive* handle, void* self, const void** bytes)
    {
        auto& stream = *static_cast<DecompressedStream*>(self);
        const std::ptrdiff_t count = stream._source(stream._buffer);
        if (count < 0)
            archive_set_error(handle, errno, "%s", std::strerror(errno)); // NOLINT(concurrency-mt-unsafe)
        *bytes = stream._buffer.data();
        return count;
    }
};

void DecompressedStream::Close::operator()(archive* handle) const
{
    archive_read_free(handle);
}

DecompressedStream::DecompressedStream(Source source)
    : _source(std::move(source))
    , _buffer(kBufferSize)
    , _archive(archive_read_new())
{
    archive* handle = _archive.get();
    archive_read_support_filter_gzip(handle);
    archive_read_support_filter_xz(handle);
    archive_read_support_format_raw(handle);
    archive_read_support_format_empty(handle);
    archive_entry* entry = nullptr;
    if (archive_read_open(handle, this, nullptr, &Callbacks::read, nullptr) != ARCHIVE_OK) {
        fail();
        return;
    }
    const int result = archive_read_next_header(handle, &entry);
    _isAtEnd = result == ARCHIVE_EOF;
    if (result != ARCHIVE_OK && !_isAtEnd)
        fail();
}

DecompressedStream::~DecompressedStream() = default;

bool DecompressedStream::isCompressed(std::span<const std::uint8_t> beginning)
{
    return beginsWith(beginning, kGzipMagic) || beginsWith(beginning, kXzMagic);
}

std::size_t DecompressedStream::read(std::span<std::uint8_t> buffer)
{
    std::size_t total = 0;
    while (total < buffer.size() && !_isAtEnd && _error.empty()) {
        const la_ssize_t count =
            archive_read_data(_archive.get(), buffer.data() + total, buffer.size() - total);
        if (count < 0)
            fail();
        _isAtEnd = count == 0;
        total += count > 0 ? static_cast<std::size_t>(count) : 0;
    }
    return total;
}

void DecompressedStream::fail()
{
    const char* reason = archive_error_string(_archive.get());
    _error = reason ? reason : "cannot be read";
}

} // namespace orvex

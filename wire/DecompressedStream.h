#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <memory>
#include <span>
#include <string>
#include <vector>

struct archive;

namespace orvex {

// Reads a stream of bytes from front to back and undoes gzip and xz, also of several members one after the
// other; anything else passes as it is. Its memory does not grow with the stream.
class DecompressedStream {
public:
    // Reads some bytes of the stream into the buffer: their number, 0 at the end, or -1 with errno set.
    using Source = std::function<std::ptrdiff_t(std::span<std::uint8_t> buffer)>;

    explicit DecompressedStream(Source source);
    ~DecompressedStream();
    DecompressedStream(const DecompressedStream&) = delete;
    DecompressedStream& operator=(const DecompressedStream&) = delete;

    // True when these bytes at the front of a file say that it is compressed.
    static bool isCompressed(std::span<const std::uint8_t> beginning);

    // Fills the buffer. Returns the number of bytes: less than the buffer holds only at the end or after an
    // error.
    std::size_t read(std::span<std::uint8_t> buffer);
    // Why the stream cannot be read on; empty while all is well.
    const std::string& error() const { return _error; }

private:
    struct Callbacks;
    struct Close {
        void operator()(archive* handle) const;
    };

    void fail();

    Source _source;
    std::vector<std::uint8_t> _buffer; // compressed bytes
    std::unique_ptr<archive, Close> _archive;
    bool _isAtEnd = false;
    std::string _error;
};

} // namespace orvex

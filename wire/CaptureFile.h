#pragma once

#include "DecompressedStream.h"
#include "RegularFile.h"

#include <cstdio>
#include <memory>
#include <string>
#include <utility>

namespace orvex {

// The bytes of a capture: a regular file, or a stream, which is standard input or a file compressed with gzip
// or xz. A stream is read from front to back, in a few MiB of memory however long it is.
class CaptureFile {
public:
    explicit CaptureFile(const std::string& path);
    static std::unique_ptr<CaptureFile> standardInput();
    CaptureFile(const CaptureFile&) = delete;
    CaptureFile& operator=(const CaptureFile&) = delete;

    // Why it cannot be read on, without its path; empty while all is well. What was read stays good.
    const std::string& error() const { return _stream ? _stream->error() : _file->error(); }
    // False when an error came before the first byte.
    bool isOpen() const { return error().empty() || !_beginning.empty(); }

    // How far peekAt() reaches: a whole file, or the first MiB of a stream.
    std::uint64_t peekableSize() const { return _stream ? _beginning.size() : _file->size(); }
    // Both fill the buffer and return the number of bytes, which is less only at the end or after an error:
    // peekAt() from any place, read() from where it stopped before.
    std::size_t peekAt(std::uint64_t place, std::span<std::uint8_t> buffer);
    std::size_t read(std::span<std::uint8_t> buffer);

    // A stdio stream of all bytes, for the caller to close before this object goes; null after an error.
    std::FILE* openStream();

private:
    explicit CaptureFile(DecompressedStream::Source source) { decompress(std::move(source)); }

    void decompress(DecompressedStream::Source source);

    std::unique_ptr<RegularFile> _file; // null for standard input
    std::unique_ptr<DecompressedStream> _stream;
    Bytes _beginning;         // of the stream
    std::uint64_t _place = 0; // of read()
};

} // namespace orvex

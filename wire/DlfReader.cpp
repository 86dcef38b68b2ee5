#include "DlfReader.h"

#include "TextFormat.h"

namespace orvex {

namespace {
constexpr std::size_t kWindow = std::size_t{1} << 20;
constexpr std::uint8_t kLogTypeBaseband = 1;
constexpr std::uint64_t kLargestTime = INT64_MAX;
} // namespace

DlfReader::DlfReader(const std::string& path, std::unique_ptr<CaptureFile> file)
    : CaptureReader(path)
    , _file(std::move(file))
{
    if (!isDlf()) {
        fail("neither a pcap nor a DLF file");
        return;
    }
    _records.emplace(ByteView(), false);
    readOn();
}

bool DlfReader::isDlf()
{
    Bytes window(kWindow);
    std::uint64_t start = 0;
    std::size_t length = 0;
    return DlfRecords::makeUp(_file->peekableSize(), [&](std::uint64_t place) {
        if (place < start || place + DlfRecords::kHeaderLength > start + length) {
            start = place;
            length = _file->peekAt(place, window);
        }
        return ByteView(window).first(length).subspan(static_cast<std::size_t>(place - start));
    });
}

void DlfReader::readOn()
{
    const std::size_t done = _records->doneBytes();
    _window.erase(_window.begin(), _window.begin() + static_cast<std::ptrdiff_t>(done));
    const std::size_t kept = _window.size();
    _window.resize(kept + kWindow);
    const std::size_t length = _file->read(std::span(_window).subspan(kept));
    _window.resize(kept + length);
    _records->moveOn(_window, length < kWindow);
}

CaptureReader::Status DlfReader::next()
{
    if (!_records)
        return Status::broken;
    auto record = _records->next();
    while (!record && _records->wantsMore()) {
        readOn();
        record = _records->next();
    }
    if (!record) {
        if (!_file->error().empty())
            return fail(_file->error());
        const std::size_t skipped = _records->skippedBytes();
        return skipped == 0 ? Status::end : fail(text("%zu bytes that make no record were skipped", skipped));
    }
    _message.assign(1, record->logType.value_or(kLogTypeBaseband));
    _message.insert(_message.end(), record->bytes.begin(), record->bytes.end());
    // The modem's time has a unit of its own; koratd writes microseconds since 1970.
    return yield(_message, std::chrono::microseconds(static_cast<std::int64_t>(record->time & kLargestTime)));
}

} // namespace orvex

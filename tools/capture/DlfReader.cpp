#include "DlfReader.h"

#include "TextFormat.h"

#include <cerrno>
#include <cstring>
#include <fstream>
#include <iterator>

namespace orvex {

namespace {
constexpr std::uint8_t kLogTypeBaseband = 1;
constexpr std::uint64_t kLargestTime = INT64_MAX;
} // namespace

DlfReader::DlfReader(const std::string& path)
    : CaptureReader(path)
{
    std::ifstream file(path, std::ios::binary);
    if (!file) {
        breakOff(std::strerror(errno));
        return;
    }
    _file.assign(std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>());
    DlfRecords records(_file);
    if (records.beginsWithRecords())
        _records = records;
    else
        breakOff("neither a pcap nor a DLF file");
}

CaptureReader::Status DlfReader::next()
{
    if (!_records)
        return Status::broken;
    const auto record = _records->next();
    if (!record) {
        const std::size_t skipped = _records->skippedBytes();
        return skipped == 0 ? Status::end
                            : breakOff(text("%zu bytes that make no record were skipped", skipped));
    }
    _message.assign(1, record->logType.value_or(kLogTypeBaseband));
    _message.insert(_message.end(), record->bytes.begin(), record->bytes.end());
    // The time is the modem's, in a unit of its own; koratd's is microseconds since 1970.
    return yield(_message, std::chrono::microseconds(static_cast<std::int64_t>(record->time & kLargestTime)));
}

} // namespace orvex

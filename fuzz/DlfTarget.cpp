// Reads the input as a DLF and as the raw messages of a snapshot. Both readers account for every byte.

#include "FuzzTarget.h"

#include "DlfRecords.h"
#include "RawMessages.h"

namespace {

using namespace orvex;

constexpr std::size_t kRecordHeader = 12;

void walkRecords(ByteView file)
{
    DlfRecords records(file);
    std::size_t end = 0;
    std::size_t skipped = 0;
    while (const auto record = records.next()) {
        fuzz::require(record->bytes.size() >= kRecordHeader, "a record holds its header");
        fuzz::require(record->start + record->bytes.size() <= file.size(), "a record lies in the file");
        fuzz::require(record->bytes.data() == file.data() + record->start, "a record is the file's bytes");
        // A log type may precede a record, and all or part of a two-byte prefix may precede that.
        const std::size_t between = record->start - end - (records.skippedBytes() - skipped);
        fuzz::require(record->logType ? between >= 1 && between <= 3 : between == 0,
            "records and skipped bytes follow each other");
        end = record->start + record->bytes.size();
        skipped = records.skippedBytes();
    }
    fuzz::require(end + records.skippedBytes() - skipped == file.size(), "the walk reaches the end");
}

void walkMessages(ByteView bytes)
{
    RawMessages messages(bytes);
    std::size_t walked = 0;
    while (const auto message = messages.next()) {
        fuzz::require(message->data() == bytes.data() + walked, "messages follow each other");
        walked += message->size();
    }
    fuzz::require(walked + messages.rest() == bytes.size(), "the rest is what makes no message");
}

} // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    walkRecords({data, size});
    walkMessages({data, size});
    return 0;
}

// Detects the format of a capture file and reads it to its end.

#include "FuzzTarget.h"
#include "MemoryFile.h"

#include "CaptureReader.h"
#include "DecompressedStream.h"

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    using namespace orvex;
    const fuzz::MemoryFile file({data, size});
    const auto reader = CaptureReader::open(file.path());
    CaptureReader::Status status = reader->next();
    std::size_t messages = 0;
    const bool isCompressed = DecompressedStream::isCompressed({data, size});
    for (; status == CaptureReader::Status::message; status = reader->next()) {
        if (isCompressed)
            continue;
        // A DLF record gains a log type when it becomes a message.
        fuzz::require(reader->message().size() <= size + 1, "a message is no longer than its file");
        fuzz::require(++messages <= size, "no more messages than bytes");
    }
    fuzz::require((status == CaptureReader::Status::broken) == !reader->error().empty(),
        "a capture that cannot be read (on) says why");
    reader->omissions();
    return 0;
}

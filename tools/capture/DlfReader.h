#pragma once

#include "CaptureReader.h"
#include "DlfRecords.h"

namespace orvex {

// A DLF file. A record becomes a message by its log type in front; where the file has none it is that of a
// baseband packet. A file with bytes that make no record is read to its end and then counts as broken. It is
// held in memory.
class DlfReader final : public CaptureReader {
public:
    explicit DlfReader(const std::string& path);

    Status next() override;
    std::string omissions() const override { return {}; }

private:
    Bytes _file;
    std::optional<DlfRecords> _records; // none when the file cannot be read
    Bytes _message;
};

} // namespace orvex

#pragma once

#include "CaptureReader.h"
#include "DlfRecords.h"
#include "RegularFile.h"

namespace orvex {

// A DLF file. A record becomes a message by its log type in front; where the file has none it is that of a
// baseband packet. A file with bytes that make no record is read to its end and then counts as broken. Only a
// part of it is in memory.
class DlfReader final : public CaptureReader {
public:
    DlfReader(const std::string& path, std::unique_ptr<RegularFile> file);

    Status next() override;
    std::string omissions() const override { return {}; }

private:
    bool isDlf();
    void readOn();

    std::unique_ptr<RegularFile> _file;
    std::uint64_t _windowEnd = 0;       // in the file
    Bytes _window;                      // what the records lie in
    std::optional<DlfRecords> _records; // none when the file cannot be read
    Bytes _message;
};

} // namespace orvex

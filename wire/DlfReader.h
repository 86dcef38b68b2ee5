#pragma once

#include "CaptureFile.h"
#include "CaptureReader.h"
#include "DlfRecords.h"

namespace orvex {

// Reads a DLF file. Each record becomes a message with its log type in front, baseband if the file has none.
// A file with bytes that form no record is read to its end and then reported as broken. Only a window of the
// file is in memory.
class DlfReader final : public CaptureReader {
public:
    DlfReader(const std::string& path, std::unique_ptr<CaptureFile> file);

    Status next() override;
    std::string omissions() const override { return {}; }

private:
    bool isDlf();
    void readOn();

    std::unique_ptr<CaptureFile> _file;
    Bytes _window;
    std::optional<DlfRecords> _records; // none if the file cannot be read
    Bytes _message;
};

} // namespace orvex

#pragma once

#include "MTLDLFAddVersionReport.h"

#include "MessagePort.h"

namespace orvex::test {

inline Bytes& operator+=(Bytes& bytes, const Bytes& more)
{
    bytes.insert(bytes.end(), more.begin(), more.end());
    return bytes;
}

// A record of that length as it stands in a DLF; what is not its header is filled up.
inline Bytes dlfRecord(std::size_t length, std::uint8_t time, std::uint8_t fill = 0xEE)
{
    Bytes record{static_cast<std::uint8_t>(length), static_cast<std::uint8_t>(length >> 8), 0xC1, 0xB0, time,
        0x40, 0x1E, 0x18, 0x24, 0x0A, 0x06, 0x00};
    record.resize(length, fill);
    return record;
}

inline Bytes versionReport()
{
    Bytes report(kMTLDLFVersionReportLength);
    std::uint32_t written = 0;
    MTLDLFAddVersionReport(
        report.data(), kMTLDLFVersionReportLength, written, 1, 1, "Orvex", "NAME", "DATE", {1, 60, 0});
    return report;
}

// The DLF that a snapshot has of these messages, of which each interval holds so many.
inline Bytes snapshotDlf(const std::vector<Bytes>& messages, std::size_t messagesPerInterval)
{
    Bytes dlf = versionReport();
    for (std::size_t i = 0; i < messages.size(); ++i) {
        const std::ptrdiff_t dropped = i % messagesPerInterval == 0 ? 1 : 0;
        dlf.insert(dlf.end(), messages[i].begin() + dropped, messages[i].end());
    }
    return dlf;
}

} // namespace orvex::test

#include "MTLDLFAddVersionReport.h"

#include <algorithm>
#include <array>
#include <cstring>

namespace orvex {

namespace {

class Report {
public:
    void number(std::size_t offset, std::size_t width, std::uint32_t value)
    {
        for (std::size_t i = 0; i < width; ++i)
            _bytes[offset + i] = static_cast<std::uint8_t>(value >> (8 * i));
    }

    void text(std::size_t offset, std::size_t width, const char* value)
    {
        const std::size_t length = std::min(std::strlen(value), width - 1);
        std::copy_n(value, length, _bytes.begin() + static_cast<std::ptrdiff_t>(offset));
    }

    void copyTo(std::uint8_t* buffer) const { std::ranges::copy(_bytes, buffer); }

private:
    std::array<std::uint8_t, kMTLDLFVersionReportLength> _bytes{};
};

constexpr std::uint32_t kBufferTooSmall = 3;

} // namespace

std::uint32_t MTLDLFAddVersionReport(std::uint8_t* buffer, std::uint32_t capacity, std::uint32_t& written,
    std::uint16_t first, std::uint16_t second, const char* versionText, const char* executableName,
    const char* buildDate, MTLDLFTimeInformation timeInformation)
{
    written = 0;
    if (capacity < kMTLDLFVersionReportLength)
        return kBufferTooSmall;
    Report report;
    report.number(0, 2, kMTLDLFVersionReportLength);
    report.number(2, 2, 0x1FFD);
    report.number(12, 2, first);
    report.number(14, 2, second);
    report.text(16, 7, versionText);
    report.text(23, 16, executableName);
    report.text(63, 18, buildDate);
    report.number(81, 4, timeInformation.secondsSince1970);
    report.number(85, 2, static_cast<std::uint16_t>(timeInformation.zoneMinutes));
    report.number(87, 2, timeInformation.isDaylightSaving);
    report.copyTo(buffer);
    written = kMTLDLFVersionReportLength;
    return 0;
}

} // namespace orvex

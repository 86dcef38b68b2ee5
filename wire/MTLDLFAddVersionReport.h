#pragma once

#include <cstdint>

namespace orvex {

// Length of the version report, the record that opens every DLF.
inline constexpr std::uint32_t kMTLDLFVersionReportLength = 161;

struct MTLDLFTimeInformation {
    std::uint32_t secondsSince1970;
    std::int16_t zoneMinutes; // east of UTC
    std::uint8_t isDaylightSaving;
};

// Writes the version report, little-endian, every byte not listed 0:
//
//   0    u16       record length, 161
//   2    u16       log code, 0x1FFD
//   4    8         time stamp, 0
//   12   u16       first report field
//   14   u16       second report field
//   16   char[7]   version text
//   23   char[16]  executable name
//   63   char[18]  build date and time
//   81   u32       time in seconds since 1970
//   85   s16       zone in minutes east of UTC
//   87   u16       1 while daylight saving is in effect
//
// Texts are cut to their field less one byte and end with NUL. Returns 0, or 3 when the capacity is below the
// report's length; `written` is the number of bytes written in either case.
std::uint32_t MTLDLFAddVersionReport(std::uint8_t* buffer, std::uint32_t capacity, std::uint32_t& written,
    std::uint16_t first, std::uint16_t second, const char* versionText, const char* executableName,
    const char* buildDate, MTLDLFTimeInformation timeInformation);

} // namespace orvex

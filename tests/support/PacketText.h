#pragma once

#include "ByteText.h"
#include "PacketReader.h"

#include "TextFormat.h"

namespace orvex::test {

// The 13-byte header of a log packet, without length and time.
inline Bytes packetHeader(LogCode code)
{
    Bytes header(kPacketHeaderLength, 0xEE);
    header[0] = code >= kExtraCodeBase ? 255 : 1;
    header[3] = static_cast<std::uint8_t>(code);
    header[4] = static_cast<std::uint8_t>(code >> 8);
    return header;
}

// A log packet with this payload, whose bytes are given from packet byte 13 on.
inline Bytes packet(LogCode code, const Bytes& payload)
{
    Bytes result = packetHeader(code);
    result.insert(result.end(), payload.begin(), payload.end());
    return result;
}

// Cells of a cell-monitor list as a property list: "GSM Serving CellID=-5 ARFCN=7, UMTS Neighbor".
inline std::string cellList(const std::string& cells)
{
    std::string result = "<array>";
    std::istringstream stream(cells);
    for (std::string cell; std::getline(stream, cell, ',');) {
        std::istringstream words(cell);
        std::string radio;
        std::string type;
        words >> radio >> type;
        result += text("<dict><key>RadioAccessTechnology</key><string>%s</string><key>CellType</key>"
                       "<string>%s</string>",
            radio.c_str(), type.c_str());
        for (std::string entry; words >> entry;) {
            const auto equals = entry.find('=');
            result += text("<key>%s</key><integer>%s</integer>", entry.substr(0, equals).c_str(),
                entry.substr(equals + 1).c_str());
        }
        result += "</dict>";
    }
    return result + "</array>";
}

// "B0C1: 3F 80" with the code and the payload of a baseband packet, or of an extra packet "FF0001: " and
// cells, the inner part of a property list, or neither: a text.
inline Bytes packetOfText(const std::string& text)
{
    const auto colon = text.find(": ");
    const auto code = static_cast<LogCode>(std::stol(text, nullptr, 16));
    std::string payload = colon == std::string::npos ? "" : text.substr(colon + 2);
    if (code < kExtraCodeBase)
        return bytesOfWords(payload, packetHeader(code));
    if (code == kExtraCodeCellMonitorList && !payload.starts_with('<') && payload != "no list")
        payload = cellList(payload);
    if (payload.starts_with('<'))
        payload = "<plist version=\"1.0\">" + payload + "</plist>";
    return packet(code, Bytes(payload.begin(), payload.end()));
}

} // namespace orvex::test

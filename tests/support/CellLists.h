#pragma once

#include "LogPackets.h"

#include "TextFormat.h"

#include <string>
#include <utility>
#include <vector>

namespace orvex::test {

// One record of a cell-monitor list, as the inner part of a property list.
inline std::string cell(
    const char* radio, const char* type, const std::vector<std::pair<const char*, int>>& numbers)
{
    std::string entries;
    for (const auto& [key, number] : numbers)
        entries += text("<key>%s</key><integer>%d</integer>", key, number);
    return text("<dict><key>RadioAccessTechnology</key><string>%s</string>"
                "<key>CellType</key><string>%s</string>%s</dict>",
        radio, type, entries.c_str());
}

inline Bytes cellList(const std::string& cells)
{
    return propertyListPacket(kExtraCodeCellMonitorList, "<array>" + cells + "</array>");
}

// A packet of the list's code without a property list, and what a section says of it.
inline const Bytes kNoCellList = packet(kExtraCodeCellMonitorList, {'n', 'o'});
inline std::vector<std::string> linesWithoutCellList(const std::string& entryWord)
{
    return {"<4>" + entryWord, "<3>Cell Info Array data could not be constructed",
        "<3>Failed to get Cell Array\n"};
}

} // namespace orvex::test

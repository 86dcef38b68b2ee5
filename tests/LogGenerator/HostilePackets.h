#pragma once

#include "EveryDecoder.h"
#include "PacketsOfCode.h"

#include "CellMonitorList.h"
#include "LogCode_0xFF0000.h"

#include <gtest/gtest.h>

namespace orvex::test {

inline constexpr const char* kMarlinTechnologies[] = {telephony::kTechnologyMRL_GSM,
    telephony::kTechnologyMRL_CDMA, telephony::kTechnologyMRL_LTE, telephony::kTechnologyMRL_UTRAN2};

// Where the records of a list stand in its packet, and the least that one of them takes.
struct ListBound {
    const char* decoder;
    LogCode code;
    const char* row; // null: the container itself is the list
    std::size_t start;
    std::size_t least;

    std::size_t mostIn(std::size_t packetLength) const
    {
        return packetLength < start ? 0 : (packetLength - start) / least;
    }
};

// Every list that a baseband packet can fill. Lists of property lists are as long as the list says.
inline const std::vector<ListBound> kListBounds = {
    {"Active Set", 0x417A, nullptr, 16, 15 + 44},
    {"BLER", 0x4116, "Transport Channels", 16, 9},
    {"CCTRCH SIR", 0xD00C, nullptr, 289, 8},
    {"CDMA2000", 0x108A, "kFingerC2I", 23, 14},
    {"CDMA2000", 0x119C, "k1xActiveSetInfo", 17 + 12, 12},
    {"CDMA2000", 0x12B6, "kActiveSetPilots", 25, 12},
    {"Detected Cells", 0xB179, nullptr, 29, 2},
    {"Detected Set", 0x417A, nullptr, SIZE_MAX, 1}, // stays empty, like the others of these
    {"Equivalent PLMN List", 0x7150, nullptr, 17 + 3, 3},
    {"GSM Neighbor Cell List", 0xD00E, nullptr, SIZE_MAX, 1},
    {"GSM Set", 0x4005, nullptr, 15, 7},
    {"HSDPA Info", 0x4221, "Primary HARQ Process", 18, 9},
    {"HSDPA Info", 0x4221, "Secondary HARQ Process", 18, 9},
    {"Measured Neighbor Cells", 0xB179, nullptr, 29, 6},
    {"Mobile Allocation", 0x51F8, "ARFCNs", 15, 2},
    {"Monitored Set", 0x417A, nullptr, SIZE_MAX, 1},
    {"Neighbor Cell List", 0xD00A, nullptr, 168, 16},
    {"Neighbor Cells List", 0xB180, nullptr, 21, 20},
    {"Neighboring Cells", 0x5137, nullptr, 29, 14},
    {"Reselection Candidates List", 0xB186, nullptr, 21, 4},
    {"TRCH BLER", 0xD00C, nullptr, 17, 2},
    {"UMTS Set", 0x4005, nullptr, 15, 10},
    {"Virtual Active Set", 0x417A, nullptr, SIZE_MAX, 1},
};

// What is shown where a packet changed nothing.
inline constexpr const char* kKept = "kept";

// Feeds one packet. False when it threw what an extra packet of that code ends the process with.
inline bool survives(const Decoder& decoder, const Value& container, const Bytes& packet)
{
    try {
        decoder.feed(container, packet);
        return true;
    } catch (const LogCode_0xFF0000::UnknownDataException&) {
        EXPECT_EQ(decoder.code, kExtraCodeSimFiles) << decoder.name;
    } catch (const PDPContextList::UnknownDataException&) {
        EXPECT_EQ(decoder.code, kExtraCodePDPContexts) << decoder.name;
    } catch (const CellMonitorList::WrongKindException&) {
        EXPECT_EQ(decoder.code, kExtraCodeCellMonitorList) << decoder.name;
    }
    return false;
}

inline std::size_t recordsOf(const Value& list)
{
    if (const auto array = list.array())
        return array->size();
    const auto rows = list.dictionary();
    return rows->size() - (rows->contains("_sorted") ? 1 : 0);
}

// Whether a list that is shown under the row is no longer than the packet's bytes allow. A list of which
// nothing is known is a fault of the table.
inline void expectBound(const Decoder& decoder, const char* row, const Value& shown, std::size_t packetLength)
{
    if ((!shown.array() && !shown.dictionary()) || recordsOf(shown) == 0)
        return;
    const auto bound = std::ranges::find_if(kListBounds, [&](const ListBound& each) {
        return each.decoder == decoder.name && each.code == decoder.code
            && (each.row && row ? std::string_view(each.row) == row : each.row == row);
    });
    ASSERT_NE(bound, kListBounds.end()) << decoder.name << ' ' << (row ? row : "");
    EXPECT_LE(recordsOf(shown), bound->mostIn(packetLength)) << decoder.name << ' ' << (row ? row : "");
}

} // namespace orvex::test

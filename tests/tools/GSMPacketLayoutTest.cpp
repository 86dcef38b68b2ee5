// The layouts of GSM and UMTS packets that are easily got wrong, against bytes set by hand.

#include "packets/EquivalentPLMNPacket.h"
#include "packets/GSMMeasurementPacket.h"
#include "packets/ServingPLMNPacket.h"
#include "packets/WCDMABlockErrorPacket.h"
#include "packets/WCDMAHARQPacket.h"
#include "packets/WCDMARankingPacket.h"
#include "packets/WCDMASearcherPacket.h"
#include "packets/WCDMATransmitPowerPacket.h"

#include <gtest/gtest.h>

#include <map>

namespace orvex::korat {
namespace {

constexpr Microseconds kTime{1};

TEST(GSMPacketLayout, IsTheBytesSetByHand)
{
    using Carriers = WCDMAHARQPacket::Carriers;
    using Service = ServingPLMNPacket::Service;
    using Set = WCDMASearcherPacket::Set;
    const struct {
        const char* name;
        LogMessage message;
        std::size_t length;
        std::map<std::size_t, Bytes> fields; // all bytes between them are 0
    } cases[] = {
        {"the neighbour's C1 below 0, unaligned",
            GSMMeasurementPacket{-75, 29, 0x10002, true, {{871, -80.4, 24}, {62, -104, -2}}}.message(kTime),
            57,
            {{15, {75}}, {16, {29, 0, 0, 0}}, {20, {2, 0, 1, 0}}, {26, {1}}, {28, {2}},
                {29, {0x67, 3, 80, 24}}, {43, {62, 0, 104, 0xFE, 0xFF, 0xFF, 0xFF}}}},
        {"two-digit network code", ServingPLMNPacket{2, Service::both, {260, 1, 2}, 0x1234, 7}.message(kTime),
            32, {{13, {2, 3, 0x62, 0xF0, 0x10, 0x12, 0x34, 7}}}},
        {"three-digit network code",
            ServingPLMNPacket{0, Service::limited, {310, 124, 3}, 0xFFFE, 0}.message(kTime), 32,
            {{13, {0, 4, 0x13, 0x40, 0x21, 0xFF, 0xFE}}}},
        {"no equivalent network", EquivalentPLMNPacket{}.message(kTime), 17, {}},
        {"networks that agree where they overlap",
            EquivalentPLMNPacket{{{1, 234, 3}, {345, 167, 3}}}.message(kTime), 26,
            {{16, {2, 0, 2, 0, 3, 1, 4, 6, 5, 7}}}},
        {"cells and their Ec/Io in two lists",
            WCDMASearcherPacket{-62.5, {{511, Set::active, {-3.0103, {}, 0}}, {8191, Set::detected, {}}}}
                .message(kTime),
            16 + 15 * 2 + 44 * 2,
            {{13, {0xB3, 0xFF}}, {15, {2}}, {23, {0xFF, 0x01}}, {38, {0xFF, 0x5F}}, {78, {0, 0, 4, 0}},
                {86, {0, 0, 8}}}},
        {"UMTS cells of a ranking",
            WCDMARankingPacket{{{10838, 511, -101, -99, -7.5, -300}, {10562, 8, -25, -26, 0, 5}}, {}}.message(
                kTime),
            35,
            {{13, {2, 0}}, {15, {0x56, 0x2A, 0xFF, 1, 0xB0, 0x9D, 0xFF, 0xF1, 0xD4, 0xFE}},
                {25, {0x42, 0x29, 8, 0, 0xFC, 0xE6, 0xFF, 0, 5, 0}}}},
        {"GSM cells of a ranking, in the same place",
            WCDMARankingPacket{{}, {{871, 63, -110, -112}, {1, 9, -47, 300}}}.message(kTime), 29,
            {{13, {0, 2}}, {15, {0x67, 3, 63, 0, 0x92, 0x90, 0xFF}}, {22, {1, 0, 9, 0, 0xD1, 0x2C, 1}}}},
        {"power, none, and the one that would be none",
            WCDMATransmitPowerPacket{{24, {}, -18.8}}.message(kTime), 58,
            {{14, {3}}, {20, {0xAC, 1}}, {48, {1, 0}}}},
        {"transport channels", WCDMABlockErrorPacket{500, {{1, 100000, 2}, {24, 3, 1}}}.message(kTime), 34,
            {{13, {2, 0xF4, 1}}, {16, {1, 0xA0, 0x86, 1, 0, 2}}, {25, {24, 3, 0, 0, 0, 1}}}},
        {"far secondary processes",
            WCDMAHARQPacket{3, 1023, Carriers::dual, {{7, 0x12345678, 258, 1}, {6, 1, 2, 3}},
                {{5, 0xFFFFFFFF, 65535, 9}, {4, 8, 7, 6}}}
                .message(kTime),
            18 + 2 * 162 + 18,
            {{13, {3, 0xFF, 0x0B, 2, 2}}, {18, {7, 0x78, 0x56, 0x34, 0x12, 2, 1, 1, 0}},
                {27, {6, 1, 0, 0, 0, 2, 0, 3, 0}}, {342, {5, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 0xFF, 9, 0}},
                {351, {4, 8, 0, 0, 0, 7, 0, 6, 0}}}},
        {"primary processes alone",
            WCDMAHARQPacket{1, 250, Carriers::mimo, {{15, 1, 2, 3}}, {}}.message(kTime), 27,
            {{13, {1, 0xFA, 0x04, 1, 0}}, {18, {15, 1, 0, 0, 0, 2, 0, 3, 0}}}},
    };
    for (const auto& [name, message, length, fields] : cases) {
        Bytes expected(length);
        std::copy_n(message.bytes.begin(), 13, expected.begin());
        for (const auto& [offset, bytes] : fields)
            std::copy(bytes.begin(), bytes.end(), expected.begin() + static_cast<std::ptrdiff_t>(offset));
        EXPECT_EQ(message.bytes, expected) << name;
    }
}

} // namespace
} // namespace orvex::korat

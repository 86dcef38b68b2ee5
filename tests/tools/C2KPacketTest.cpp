#include "packets/C2K1xStatusPacket.h"
#include "packets/C2K1xSystemPacket.h"
#include "packets/C2K1xTrafficPacket.h"
#include "packets/C2KEVDOActiveSetPacket.h"
#include "packets/C2KEVDOFingerPacket.h"
#include "packets/C2KEVDOStatusPacket.h"
#include "packets/C2KForwardLinkPacket.h"
#include "packets/C2KReverseLinkPacket.h"

#include <gtest/gtest.h>

namespace orvex::korat {
namespace {

constexpr Microseconds kTime{1};

TEST(C2KPacket, FieldsStandWhereReceiversReadThem)
{
    C2KEVDOStatusPacket status;
    status.channel = 675;
    status.bandClass = 1;
    status.receiveAGC0 = -80;
    status.receiveAGC1 = -83.4;
    status.transmitAGC = 23;
    status.state = C2KEVDOStatusPacket::State::connected;
    status.session = C2KEVDOStatusPacket::Session::terminalNegotiates;
    status.uati24 = 0x123456;
    status.colorCode = 133;
    C2KEVDOStatusPacket servedStatus;
    servedStatus.servingPN = 0x0154;

    C2K1xStatusPacket oneX;
    oneX.state = C2K1xStatusPacket::State::traffic;
    oneX.receivers[0] = {1, 0x0180, -80.282}; // 51 steps below
    oneX.receivers[1] = {10, 0x0281, -62.914};
    oneX.transmitAGC = -12.3;
    oneX.referencePN = 0x0105;
    oneX.pilots = {{0x0105, -10}, {0x0107, -3}}; // 4262 2/73728 - 1/64 is 0.1, 19052 of them 0.501

    C2KForwardLinkPacket forward;
    forward.sequenceNumber = 0x01020304;
    forward.packets[0] = 3;
    forward.packets[45] = 0x0A0B0C0D;
    forward.packets[55] = 7;
    C2KReverseLinkPacket reverse;
    reverse.sequenceNumber = 0x01020304;
    reverse.sizes[2].packets[1][0][3] = 7;
    reverse.sizes[11].packets[2][1][0] = 0x0A0B0C0D;

    const C2K1xSystemPacket system{C2K1xSystemPacket::Roaming::alliancePartner, 4106, 65535, 3, 6, 2049};
    const struct {
        LogMessage message;
        std::size_t length;
        std::vector<std::pair<std::size_t, Bytes>> fields;
    } cases[] = {
        {status.message(kTime), 50,
            {{13, {0xA3, 0x0A, 0xB0, 0xAD, 23, 0xFF, 0xFF}}, {36, {5, 2, 0x56, 0x34, 0x12, 133}}}},
        {servedStatus.message(kTime), 50, {{18, {0x54, 0x01}}}},
        {C2KEVDOActiveSetPacket{{{12, 0}, {0x0101, -3.01}}}.message(kTime), 49,
            {{15, {2}}, {25, {12, 0, 0x00, 0x02}}, {37, {1, 1, 0x00, 0x01}}}},
        {C2KEVDOFingerPacket{{{}, {0x0101, 6.021}}}.message(kTime), 51,
            {{22, {2}}, {23, {0xFF, 0xFF}}, {37, {1, 1}}, {43, {0x00, 0x08}}}},
        {oneX.message(kTime), 125,
            {{14, {4}}, {17, {1, 0, 8, 0, 8}}, {25, {2, 0, 16, 0, 1, 10, 0x80, 0x01, 0x81, 0x02}},
                {35, {0xCD, 1, 0x85, 0xFF}}, {41, {3, 0, 76, 0, 64, 0, 2, 2, 2, 3, 0x05, 0x01, 0x05, 0x01}},
                {77, {0xA6, 0x10}}, {85, {0x07, 0x01}}, {109, {0x6C, 0x4A}}, {117, {4, 0, 8, 0}}}},
        {C2K1xTrafficPacket{true}.message(kTime), 45, {{14, {1}}, {17, {11, 0, 28, 0}}, {41, {1}}}},
        {system.message(kTime), 186,
            {{13, {2}}, {42, {7, 0, 0, 0, 2, 0, 0, 0, 0x0A, 0x10, 0xFF, 0xFF}}, {131, {3, 0, 6}},
                {184, {0x01, 0x08}}}},
        {forward.message(kTime), 241,
            {{13, {4, 3, 2, 1, 3, 0, 0, 0}}, {197, {0x0D, 0x0C, 0x0B, 0x0A}}, {237, {7, 0, 0, 0}}}},
        {reverse.message(kTime), 1750,
            {{14, {4, 3, 2, 1}}, {654, {7, 0, 0, 0}}, {1722, {0x0D, 0x0C, 0x0B, 0x0A}}}},
    };
    for (const auto& [message, length, fields] : cases) {
        const Bytes& bytes = message.bytes;
        EXPECT_EQ(bytes.size(), length) << std::hex << *message.code;
        for (const auto& [offset, field] : fields) {
            ASSERT_LE(offset + field.size(), bytes.size());
            const auto at = bytes.begin() + static_cast<std::ptrdiff_t>(offset);
            EXPECT_EQ(Bytes(at, at + static_cast<std::ptrdiff_t>(field.size())), field)
                << std::hex << *message.code << " at " << std::dec << offset;
        }
    }
}

} // namespace
} // namespace orvex::korat

// The packets of CDMA2000 through the receiver's own decoders, into the rows of the real template.

#include "packets/C2K1xStatusPacket.h"
#include "packets/C2K1xSystemPacket.h"
#include "packets/C2KEVDOFingerPacket.h"
#include "packets/C2KEVDOStatusPacket.h"

#include "ExpectRows.h"

#include <gtest/gtest.h>

namespace orvex::korat {
namespace {

constexpr Microseconds kTime{1};

TEST(PacketLayout, OfCDMA2000)
{
    C2K1xStatusPacket oneX;
    oneX.state = C2K1xStatusPacket::State::traffic;
    oneX.receivers[0] = {1, 384, -80.282};
    oneX.receivers[1] = {10, 641, -62.914};
    oneX.transmitAGC = -12.3;
    const C2K1xSystemPacket system{C2K1xSystemPacket::Roaming::alliancePartner, 4106, 65535, 3, 6, 2049};
    C2KEVDOStatusPacket status;
    status.channel = 675;
    status.bandClass = 1;
    status.receiveAGC0 = -80;
    status.receiveAGC1 = -83;
    status.transmitAGC = 23;
    status.servingPN = 340;
    status.state = C2KEVDOStatusPacket::State::connected;
    status.session = C2KEVDOStatusPacket::Session::terminalNegotiates;
    status.uati24 = 0x123456;
    status.colorCode = 133;
    expectRows("MRL_CDMA",
        {{oneX.message(kTime), "1x Status",
             {{{"Device State", "Traffic [8]"}, {"Rx0 Band Class", "1.8 to 2.0GHz PCS band [1]"},
                 {"Rx0 Channel", "384"}, {"Rx0 AGC", "-80.28 dBm"},
                 {"Rx1 Band Class", "Secondary 800 MHz band [10]"}, {"Rx1 Channel", "641"},
                 {"Rx1 AGC", "-62.91 dBm"}, {"Tx AGC", "-12.30 dBm"}}}},
            {system.message(kTime), "1x System Identity",
                {{{"System ID", "4106"}, {"Network ID", "65535"}, {"Base Station ID", "2049"},
                    {"Packet Zone ID", "3"}, {"Roaming Indicator", "Alliance partner [7]"},
                    {"Protocol Revision", "6"}}}},
            {status.message(kTime), "EV-DO Status",
                {{{"Device State", "Connected [5]"}, {"Band Class", "1.8 to 2.0GHz PCS band [1]"},
                    {"Channel", "675"}, {"Serving PN Offset", "340 × 64chips"}, {"Rx AGC 0", "-80 dBm"},
                    {"Rx AGC 1", "-83 dBm"}, {"Tx AGC", "+23 dBm"}}}},
            {status.message(kTime), "EV-DO Session",
                {{{"Session State", "AT-initiated neg [2]"}, {"UATI, Low 24 Bits", "0x123456"},
                    {"Color Code", "133"}}}},
            {C2KEVDOFingerPacket{{{12, -3.0103}, {{}, 0}, {300, 6.0206}}}.message(kTime),
                "Carrier to Interference",
                {{{"_sorted", "_sorted"}, {"0;12", "-3.01 dB"}, {"2;300", "+6.02 dB"}}}}});
}

} // namespace
} // namespace orvex::korat

// Subpackets, and the frame-error rate, by way of the traffic frames.

#include "C2KFixture.h"

namespace orvex::test {
namespace {

using Lines = std::vector<std::string>;

// Traffic frames whose demodulation subpacket has this error byte.
Bytes framePacket(std::uint8_t error)
{
    Bytes body(20, 0);
    body.push_back(error);
    return packetOf(0x119D, {subpacket(11, body)});
}

TEST(SubpacketWalk, FindsWithinItsBounds)
{
    const Bytes frame = framePacket(1);
    const auto changed = [&frame](std::size_t offset, unsigned value) {
        Bytes bytes = frame;
        bytes[offset] = static_cast<std::uint8_t>(value);
        bytes[offset + 1] = static_cast<std::uint8_t>(value >> 8);
        return bytes;
    };
    const Bytes body(21, 1);
    const char* missing = "<4>Log code 0x119d: missing traffic demod subpacket.";
    const auto length = static_cast<unsigned>(frame.size());
    const struct {
        const char* name;
        Bytes packet;
        bool isFound;
        Lines lines;
    } cases[] = {
        {"plain", frame, true, {}},
        {"size of zero", changed(19, 0), true, {}},
        {"ends one byte before the bound", changed(19, length - 1), true, {}},
        {"ends at the bound", changed(19, length), false,
            {text("<3>Log code error in subpkt#0: bad size (%u).", length), missing}},
        {"second ends behind the bound", packetOf(0x119D, {subpacket(5, {}), subpacket(11, body, 0xFFFF)}),
            false, {"<3>Log code error in subpkt#1: bad size (65535).", missing}},
        {"none counted", packetOf(0x119D, {subpacket(11, body)}, 0), false, {missing}},
        {"beyond the count", packetOf(0x119D, {subpacket(5, {}), subpacket(11, body)}, 1), false, {missing}},
        {"another with a size of zero", packetOf(0x119D, {subpacket(5, {}, 0), subpacket(11, body)}, 255),
            false, {missing}},
        {"no header behind the last", packetOf(0x119D, {subpacket(5, {})}, 255), false, {missing}},
        {"three bytes of header", packetOf(0x119D, {subpacket(5, {}), {11, 0, 4}}), false, {missing}},
        {"next one beyond the packet", packetOf(0x119D, {subpacket(5, {}, 10)}, 2), false, {missing}},
    };
    C2KFixture fixture;
    for (const auto& [name, packet, isFound, lines] : cases) {
        EXPECT_EQ(!fixture.rowsAfter(packet).empty(), isFound) << name;
        EXPECT_EQ(fixture.log.take(), lines) << name;
    }
    Bytes cut = frame;
    cut.pop_back();
    EXPECT_EQ(fixture.rowsAfter(cut), RowTexts{}) << "the error byte is behind the packet";
    EXPECT_EQ(fixture.log.take(), Lines{});
}

// 1x status of this device state alone.
Bytes statusPacket(std::uint8_t state)
{
    return packetOf(0x119C, {subpacket(1, {state}), subpacket(2, {}), subpacket(3, {}), subpacket(4, {})});
}

TEST(TrafficFER, AveragesInSinglePrecision)
{
    C2KFixture fixture;
    const char* row = "k1xTrafficFER";
    EXPECT_EQ(fixture.textAfter(framePacket(2), row), "1.56%");
    EXPECT_EQ(fixture.textAfter(framePacket(0), row), "1.54%");
    EXPECT_EQ(fixture.textAfter(statusPacket(8), row), "(absent)");
    EXPECT_EQ(fixture.textAfter(statusPacket(6), row), "1.54% (old)");
    EXPECT_EQ(fixture.textAfter(statusPacket(6), row), "(absent)") << "shown once";
    EXPECT_EQ(fixture.textAfter(framePacket(0), row), "0.00%") << "a new average";

    fixture.state.remove("TrafficFER");
    for (int frame = 0; frame < 60; ++frame)
        fixture.feed(framePacket(frame < 59 ? 1 : 0));
    EXPECT_EQ(fixture.textAfter(framePacket(0), row), "58.64%") << "58.63% in double precision";
    fixture.state.remove("TrafficFER");
    for (const auto error : Bytes{1, 1, 1, 1, 0, 1})
        fixture.feed(framePacket(error));
    EXPECT_EQ(fixture.state["TrafficFER"], Value(0.07478243112564087)) << "each step is rounded";
    fixture.state.set("TrafficFER", static_cast<double>(0.00625F));
    EXPECT_EQ(fixture.textAfter(statusPacket(6), row), "0.62% (old)") << "0.63% in double precision";
}

} // namespace
} // namespace orvex::test

// The frame error rate of 1x traffic, a single-precision average over many packets.

#include "C2KFixture.h"

namespace orvex::test {
namespace {

class TrafficFER : public testing::Test, public C2KFixture {
public:
    std::string after(const std::string& packet)
    {
        clear();
        feed(packetOfText(packet));
        return shown(*display);
    }
    std::string frame(int error) { return after(text("119D: EE 01 EE EE 0B EE 1900 00*20 %02d", error)); }
    // 1x status of this device state, 8 being traffic. Shows the rate as old, or not at all.
    std::string status(int deviceState)
    {
        const std::string all = after(text("119C: EE 04 EE EE 01 EE 0500 %02X 02 EE 0E00 00*10 "
                                           "03 EE 0C00 00*8 04 EE 0400",
            deviceState));
        const auto row = all.find("k1xTrafficFER=");
        return row == std::string::npos ? "(absent)" : all.substr(row);
    }
};

TEST_F(TrafficFER, IsAnAverageUntilTrafficEnds)
{
    EXPECT_EQ(frame(2), "k1xTrafficFER=1.56%");
    EXPECT_EQ(frame(0), "k1xTrafficFER=1.54%");
    EXPECT_EQ(status(8), "(absent)");
    EXPECT_EQ(status(6), "k1xTrafficFER=1.54% (old)");
    EXPECT_EQ(status(6), "(absent)") << "shown once";
    EXPECT_EQ(frame(0), "k1xTrafficFER=0.00%") << "a new average";
}

TEST_F(TrafficFER, IsRoundedToSinglePrecisionAtEachStep)
{
    for (int i = 0; i < 60; ++i)
        frame(i < 59 ? 1 : 0);
    EXPECT_EQ(frame(0), "k1xTrafficFER=58.64%") << "58.63% in double precision";
    state.remove("TrafficFER");
    for (const int error : {1, 1, 1, 1, 0, 1})
        frame(error);
    EXPECT_EQ(state["TrafficFER"], Value(0.07478243112564087));
    state.set("TrafficFER", static_cast<double>(0.00625F));
    EXPECT_EQ(status(6), "k1xTrafficFER=0.62% (old)") << "0.63% in double precision";
}

} // namespace
} // namespace orvex::test

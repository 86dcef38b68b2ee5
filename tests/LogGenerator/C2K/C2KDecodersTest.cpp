// The decoders of CDMA2000, against cases/MRL_CDMA.txt.

#include "C2KFixture.h"
#include "CaseFile.h"

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

TEST(C2KDecoders, ShowTheirCases)
{
    for (const std::string& line : caseLines("LogGenerator/cases/MRL_CDMA.txt")) {
        SCOPED_TRACE(line.substr(0, 200));
        C2KFixture fixture;
        if (line.find(" => ") != std::string::npos) {
            const TextsCase each(line);
            for (int value = 0; value < 256; ++value) {
                fixture.feed(each.packetWith(value));
                EXPECT_EQ(shown((*fixture.display)[each.row]), each.textFor(value));
            }
            continue;
        }
        const PacketCase each(line);
        RecordingLog log;
        for (const Bytes& packet : each.packets)
            fixture.feed(packet);
        EXPECT_EQ(joined(log.lines), each.log);
        const std::string shownNow = fixture.display->isEmpty() ? "(nothing)" : shown(*fixture.display);
        if (const std::string part = divided(each.shown, "…").second; !part.empty())
            EXPECT_THAT(shownNow, testing::HasSubstr(part));
        else
            EXPECT_EQ(shownNow, each.shown);
    }
}

} // namespace
} // namespace orvex::test

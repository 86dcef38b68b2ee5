#include "GSM/PDPContextList.h"

#include "LogPackets.h"
#include "SectionFixture.h"

namespace orvex::test {
namespace {

TEST(PDPContextList, BecomesTheArrayAsItStands)
{
    SectionFixture<PDPContextList> fixture;
    EXPECT_EQ(fixture.listAfter(propertyListPacket(0xFF0002,
                                    "<array><dict><key>APN</key><string>internet</string></dict>"
                                    "<string>text</string></array>"),
                  0xFF0002),
        (std::vector<RowTexts>{{{"APN", "internet"}}, {{"", "text"}}}));
    EXPECT_EQ(fixture.log.take(), std::vector<std::string>{"<4>PDPContextList"});
    EXPECT_EQ(fixture.listAfter(propertyListPacket(0xFF0007, "<array/>"), 0xFF0007), std::vector<RowTexts>{})
        << "whatever the code";
}

TEST(PDPContextList, DropsAnotherKindAndEndsTheProcessWithoutAList)
{
    SectionFixture<PDPContextList> fixture;
    const std::vector<RowTexts> kept = {{{"", "stale"}}};
    EXPECT_EQ(fixture.listAfter(propertyListPacket(0xFF0002, "<dict/>"), 0xFF0002), kept);
    EXPECT_EQ(fixture.log.take(), std::vector<std::string>{"<4>PDPContextList"});
    EXPECT_THROW(fixture.listAfter(packet(0xFF0002, {'x'}), 0xFF0002), PDPContextList::UnknownDataException);
    EXPECT_THROW(fixture.listAfter(packet(0xFF0002, {}), 0xFF0002), PDPContextList::UnknownDataException);
}

} // namespace
} // namespace orvex::test

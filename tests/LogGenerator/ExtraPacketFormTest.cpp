// The property lists of extra packets, in both of their forms.

#include "GSM/PDPContextList.h"
#include "GSM/UMTSSet.h"
#include "SimInfo.h"

#include "CellLists.h"
#include "PropertyList.h"
#include "SectionFixture.h"

namespace orvex::test {
namespace {

// The same packet with its property list in binary form.
Bytes inBinaryForm(const Bytes& packet)
{
    const auto list = propertyListFromData(ByteView(packet).subspan(kPacketHeaderLength));
    const auto binary = list.value ? propertyListBinary(*list.value) : std::nullopt;
    EXPECT_TRUE(binary) << list.error;
    Bytes result(packet.begin(), packet.begin() + kPacketHeaderLength);
    if (binary)
        result.insert(result.end(), binary->begin(), binary->end());
    EXPECT_EQ(PacketReader(result).u8(kPacketHeaderLength), 'b');
    return result;
}

TEST(ExtraPackets, AreReadInBothForms)
{
    const Bytes cells = cellList(
        cell("UMTS", "Neighbor", {{"UARFCN", 10588}, {"ScramblingCode", 9}, {"RSCP", -101}, {"ECN0", -9}}));
    SectionFixture<UMTSSet> set;
    const auto neighbors = set.listAfter(cells, kExtraCodeCellMonitorList);
    EXPECT_EQ(textOf(neighbors.at(0), "RSCP"), "-101 dBm");
    EXPECT_EQ(set.listAfter(inBinaryForm(cells), kExtraCodeCellMonitorList), neighbors);

    const Bytes contexts = propertyListPacket(
        kExtraCodePDPContexts, "<array><dict><key>APN</key><string>internet</string></dict></array>");
    SectionFixture<PDPContextList> list;
    EXPECT_EQ(list.listAfter(inBinaryForm(contexts), kExtraCodePDPContexts),
        (std::vector<RowTexts>{{{"APN", "internet"}}}));

    const Bytes files =
        propertyListPacket(kExtraCodeSimFiles, "<dict><key>kSimFile_ICCID</key><string>8901</string></dict>");
    SectionFixture<SimInfo> sim;
    EXPECT_EQ(sim.rowsAfter(inBinaryForm(files), kExtraCodeSimFiles), (RowTexts{{"EF-ICCID", "8901"}}));
}

TEST(ExtraPackets, CutInTheirBinaryFormAreNone)
{
    const Bytes cells = inBinaryForm(cellList(cell("UMTS", "Neighbor", {{"UARFCN", 10588}})));
    const Bytes cut(cells.begin(), cells.end() - 1);
    SectionFixture<UMTSSet> set;
    EXPECT_EQ(set.listAfter(cut, kExtraCodeCellMonitorList), std::vector<RowTexts>{});
    EXPECT_EQ(set.log.take(), linesWithoutCellList("UMTSSet"));
    SectionFixture<PDPContextList> list;
    EXPECT_THROW(list.listAfter(cut, kExtraCodePDPContexts), PDPContextList::UnknownDataException);
}

} // namespace
} // namespace orvex::test

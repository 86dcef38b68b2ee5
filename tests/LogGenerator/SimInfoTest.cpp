#include "SimInfo.h"

#include "LogCode_0xFF0000.h"
#include "LogPackets.h"
#include "SectionFixture.h"

namespace orvex::test {
namespace {

TEST(SimInfo, ShowsEachFileUnderItsName)
{
    std::string list = "<dict>";
    for (const char* key : {"OPLMNAcT", "OPL", "PNN", "RATMODE", "AHPLMN", "FPLMN", "AD", "ACC", "PSLOCI",
             "LOCI", "HPPLMN", "MBDN", "MSISDN", "ICCID", "Other"})
        list += text("<key>kSimFile_%s</key><string>%s</string>", key, key);
    list += "</dict>";
    SectionFixture<SimInfo> fixture;
    EXPECT_EQ(fixture.rowsAfter(propertyListPacket(0xFF0000, list), 0xFF0000),
        (RowTexts{{"EF-ICCID", "ICCID"}, {"EF-MSISDN", "MSISDN"}, {"EF-3GPP MAIL BOX DIALING NUMBER", "MBDN"},
            {"EF-HPPLMN SEARCH PERIOD", "HPPLMN"}, {"EF-LOCI", "LOCI"}, {"EF-GPRS/PS-LOCI", "PSLOCI"},
            {"EF-ACCESS CONTROL CLASS", "ACC"}, {"EF-ADMINISTRATIVE DATA", "AD"}, {"EF-FPLMN", "FPLMN"},
            {"EF-ACTING HPLMN", "AHPLMN"}, {"EF-RAT MODE", "RATMODE"}, {"EF-PLMN NETWORK NAME", "PNN"},
            {"EF-OPERATOR PLMN LIST", "OPL"}, {"EF-OPLMNAcT", "OPLMNAcT"}}));
    EXPECT_EQ(fixture.log.take(), std::vector<std::string>{"<4>SimInfo"});
}

TEST(SimInfo, CopiesValuesAsTheyAreAndLeavesOtherRows)
{
    SectionFixture<SimInfo> fixture;
    const auto rows = Dictionary::make({{"EF-ICCID", "-"}, {"EF-FPLMN", "kept"}});
    fixture.section.updateSectionRef(rows);
    fixture.section.updateWithData(
        propertyListPacket(0xFF0000, "<dict><key>kSimFile_ICCID</key><integer>7</integer></dict>"), 0xFF0000);
    EXPECT_EQ(*rows, Dictionary({{"EF-ICCID", 7}, {"EF-FPLMN", "kept"}}));
}

TEST(SimInfo, PayloadThatIsNoDictionaryIsFatal)
{
    SectionFixture<SimInfo> fixture;
    for (const Bytes& bad : {packet(0xFF0000, {}), packet(0xFF0000, {'x'}),
             propertyListPacket(0xFF0000, "<array/>"), Bytes(11, 0)}) {
        EXPECT_THROW(fixture.rowsAfter(bad, 0xFF0000), LogCode_0xFF0000::UnknownDataException);
        EXPECT_EQ(fixture.log.take(),
            (std::vector<std::string>{"<4>SimInfo", "<3>SIM File dictionary data could not be constructed"}));
    }
    EXPECT_EQ(fixture.rowsAfter(packet(0xFF0001, {'x'}), 0xFF0001), RowTexts{})
        << "another code is no matter";
}

} // namespace
} // namespace orvex::test

// Packets of the telephony service: SIM files, PDP contexts, and the property lists of all in both forms.

#include "GSM/MRL_GSMLogGenerator.h"

#include "PropertyListForms.h"
#include "SectionCases.h"

namespace orvex::test {
namespace {

TEST(ExtraPackets, SimFilesAndPDPContexts)
{
    std::string files;
    for (const char* key : {"OPLMNAcT", "OPL", "PNN", "RATMODE", "AHPLMN", "FPLMN", "AD", "ACC", "PSLOCI",
             "LOCI", "HPPLMN", "MBDN", "MSISDN", "ICCID", "Other"})
        files += text("<key>kSimFile_%s</key><string>%s</string>", key, key);
    const char* name = "SIM Info";
    const char* contexts = "PDP Context Info";
    const char* fatal = "throws orvex::LogCode_0xFF0000::UnknownDataException";
    expectShown<MRL_GSMClassIndex>({
        {name, "FF0000: <dict>" + files + "</dict>",
            "EF-ICCID=ICCID, EF-MSISDN=MSISDN, EF-3GPP MAIL BOX DIALING NUMBER=MBDN, "
            "EF-HPPLMN SEARCH PERIOD=HPPLMN, EF-LOCI=LOCI, EF-GPRS/PS-LOCI=PSLOCI, "
            "EF-ACCESS CONTROL CLASS=ACC, EF-ADMINISTRATIVE DATA=AD, EF-FPLMN=FPLMN, "
            "EF-ACTING HPLMN=AHPLMN, EF-RAT MODE=RATMODE, EF-PLMN NETWORK NAME=PNN, "
            "EF-OPERATOR PLMN LIST=OPL, EF-OPLMNAcT=OPLMNAcT"},
        // Values are copied as they are; rows of files that are not there stay.
        {name,
            "FF0000: <dict><key>kSimFile_FPLMN</key><string>kept</string></dict>;"
            "FF0000: <dict><key>kSimFile_ICCID</key><integer>7</integer></dict>",
            "EF-FPLMN=kept, EF-ICCID=(integer)"},
        {name, "FF0000: ", fatal},
        {name, "FF0000: <array/>", fatal},
        {name, "FF0001: no list", "(nothing)"},
        {contexts,
            "FF0002: <array><dict><key>APN</key><string>internet</string></dict><string>x</string></array>",
            "APN=internet | x"},
        {contexts, "FF0007: <array/>", "(empty)"}, // whatever the code
        {contexts, "FF0002: <dict/>", "(nothing)"},
        {contexts, "FF0002: ", "throws orvex::PDPContextList::UnknownDataException"},
    });
}

TEST(ExtraPackets, AreReadInBinaryFormToo)
{
    const MRL_GSMClassIndex index;
    const auto text = [](std::string_view characters) {
        Bytes object{0x5F, 0x10, static_cast<std::uint8_t>(characters.size())};
        object.insert(object.end(), characters.begin(), characters.end());
        return object;
    };
    const Bytes binary = binaryList({{0xD3, 1, 2, 3, 4, 5, 6}, text("kSimFile_ICCID"), text("kSimFile_LOCI"),
        text("kSimFile_AD"), text("8901"), {0x80, 7}, {0xC1, 4}});
    Bytes bytes = packetHeader(kExtraCodeSimFiles);
    bytes.insert(bytes.end(), binary.begin(), binary.end());
    EXPECT_EQ(outcomeOf(*index.getClass("SIM Info"), {bytes}).shown,
        "EF-ICCID=8901, EF-LOCI=(UID), EF-ADMINISTRATIVE DATA=(set)");
}

} // namespace
} // namespace orvex::test

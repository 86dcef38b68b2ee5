// The sections of the GSM side: serving cell, neighbours, GPRS options, radio resources, mobility.

#include "GSM/MRL_GSMLogGenerator.h"

#include "SectionCases.h"

namespace orvex::test {
namespace {

// 0x5137 up to its count of neighbours.
const std::string kSurround = "5137: AA AA C8 02800100 FEFFFEFF AA AA 02 AA ";

constexpr const char* kNoList = "Cell Info Array data could not be constructedFailed to get Cell Array\n";

TEST(GSMSections, ServingCell)
{
    const char* name = "GSM Serving Cell";
    expectShown<MRL_GSMClassIndex>({
        {name, "5134: 3412 3F80 FEFF 00*7", "Cell ID=65534, ARFCN=4660, BSIC=32831"},
        {name, kSurround + "00", "RSSI=200 dBm, C1 Value=32770, C2 Value=65534"}, // low 16 bits, no sign
        {name, "5076: 2301 0000", "MA Dedicated ARFCN=35"},
        {name,
            "FF0001: UMTS Serving CellID=1, GSM Neighbor CellID=2, GSM Serving CellID=-5 ARFCN=70000, "
            "GSM Serving CellID=3 ARFCN=4",
            "Cell ID=-5, ARFCN=70000"},
        {name, "FF0001: GSM Serving", "(nothing)",
            "GSMServingCell: Failed to retrieve Cell ID\nGSMServingCell: Failed to retrieve ARFCN\n"},
        {name, "FF0001: no list", "(nothing)", kNoList},
    });
}

TEST(GSMSections, NeighboringCells)
{
    const char* name = "Neighboring Cells";
    const std::string two = kSurround + "02 3412 5A FFFFFFFF 01*7 0A00 FF 04030201 00*7";
    const std::string first = "ARFCN=4660, RSSI=90, C1 Value=-1 | ";
    const std::string second = "ARFCN=10, RSSI=255, C1 Value=16909060";
    const std::string codes = "51FF: AA 02 0A00 05 AA 3512 07 AA;";
    expectShown<MRL_GSMClassIndex>({
        {name, codes, "(nothing)"},
        // The BSIC that is known for their channel; a new map after each packet of them.
        {name, codes + two, first + second + ", BSIC=5"},
        {name, codes + "51FF: AA 01 0A00 3F;" + two, first + second},
        {name, kSurround + "FF 01*3570", "#255"},
        // Levels of the list count in steps of 2 dB.
        {name,
            "FF0001: GSM Neighbor ARFCN=66559 RSSI=-50, GSM Serving ARFCN=1, UMTS Neighbor ARFCN=2,"
            "GSM Neighbor ARFCN=-1 RSSI=32767, GSM Neighbor ARFCN=3 RSSI=65535, GSM Neighbor",
            "ARFCN=1023, RSSI=-100 dBm | ARFCN=65535, RSSI= | ARFCN=3, RSSI=-2 dBm | ",
            "NeighboringCells: Failed to retrieve ARFCN\nNeighboringCells: Failed to retrieve RSSI\n"},
        {name, "FF0001: no list", "(empty)", kNoList},
    });
}

TEST(GSMSections, GPRSInformation)
{
    const char* name = "GPRS Information";
    expectShown<MRL_GSMClassIndex>({
        {name, "51F6: 09 09 04 3F 00 @40", "T3192=80 ms, Access Burst Type=8-bit format, DRX Timer Max=63"},
        {name, "51FB: FF @40", "PBCCH Present=255"},
        {name, "51FD: 01 02 03 04 @40",
            "Ext Measurement Order=4, Packet PSI Status=1, Packet SI Status=Supported, Count LR=2, Count "
            "HR=3"},
    });
    expectTexts<MRL_GSMClassIndex>({
        {name, 0x7135, 13, "Network Operating Mode", "Class 1|Class 2|Class 3"},
        {name, 0x51F6, 17, "Access Burst Type", "8-bit format", "11-bit format"},
        {name, 0x51FD, 33, "Packet SI Status", "Not Supported", "Supported"},
        {name, 0x5137, 26, "Cell Reselect Hysteresis", "Not Applied", "Applied"},
        {name, 0x51F5, 15, "Network Control Order", "NC0|NC1|NC2|255=Not Available"},
        {name, 0x51F5, 13, "PFC Supported", "Not Supported|Supported|255=Available"},
        {name, 0x51F5, 14, "Priority Access Threshold",
            "Barred (PKT access not allowed in the Cell)|Barred|Barred|1 Only|1 to 2|1 to 3|1 to 4|Allowed|"
            "255=Not Available"},
        {name, 0x51F6, 15, "T3192", "500 ms|1000 ms|1500 ms|0 ms|80 ms|120 ms|160 ms|200 ms", "?? ms"},
        {name, 0x51F4, 14, "SI13 Position", "Located on BCCH|Located on Extended BCCH|255=Not Available"},
    });
}

TEST(GSMSections, RadioResourcesAndHopping)
{
    const char* name = "GSM RR Info";
    const char* hopping = "Mobile Allocation";
    expectShown<MRL_GSMClassIndex>({
        {name, "512C: 05 06 07 08", "RR State=RR_IDLE, RR Sub State=6, RR Status=7, RR Mode=Data"},
        {name, kSurround + "00", "Serving Rx Level=200, Rx Quality Full=98306, Rx Quality Sub=-65538"},
        {name, "51F6: @16 07 @24", "DRX Used=7 sec"},
        {hopping, "51F8: 3F 02 3412 FFFF", "HSN=63, ARFCNs=[4660 | 65535]"},
    });
    expectTexts<MRL_GSMClassIndex>(
        {{name, 0x5072, 19, "DTX Used", "OFF", "ON"}, {name, 0x512C, 16, "RR Mode", "Voice", "Data"},
            {name, 0x512C, 13, "RR State",
                "RR_INACTIVE|RR_GOING_ACTIVE|RR_GOING_INACTIVE|RR_CELL_SELECTION|RR_PLMN_LIST_CONSTRUCTION|"
                "RR_IDLE|"
                "RR_CELL_RESELECTION|RR_CONNECTION_PENDING|RR_CHOOSE_CELL|RR_DATA_TRANSFER|RR_NO_CHANNELS|"
                "RR_CONNECTION_RELEASE|RR_EARLY_CAMPED_WAIT_FOR_SI|RR_W2G_INTERRAT_HANDOVER_ PROGRESS|"
                "RR_W2G_INTERRAT_RESELECTION_PROGRESS|RR_WAIT_FOR_EARLY_PSCAN|GRR51|GRR52|"
                "RR_G2W_INTERRAT_RESELECTION_PROGRESS|RR_G2W_INTERRAT_HANDOVER_ PROGRESS|RR_CELL_REEST|"
                "RR_W2G_INTERRAT_CC_ORDER_ PROGRESS"}});
}

TEST(GSMSections, MobilityStates)
{
    const char* registration = "REG_STATE_INACTIVE|REG_STATE_IDLE|REG_STATE_REGISTERING|"
                               "REG_STATE_DEREGISTERING|REG_STATE_MANUAL_SEARCH|REG_STATE_AUTOMATIC_SEARCH|"
                               "REG_STATE_OFFLINE";
    const char* mm =
        "MM_NULL|3=MM_LOCATION_UPDATE_INITIATED|5=MM_WAIT_FOR_OUTGOING_MM_CONNECTION|MM_CONNECTION_ACTIVE|"
        "MM_IMSI_DETACH_INITIATED|MM_PROCESS_CM_SERVICE_PROMPT|MM_WAIT_FOR_NETWORK_COMMAND|"
        "MM_LOCATION_UPDATE_REJECTED|13=MM_WAIT_FOR_RR_CONNECTION_LU|MM_WAIT_FOR_RR_CONNECTION_MM|"
        "MM_WAIT_FOR_RR_CONNECTION_IMSI_DETACH|17=MM_REESTABLISHMENT_INITIATED|MM_WAIT_FOR_RR_ACTIVE|MM_IDLE|"
        "MM_WAIT_FOR_ADDITIONAL_OUTGOING_MM_ CONNECTION|MM_WAIT_FOR_RR_CONNECTION_ REESTABLISHMENT|"
        "MM_WAIT_FOR_REESTABLISH_DECISION|MM_LOCATION_UPDATING_PENDING|"
        "25=MM_RR_CONNECTION_RELEASE_NOT_ALLOWED";
    expectTexts<MRL_GSMClassIndex>({
        {"Process CO", 0x7132, 13, "MM Service State", registration},
        {"Process CS", 0x7132, 13, "MM Service State", registration},
        {"Process PS", 0x7132, 13, "MM Service State", registration},
        {"Process CO", 0x7131, 13, "MM State", mm},
        {"Process CS", 0x7131, 13, "MM State", mm},
        {"Process CS", 0x7131, 14, "MM Sub State",
            "MM_NULL_SUBSTATE|MM_NO_IMSI|MM_PLMN_SEARCH|MM_LIMITED_SERVICE|MM_ATTEMPTING_TO_UPDATE|"
            "MM_LOCATION_UPDATE_NEEDED|MM_NO_CELL_AVAILABLE|MM_PLMN_SEARCH_NORMAL_SERVICE|MM_NORMAL_SERVICE"},
        {"Process CS", 0x7131, 15, "LU Reject Cause",
            "UPDATED|NOT_UPDATED|ROAMING_NOT_ALLOWED|LOCATION_AREA_NOT_ALLOWED"},
        {"Process PS", 0x7130, 13, "MM State",
            "GMM_NULL|GMM_DEREGISTERED|GMM_REGISTERED_INITIATED|GMM_REGISTERED|GMM_DEREGISTERED_INITIATED|"
            "GMM_ROUTING_AREA_UPDATE_INITIATED|GMM_SERVICE_REQUEST_INITIATED"},
        {"Process PS", 0x7130, 14, "MM Sub State",
            "GMM_NORMAL_SERVICE|GMM_LIMITED_SERVICE|GMM_ATTACH_NEEDED|GMM_ATTEMPTING_TO_ATTACH|GMM_NO_IMSI|"
            "GMM_NO_CELL_AVAILABLE|GMM_PLMN_SEARCH|GMM_SUSPENDED|GMM_UPDATE_NEEDED|GMM_ATTEMPING_TO_UPDATE|"
            "GMM_ATTEMPTING_TO_UPDATE_MM|GMM_IMSI_DETACH_INITIATED|GMM_NULL_SUBSTATE"},
        {"Process PS", 0x7130, 15, "Attach Reject Cause",
            "GMM_GU1_UPDATED|GMM_GU2_NOT_UPDATED|GMM_GU3_PLMN_NOT_ALLOWED|GMM_GU3_ROUTING_AREA_NOT_ALLOWED"},
        {"Serving PLMN", 0x7132, 14, "PLMN Sel Mod",
            "Automatic|Manual|Limited|LIMITED_ROUTINE_ACQ|LIMITED_MANUAL_ACQ"},
        {"Serving PLMN", 0x7135, 14, "Service Type",
            "NO_SERVICE|CS_ONLY|PS_ONLY|CS_PS_SERVICE|LIMITED_SERVICE"},
    });
    expectShown<MRL_GSMClassIndex>({{"Process CO", "7131: 13 08 01", "MM State=MM_IDLE"}});
}

TEST(GSMSections, Networks)
{
    const char* name = "Serving PLMN";
    const char* list = "Equivalent PLMN List";
    const auto area = [](const char* country, const char* network) {
        return text("Mobile Country Code=%s, Mobile Network Code=%s, Location Area Code=4660, "
                    "Routing Area Code=200, Service Type=CS_PS_SERVICE",
            country, network);
    };
    const char* gsm = "GSM Serving MCC=260 MNC=1 LAC=4660,";
    const char* umts = "UMTS Serving MCC=70310 MNC=70410 LAC=-7,";
    const std::string others = "FF0001: LTE Serving MCC=1,GSM Neighbor MCC=2,";
    expectShown<MRL_GSMClassIndex>({
        {name, "7135: EE 03 62F010 1234 C8 @32", area("260", "01 ")},
        {name, "7135: EE 03 133014 1234 C8 @32", area("310", "413")},
        {name, "7135: EE 03 A2A998 1234 C8 @32", area("2 9", "89 ")},
        {name, "7135: EE 03 9A9FAA 1234 C8 @32", area(" 9 ", "  9")},
        {name, others + gsm + umts,
            "Mobile Country Code=260, Mobile Network Code=1, Location Area Code=4660"},
        {name, others + umts + gsm,
            "Mobile Country Code=70310, Mobile Network Code=70410, Location Area Code=-7"},
        {name, others + "UMTS Serving", "(nothing)",
            "ServingPLMN: Failed to retrieve MCC\nServingPLMN: Failed to retrieve MNC\n"
            "ServingPLMN: Failed to retrieve LAC\n"},
        {name, "FF0001: no list", "(nothing)", kNoList},
        // Entries are 3 bytes apart and 6 long. Numbers, not digits.
        {list, "7150: 00*3 02 03 01 00 00 01 05 02 06 09",
            "Mobile Country Code=301, Mobile Network Code=105 | "
            "Mobile Country Code=56, Mobile Network Code=129"},
        {list, "7150: 00*3 01 FF*6", "Mobile Country Code=28305, Mobile Network Code=28305"},
        {list, "7150: 00*3 FF FF*768", "#255"},
    });
}

} // namespace
} // namespace orvex::test

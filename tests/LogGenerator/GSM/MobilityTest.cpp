// Mobility management: states, the serving network, equivalent networks.

#include "GSM/EquivalentPLMNList.h"
#include "GSM/ProcessCO.h"
#include "GSM/ProcessCS.h"
#include "GSM/ProcessPS.h"
#include "GSM/ServingPLMN.h"

#include "ByteTexts.h"
#include "CellLists.h"

namespace orvex::test {
namespace {

using Lines = std::vector<std::string>;

const std::map<int, const char*> kRegistrationStates = {{0, "REG_STATE_INACTIVE"}, {1, "REG_STATE_IDLE"},
    {2, "REG_STATE_REGISTERING"}, {3, "REG_STATE_DEREGISTERING"}, {4, "REG_STATE_MANUAL_SEARCH"},
    {5, "REG_STATE_AUTOMATIC_SEARCH"}, {6, "REG_STATE_OFFLINE"}};

const std::map<int, const char*> kMMStates = {{0, "MM_NULL"}, {3, "MM_LOCATION_UPDATE_INITIATED"},
    {5, "MM_WAIT_FOR_OUTGOING_MM_CONNECTION"}, {6, "MM_CONNECTION_ACTIVE"}, {7, "MM_IMSI_DETACH_INITIATED"},
    {8, "MM_PROCESS_CM_SERVICE_PROMPT"}, {9, "MM_WAIT_FOR_NETWORK_COMMAND"},
    {10, "MM_LOCATION_UPDATE_REJECTED"}, {13, "MM_WAIT_FOR_RR_CONNECTION_LU"},
    {14, "MM_WAIT_FOR_RR_CONNECTION_MM"}, {15, "MM_WAIT_FOR_RR_CONNECTION_IMSI_DETACH"},
    {17, "MM_REESTABLISHMENT_INITIATED"}, {18, "MM_WAIT_FOR_RR_ACTIVE"}, {19, "MM_IDLE"},
    {20, "MM_WAIT_FOR_ADDITIONAL_OUTGOING_MM_ CONNECTION"},
    {21, "MM_WAIT_FOR_RR_CONNECTION_ REESTABLISHMENT"}, {22, "MM_WAIT_FOR_REESTABLISH_DECISION"},
    {23, "MM_LOCATION_UPDATING_PENDING"}, {25, "MM_RR_CONNECTION_RELEASE_NOT_ALLOWED"}};

TEST(MobilitySections, NameTheirStates)
{
    expectTextsOfByte<ProcessCO>(0x7132, 13, "MM Service State", kRegistrationStates, "Unknown");
    expectTextsOfByte<ProcessCS>(0x7132, 13, "MM Service State", kRegistrationStates, "Unknown");
    expectTextsOfByte<ProcessPS>(0x7132, 13, "MM Service State", kRegistrationStates, "Unknown");
    expectTextsOfByte<ProcessCO>(0x7131, 13, "MM State", kMMStates, "Unknown");
    expectTextsOfByte<ProcessCS>(0x7131, 13, "MM State", kMMStates, "Unknown");
    expectTextsOfByte<ProcessCS>(0x7131, 14, "MM Sub State",
        {{0, "MM_NULL_SUBSTATE"}, {1, "MM_NO_IMSI"}, {2, "MM_PLMN_SEARCH"}, {3, "MM_LIMITED_SERVICE"},
            {4, "MM_ATTEMPTING_TO_UPDATE"}, {5, "MM_LOCATION_UPDATE_NEEDED"}, {6, "MM_NO_CELL_AVAILABLE"},
            {7, "MM_PLMN_SEARCH_NORMAL_SERVICE"}, {8, "MM_NORMAL_SERVICE"}},
        "Unknown");
    expectTextsOfByte<ProcessCS>(0x7131, 15, "LU Reject Cause",
        {{0, "UPDATED"}, {1, "NOT_UPDATED"}, {2, "ROAMING_NOT_ALLOWED"}, {3, "LOCATION_AREA_NOT_ALLOWED"}},
        "Unknown");
    expectTextsOfByte<ProcessPS>(0x7130, 13, "MM State",
        {{0, "GMM_NULL"}, {1, "GMM_DEREGISTERED"}, {2, "GMM_REGISTERED_INITIATED"}, {3, "GMM_REGISTERED"},
            {4, "GMM_DEREGISTERED_INITIATED"}, {5, "GMM_ROUTING_AREA_UPDATE_INITIATED"},
            {6, "GMM_SERVICE_REQUEST_INITIATED"}},
        "Unknown");
    expectTextsOfByte<ProcessPS>(0x7130, 14, "MM Sub State",
        {{0, "GMM_NORMAL_SERVICE"}, {1, "GMM_LIMITED_SERVICE"}, {2, "GMM_ATTACH_NEEDED"},
            {3, "GMM_ATTEMPTING_TO_ATTACH"}, {4, "GMM_NO_IMSI"}, {5, "GMM_NO_CELL_AVAILABLE"},
            {6, "GMM_PLMN_SEARCH"}, {7, "GMM_SUSPENDED"}, {8, "GMM_UPDATE_NEEDED"},
            {9, "GMM_ATTEMPING_TO_UPDATE"}, {10, "GMM_ATTEMPTING_TO_UPDATE_MM"},
            {11, "GMM_IMSI_DETACH_INITIATED"}, {12, "GMM_NULL_SUBSTATE"}},
        "Unknown");
    expectTextsOfByte<ProcessPS>(0x7130, 15, "Attach Reject Cause",
        {{0, "GMM_GU1_UPDATED"}, {1, "GMM_GU2_NOT_UPDATED"}, {2, "GMM_GU3_PLMN_NOT_ALLOWED"},
            {3, "GMM_GU3_ROUTING_AREA_NOT_ALLOWED"}},
        "Unknown");
    expectTextsOfByte<ServingPLMN>(0x7132, 14, "PLMN Sel Mod",
        {{0, "Automatic"}, {1, "Manual"}, {2, "Limited"}, {3, "LIMITED_ROUTINE_ACQ"},
            {4, "LIMITED_MANUAL_ACQ"}},
        "Unknown");
    expectTextsOfByte<ServingPLMN>(0x7135, 14, "Service Type",
        {{0, "NO_SERVICE"}, {1, "CS_ONLY"}, {2, "PS_ONLY"}, {3, "CS_PS_SERVICE"}, {4, "LIMITED_SERVICE"}},
        "Unknown");
}

TEST(MobilitySections, WriteTheirRowsInOrder)
{
    const Bytes states = packet(0x7131, {19, 8, 1});
    SectionFixture<ProcessCO> co;
    EXPECT_EQ(co.rowsAfter(states, 0x7131), (RowTexts{{"MM State", "MM_IDLE"}}));
    EXPECT_EQ(co.log.take(), Lines{"<4>ProcessCS"});
    SectionFixture<ProcessCS> cs;
    EXPECT_EQ(cs.rowsAfter(states, 0x7131),
        (RowTexts{{"MM State", "MM_IDLE"}, {"MM Sub State", "MM_NORMAL_SERVICE"},
            {"LU Reject Cause", "NOT_UPDATED"}}));
    SectionFixture<ProcessPS> ps;
    EXPECT_EQ(ps.rowsAfter(packet(0x7130, {3, 8, 2}), 0x7130),
        (RowTexts{{"MM State", "GMM_REGISTERED"}, {"MM Sub State", "GMM_UPDATE_NEEDED"},
            {"Attach Reject Cause", "GMM_GU3_PLMN_NOT_ALLOWED"}}));
}

TEST(ServingPLMN, ReadsDigitsAndAreaCodes)
{
    const struct {
        const char* name;
        Bytes identity;
        const char* country;
        const char* network;
    } cases[] = {
        {"two-digit network code", {0x62, 0xF0, 0x10}, "260", "01 "},
        {"three-digit network code", {0x13, 0x30, 0x14}, "310", "413"},
        {"no digit in the high half", {0xA2, 0xA9, 0x98}, "2 9", "89 "},
        {"no digit in the low half", {0x9A, 0x9F, 0xAA}, " 9 ", "  9"},
        {"nothing", {0xFF, 0xFF, 0xFF}, "   ", "   "},
    };
    SectionFixture<ServingPLMN> fixture;
    for (const auto& [name, identity, country, network] : cases) {
        Bytes payload = {0xEE, 3, identity[0], identity[1], identity[2], 0x12, 0x34, 200};
        payload.resize(19, 0xEE);
        EXPECT_EQ(fixture.rowsAfter(packet(0x7135, payload), 0x7135),
            (RowTexts{{"Mobile Country Code", country}, {"Mobile Network Code", network},
                {"Location Area Code", "4660"}, {"Routing Area Code", "200"},
                {"Service Type", "CS_PS_SERVICE"}}))
            << name;
    }
}

TEST(ServingPLMN, TakesTheFirstServingCellOfEitherTechnology)
{
    SectionFixture<ServingPLMN> fixture;
    const auto rows = [&fixture](const std::string& cells) {
        return fixture.rowsAfter(cellList(cells), kExtraCodeCellMonitorList);
    };
    const std::string gsm = cell("GSM", "Serving", {{"MCC", 260}, {"MNC", 1}, {"LAC", 4660}});
    const std::string umts = cell("UMTS", "Serving", {{"MCC", 70310}, {"MNC", 70410}, {"LAC", -7}});
    const std::string others = cell("LTE", "Serving", {{"MCC", 1}}) + cell("GSM", "Neighbor", {{"MCC", 2}});
    const RowTexts gsmRows = {
        {"Mobile Country Code", "260"}, {"Mobile Network Code", "1"}, {"Location Area Code", "4660"}};
    EXPECT_EQ(rows(others + gsm + umts), gsmRows);
    EXPECT_EQ(rows(others + umts + gsm),
        (RowTexts{{"Mobile Country Code", "70310"}, {"Mobile Network Code", "70410"},
            {"Location Area Code", "-7"}}));
    EXPECT_EQ(rows(others), RowTexts{});
    EXPECT_EQ(fixture.log.take(), Lines{"<4>Serving PLMN"});
    rows(cell("UMTS", "Serving", {}));
    EXPECT_EQ(fixture.log.take(),
        (Lines{"<4>Serving PLMN", "<3>ServingPLMN: Failed to retrieve MCC\n",
            "<3>ServingPLMN: Failed to retrieve MNC\n", "<3>ServingPLMN: Failed to retrieve LAC\n"}));
    EXPECT_EQ(fixture.rowsAfter(kNoCellList, kExtraCodeCellMonitorList), RowTexts{});
    EXPECT_EQ(fixture.log.take(), linesWithoutCellList("Serving PLMN"));
    EXPECT_THROW(fixture.rowsAfter(
                     propertyListPacket(kExtraCodeCellMonitorList, "<dict/>"), kExtraCodeCellMonitorList),
        CellMonitorList::WrongKindException);
}

TEST(EquivalentPLMNList, ReadsEntriesThatReachIntoTheNext)
{
    const auto rowsOfPLMN = [](const char* country, const char* network) {
        return RowTexts{{"Mobile Country Code", country}, {"Mobile Network Code", network}};
    };
    SectionFixture<EquivalentPLMNList> fixture;
    const Bytes two = {0, 0, 0, 2, 3, 1, 0, 0, 1, 5, 2, 6, 9};
    EXPECT_EQ(fixture.listAfter(packet(0x7150, two), 0x7150),
        (std::vector<RowTexts>{rowsOfPLMN("301", "105"), rowsOfPLMN("56", "129")}));
    EXPECT_EQ(fixture.log.take(), Lines{"<4>Equivalent PLMN List"});
    EXPECT_EQ(fixture.listAfter(packet(0x7150, {0, 0, 0, 1, 0, 0, 2, 0, 6, 7}), 0x7150),
        std::vector<RowTexts>{rowsOfPLMN("26", "7")})
        << "numbers, not digits";

    const struct {
        const char* name;
        std::uint8_t count;
        std::size_t bytes;
        std::size_t plmns;
    } cases[] = {{"none", 0, 60, 0}, {"one", 1, 6, 1}, {"one cut", 1, 5, 0}, {"two in nine bytes", 9, 9, 2},
        {"the second one cut", 2, 8, 1}, {"all that can be counted", 255, 768, 255}};
    for (const auto& [name, count, size, plmns] : cases) {
        Bytes payload = {0, 0, 0, count};
        payload.resize(4 + size, 255);
        const auto list = fixture.listAfter(packet(0x7150, payload), 0x7150);
        EXPECT_EQ(list, std::vector<RowTexts>(plmns, rowsOfPLMN("28305", "28305"))) << name;
    }
}

} // namespace
} // namespace orvex::test

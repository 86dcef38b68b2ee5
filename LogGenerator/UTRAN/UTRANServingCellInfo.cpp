#include "UTRAN/UTRANServingCellInfo.h"

#include "EnumTable.h"

#include "SystemLog.h"
#include "TelephonyConstants.h"
#include "TextFormat.h"

namespace orvex {

namespace {

constexpr EnumText kRRCModes[] = {{0, "Disconnected"}, {1, "Connecting"}, {2, "Cell Fach"}, {3, "Cell DCH"},
    {4, "Cell PCH"}, {5, "Cell URA PCH"}};

// {Name = text; ...}, for the console.
std::string describe(const Dictionary* rows)
{
    if (!rows)
        return "(null)";
    std::string result = "{";
    for (const auto& [key, value] : *rows)
        result += key + " = " + (value.string() ? *value.string() : nameOf(value.kind())) + "; ";
    return result + "}";
}

} // namespace

RRC_State::RRC_State(ClassDictionary& dict, CodeDictionary& codeDict)
    : Base("RRC Info", {LogCode_0xD0E0::kCode}, dict, codeDict)
{
}

void RRC_State::updateWithData(Packet packet, LogCode logCode)
{
    systemLog(Priority::warning, "RRC Info");
    if (logCode != LogCode_0xD0E0::kCode)
        return;
    // Logged but not rejected: a missing state reads as invalid and shows as unknown.
    if (packet.size() < LogCode_0xD0E0::kExpectedLength) {
        systemLog(Priority::warning, "LogCode_0xD0E0 is length is %ld expected size %ld",
            static_cast<long>(packet.size()), static_cast<long>(LogCode_0xD0E0::kExpectedLength));
    }
    const int state = LogCode_0xD0E0(packet).state();
    const char* name = textFor(state, kRRCModes, "Unknown RRC Mode");
    RowWriter row = rows();
    row.setText("State", name);
    writeConsoleLine(
        text("Display Dict = %s, rrc mode = %d %s", describe(row.dictionary()).c_str(), state, name));
}

namespace {

// The list has a single UARFCN. It goes into both rows and replaces the baseband's two.
constexpr CellEntry kUTRANCellEntries[] = {
    {telephony::kCellLAC, "Local Area Code", "LAC"},
    {telephony::kCellID, "Cell ID", "Cell ID"},
    {telephony::kCellBandInfo, "Freq Band Indicator", "Freq Band Indicator"},
    {telephony::kCellScramblingCode, "Cell Scrambling Code", "Cell Scrambling Code"},
    {.key = telephony::kCellUARFCN,
        .row = "Uplink UARFCN",
        .nameInMessage = "UARFCN",
        .otherRow = "Downlink UARFCN"},
};

} // namespace

UTRANServingCellInfo::UTRANServingCellInfo(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection(
        "Serving Cell Info", {Priority::warning, "Serving Cell Info"}, OtherCodes::areIgnored, dict, codeDict)
{
}

void UTRANServingCellInfo::update(const LogCode_0xD0E2& cell)
{
    RowWriter row = rows();
    row.setText("Cell Access Restrictions", "%d", cell.cellAccessRestrictions());
    row.setText("Cell ID", "%d", cell.cellIdentity());
    row.setText("Downlink UARFCN", "%d", cell.downlinkUARFCN());
    row.setText("Uplink UARFCN", "%d", cell.uplinkUARFCN());
    row.setText("URA ID", "%d", cell.uraIdentity());
    row.setText("Allowed Access", cell.isBarred() ? "Emergency Calls Only" : "All Calls");
}

void UTRANServingCellInfo::update(const CellMonitorList& list)
{
    RowWriter row = rows();
    for (const CellRecord& cell : list.findAll(telephony::kRadioUTRAN, telephony::kCellTypeServing))
        printCell(row, cell, kUTRANCellEntries, "Serving Cell Info"); // of several, the last one wins
}

} // namespace orvex

#include "GSM/ServingPLMN.h"

#include "EnumTable.h"

#include "TelephonyConstants.h"
#include "TextFormat.h"

namespace orvex {

namespace {

constexpr EnumText kServiceTypes[] = {
    {0, "NO_SERVICE"}, {1, "CS_ONLY"}, {2, "PS_ONLY"}, {3, "CS_PS_SERVICE"}, {4, "LIMITED_SERVICE"}};

constexpr EnumText kSelectionModes[] = {
    {0, "Automatic"}, {1, "Manual"}, {2, "Limited"}, {3, "LIMITED_ROUTINE_ACQ"}, {4, "LIMITED_MANUAL_ACQ"}};

constexpr CellEntry kNetworkEntries[] = {
    {telephony::kCellMCC, "Mobile Country Code", "MCC"},
    {telephony::kCellMNC, "Mobile Network Code", "MNC"},
    {telephony::kCellLAC, "Location Area Code", "LAC"},
};

void printDigits(RowWriter& row, const char* name, const LogCode_0x7135::Digits& digits)
{
    row.set(name, text("%c%c%c", digits[0], digits[1], digits[2]));
}

} // namespace

ServingPLMN::ServingPLMN(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Serving PLMN", dict, codeDict)
{
}

void ServingPLMN::update(const LogCode_0x7135& report)
{
    RowWriter row = rows();
    printDigits(row, "Mobile Country Code", report.mobileCountryCode());
    printDigits(row, "Mobile Network Code", report.mobileNetworkCode());
    row.setText("Location Area Code", "%d", report.locationAreaCode());
    row.setText("Routing Area Code", "%d", report.routingAreaCode());
    row.setText("Service Type", textFor(report.serviceType(), kServiceTypes, "Unknown"));
}

void ServingPLMN::update(const LogCode_0x7132& report)
{
    rows().setText("PLMN Sel Mod", textFor(report.plmnSelectionMode(), kSelectionModes, "Unknown"));
}

void ServingPLMN::update(const CellMonitorList& list)
{
    list.reportIfAbsent();
    RowWriter row = rows();
    if (const CellRecord* cell =
            list.find({telephony::kRadioUMTS, telephony::kRadioGSM}, telephony::kCellTypeServing))
        printCell(row, *cell, kNetworkEntries, "ServingPLMN");
}

EquivalentPLMNList::EquivalentPLMNList(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Equivalent PLMN List", dict, codeDict)
{
}

void EquivalentPLMNList::update(const LogCode_0x7150& report)
{
    RowList list(array());
    for (const auto& plmn : report.plmns()) {
        RowWriter& row = list.next();
        row.setText("Mobile Country Code", "%d", plmn.mobileCountryCode());
        row.setText("Mobile Network Code", "%d", plmn.mobileNetworkCode());
    }
}

} // namespace orvex

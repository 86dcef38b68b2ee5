#include "GSM/GSMRRInfo.h"

#include "EnumTable.h"

namespace orvex {

namespace {

// The blanks inside three of the names are the modem's own.
constexpr EnumText kRRStates[] = {
    {0, "RR_INACTIVE"},
    {1, "RR_GOING_ACTIVE"},
    {2, "RR_GOING_INACTIVE"},
    {3, "RR_CELL_SELECTION"},
    {4, "RR_PLMN_LIST_CONSTRUCTION"},
    {5, "RR_IDLE"},
    {6, "RR_CELL_RESELECTION"},
    {7, "RR_CONNECTION_PENDING"},
    {8, "RR_CHOOSE_CELL"},
    {9, "RR_DATA_TRANSFER"},
    {10, "RR_NO_CHANNELS"},
    {11, "RR_CONNECTION_RELEASE"},
    {12, "RR_EARLY_CAMPED_WAIT_FOR_SI"},
    {13, "RR_W2G_INTERRAT_HANDOVER_ PROGRESS"},
    {14, "RR_W2G_INTERRAT_RESELECTION_PROGRESS"},
    {15, "RR_WAIT_FOR_EARLY_PSCAN"},
    {16, "GRR51"},
    {17, "GRR52"},
    {18, "RR_G2W_INTERRAT_RESELECTION_PROGRESS"},
    {19, "RR_G2W_INTERRAT_HANDOVER_ PROGRESS"},
    {20, "RR_CELL_REEST"},
    {21, "RR_W2G_INTERRAT_CC_ORDER_ PROGRESS"},
};

} // namespace

GSMRRInfo::GSMRRInfo(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("GSM RR Info", "GSMRRInfo", dict, codeDict)
{
}

void GSMRRInfo::update(const LogCode_0x512C& report)
{
    RowWriter row = rows();
    row.setText("RR State", textFor(report.state(), kRRStates, "Unknown"));
    row.setText("RR Sub State", "%d", report.subState());
    row.setText("RR Status", "%d", report.status());
    row.setText("RR Mode", report.isData() ? "Data" : "Voice");
}

void GSMRRInfo::update(const LogCode_0x5137& report)
{
    RowWriter row = rows();
    row.setText("Serving Rx Level", "%d", report.receiveLevel());
    row.setText("Rx Quality Full", "%d", report.receiveQualityFull());
    row.setText("Rx Quality Sub", "%d", report.receiveQualitySub());
}

void GSMRRInfo::update(const LogCode_0x5072& report)
{
    rows().setText("DTX Used", report.isDTXUsed() ? "ON" : "OFF");
}

void GSMRRInfo::update(const LogCode_0x51F6& report)
{
    rows().setText("DRX Used", "%d sec", report.drxTimerMax());
}

MobileAllocation::MobileAllocation(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Mobile Allocation", "MobileAllocation", dict, codeDict)
{
}

void MobileAllocation::update(const LogCode_0x51F8& report)
{
    RowWriter row = rows();
    row.setText("HSN", "%d", report.hoppingSequenceNumber());
    RowList channels(row.list("ARFCNs"));
    for (const auto& channel : report.channels())
        channels.append(DeferredText("%d", channel.arfcn()));
}

} // namespace orvex

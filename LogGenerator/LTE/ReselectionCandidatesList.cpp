#include "LTE/ReselectionCandidatesList.h"

#include "EnumTable.h"

namespace orvex {

namespace {

constexpr EnumText kTechnologies[] = {
    {LogCode_0xB186::lte, "LTE"},
    {LogCode_0xB186::utran, "UTRAN"},
    {LogCode_0xB186::geran, "GERAN"},
    {LogCode_0xB186::cdma1xRTT, "CDMA1XRTT"},
    {LogCode_0xB186::cdmaHRPD, "CDMAHRPD"},
};

void printTechnologyFields(RowWriter& row, const LogCode_0xB186::Candidate& candidate)
{
    switch (candidate.technology()) {
    case LogCode_0xB186::lte: {
        const auto cell = candidate.lteFields();
        row.setText("E ARFCN", "%d", cell.earfcn);
        row.setText("Cell ID", "%d", cell.cellIdentity);
        break;
    }
    case LogCode_0xB186::utran: {
        const auto cell = candidate.utranFields();
        row.setText("U ARFCN", "%d", cell.uarfcn);
        row.setText("PSC", "%d", cell.primaryScramblingCode);
        break;
    }
    case LogCode_0xB186::geran: {
        const auto cell = candidate.geranFields();
        row.setText("ARFCN", "%d", cell.arfcn);
        row.setText("Band", "%d", cell.band);
        row.setText("BSIC ID", "%d", cell.bsic);
        break;
    }
    case LogCode_0xB186::cdma1xRTT:
    case LogCode_0xB186::cdmaHRPD: {
        const auto cell = candidate.cdmaFields();
        row.setText("Band", "%d", cell.band);
        row.setText("Channel", "%d", cell.channel);
        row.setText("Pilot", "%d", cell.pilot);
        break;
    }
    default: break;
    }
}

} // namespace

ReselectionCandidatesList::ReselectionCandidatesList(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Reselection Candidates List", dict, codeDict)
{
}

void ReselectionCandidatesList::update(const LogCode_0xB186& report)
{
    RowList list(array());
    for (const auto& candidate : report.candidates()) {
        if (!candidate.isComplete())
            break;
        RowWriter& row = list.next();
        row.setText("Candidate Priority", "%d", candidate.priority());
        row.setText("Candidate RAT Type", textFor(candidate.technology(), kTechnologies, "??"));
        printTechnologyFields(row, candidate);
    }
}

} // namespace orvex

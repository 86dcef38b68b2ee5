#include "LTE/ReselectionCandidates.h"

#include "EnumTable.h"

namespace orvex {

namespace {
constexpr std::size_t kCandidatesStart = 4;
} // namespace

bool LogCode_0xB186::Candidate::isComplete() const
{
    const int rat = technology();
    const std::size_t fieldsLength = rat <= geran ? 4 : rat <= cdmaHRPD ? 8 : 0;
    return _record.contains(kCandidatesStart, fieldsLength);
}

void LogCode_0xB186::Candidate::expectTechnology(int first, int last) const
{
    if (technology() < first || technology() > last)
        throw ArrayOutOfBoundsException();
}

LogCode_0xB186::LTEFields LogCode_0xB186::Candidate::lteFields() const
{
    expectTechnology(lte, lte);
    const PacketReader fields = _record.from(kCandidatesStart);
    return {fields.u16(0), fields.u16(2) >> 7};
}

LogCode_0xB186::UTRANFields LogCode_0xB186::Candidate::utranFields() const
{
    expectTechnology(utran, utran);
    const PacketReader fields = _record.from(kCandidatesStart);
    return {fields.u16(0), fields.u16(2)};
}

LogCode_0xB186::GERANFields LogCode_0xB186::Candidate::geranFields() const
{
    expectTechnology(geran, geran);
    const PacketReader fields = _record.from(kCandidatesStart);
    return {fields.u16(0), fields.u8(2), fields.u8(3)};
}

LogCode_0xB186::CDMAFields LogCode_0xB186::Candidate::cdmaFields() const
{
    expectTechnology(cdma1xRTT, cdmaHRPD);
    const PacketReader fields = _record.from(kCandidatesStart);
    return {fields.u8(0), fields.u16(4), fields.u16(6)};
}

ReselectionCandidatesMisc::ReselectionCandidatesMisc(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Reselection Candidates", dict, codeDict)
{
}

void ReselectionCandidatesMisc::update(const LogCode_0xB186& report)
{
    RowWriter row = rows();
    row.setText("Version", "%d", report.version());
    row.setText("Serving EARFCN", "%d", report.servingEARFCN());
    row.setText("Serving Cell ID", "%d", report.servingCellIdentity());
}

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

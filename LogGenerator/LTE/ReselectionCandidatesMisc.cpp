#include "LTE/ReselectionCandidatesMisc.h"

namespace orvex {

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

} // namespace orvex

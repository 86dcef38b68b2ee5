#include "LTE/ReselectionCandidatesMisc.h"

namespace orvex {

ReselectionCandidatesMisc::ReselectionCandidatesMisc(ClassDictionary& dict, CodeDictionary& codeDict)
    : PacketSection("Reselection Candidates", dict, codeDict)
{
}

void ReselectionCandidatesMisc::update(const LogCode_0xB186& report)
{
    Rows row = rows();
    row.print("Version", "%d", report.version());
    row.print("Serving EARFCN", "%d", report.servingEARFCN());
    row.print("Serving Cell ID", "%d", report.servingCellIdentity());
}

} // namespace orvex

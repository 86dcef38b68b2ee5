#include "LTE/ReselectionCandidatesMisc.h"

#include "LTE/LogCode_0xB186.h"

#include "SystemLog.h"

namespace orvex {

ReselectionCandidatesMisc::ReselectionCandidatesMisc(ClassDictionary& dict, CodeDictionary& codeDict)
    : Base("Reselection Candidates", {LogCode_0xB186::kCode}, dict, codeDict)
{
}

void ReselectionCandidatesMisc::updateWithData(Packet packet, LogCode logCode)
{
    systemLog(Priority::warning, "%s", getSectionName().c_str());
    if (logCode != LogCode_0xB186::kCode)
        return reportUnknown(logCode);
    if (packet.size() < LogCode_0xB186::kMinimumLength)
        return;
    const LogCode_0xB186 reselection(packet);
    Rows row = rows();
    row.print("Version", "%d", reselection.version());
    row.print("Serving EARFCN", "%d", reselection.servingEARFCN());
    row.print("Serving Cell ID", "%d", reselection.servingCellIdentity());
}

} // namespace orvex

#include "SimInfo.h"

#include "LogCode_0xFF0000.h"

#include "SystemLog.h"
#include "TelephonyConstants.h"

namespace orvex {

namespace {
struct SimFile {
    const char* key;
    const char* row;
};

constexpr SimFile kSimFiles[] = {
    {telephony::kSimFileICCID, "EF-ICCID"},
    {telephony::kSimFileMSISDN, "EF-MSISDN"},
    {telephony::kSimFileMBDN, "EF-3GPP MAIL BOX DIALING NUMBER"},
    {telephony::kSimFileHPPLMN, "EF-HPPLMN SEARCH PERIOD"},
    {telephony::kSimFileLOCI, "EF-LOCI"},
    {telephony::kSimFilePSLOCI, "EF-GPRS/PS-LOCI"},
    {telephony::kSimFileACC, "EF-ACCESS CONTROL CLASS"},
    {telephony::kSimFileAD, "EF-ADMINISTRATIVE DATA"},
    {telephony::kSimFileFPLMN, "EF-FPLMN"},
    {telephony::kSimFileAHPLMN, "EF-ACTING HPLMN"},
    {telephony::kSimFileRATMODE, "EF-RAT MODE"},
    {telephony::kSimFilePNN, "EF-PLMN NETWORK NAME"},
    {telephony::kSimFileOPL, "EF-OPERATOR PLMN LIST"},
    {telephony::kSimFileOPLMNAcT, "EF-OPLMNAcT"},
};
} // namespace

SimInfo::SimInfo(ClassDictionary& dict, CodeDictionary& codeDict)
    : Base("SIM Info", {kExtraCodeSimFiles}, dict, codeDict)
{
}

void SimInfo::updateWithData(Packet packet, LogCode logCode)
{
    systemLog(Priority::warning, "SimInfo");
    if (logCode != kExtraCodeSimFiles)
        return;
    const DictionaryRef files = LogCode_0xFF0000(packet).files();
    RowWriter row = rows();
    for (const SimFile& file : kSimFiles) {
        if (files->contains(file.key))
            row.set(file.row, (*files)[file.key]);
    }
}

} // namespace orvex

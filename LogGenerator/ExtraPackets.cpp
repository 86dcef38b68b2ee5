#include "ExtraPackets.h"

#include "SystemLog.h"
#include "TelephonyConstants.h"

#include <algorithm>

namespace orvex {

const PropertyListResult& propertyListOf(Packet packet)
{
    struct Last {
        Bytes bytes;
        PropertyListResult list;
        bool isRead = false;
    };
    thread_local Last last;
    const auto bytes = PacketReader(packet).from(kPacketHeaderLength).bytes();
    if (!last.isRead || !std::ranges::equal(bytes, last.bytes)) {
        last.list = propertyListFromData(bytes);
        last.bytes.assign(bytes.begin(), bytes.end());
        last.isRead = true;
    }
    return last.list;
}

DictionaryRef LogCode_0xFF0000::files() const
{
    const PropertyListResult& list = propertyListOf(_packet.bytes());
    if (auto files = list.value ? list.value->dictionary() : nullptr)
        return files;
    systemLog(Priority::error, "SIM File dictionary data could not be constructed");
    throw UnknownDataException();
}

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

PDPContextList::PDPContextList(ClassDictionary& dict, CodeDictionary& codeDict)
    : Base("PDP Context Info", {kExtraCodePDPContexts}, dict, codeDict)
{
}

void PDPContextList::updateWithData(Packet packet, LogCode)
{
    systemLog(Priority::warning, "PDPContextList");
    const PropertyListResult& list = propertyListOf(packet);
    if (!list.value)
        throw UnknownDataException("PDP context list: " + list.error);
    if (const ArrayRef contexts = list.value->array())
        replaceArray(array(), *contexts);
}

} // namespace orvex

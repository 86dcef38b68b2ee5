#include "Subscriber.h"

#include "Array.h"
#include "Dictionary.h"
#include "TelephonyConstants.h"
#include "TextFormat.h"

namespace orvex::korat::subscriber {

namespace {
DictionaryRef context(const char* identity, const char* bearer, const char* apn, const char* address,
    const char* qualityClass, const char* state)
{
    return Dictionary::make({
        {"Context ID", identity},
        {"Bearer", bearer},
        {"APN", apn},
        {"PDP Type", "IPv4"},
        {"PDP Address", address},
        {"QCI", qualityClass},
        {"State", state},
    });
}
} // namespace

DictionaryRef simFiles(int locationAreaCode)
{
    const unsigned area = static_cast<unsigned>(locationAreaCode) & 0xFFFFU;
    return Dictionary::make({
        {telephony::kSimFileICCID, "8900101234567890123"},
        {telephony::kSimFileMSISDN, "+0010155550142"},
        {telephony::kSimFileMBDN, "+0010155550199"},
        {telephony::kSimFileHPPLMN, "05"},
        {telephony::kSimFileLOCI, text("FFFFFFFF00F110%04XFF00", area)},
        {telephony::kSimFilePSLOCI, text("FFFFFFFFFFFFFF00F110%04X0100", area)},
        {telephony::kSimFileACC, "0200"},
        {telephony::kSimFileAD, "00000002"},
        {telephony::kSimFileFPLMN, "00F120FFFFFFFFFFFFFFFFFF"},
        {telephony::kSimFileAHPLMN, "001-01"},
        {telephony::kSimFileRATMODE, "Automatic"},
        {telephony::kSimFilePNN, "Test Network"},
        {telephony::kSimFileOPL, "00F1100000FFFE01"},
        {telephony::kSimFileOPLMNAcT, "00F1104000"},
    });
}

ArrayRef pdpContexts(const char* bearer, bool isActive)
{
    auto contexts = Array::make({context("5", bearer, "internet.example", "192.0.2.17", "9", "Active")});
    if (isActive) {
        contexts->append(context("6", bearer, "voice.example", "198.51.100.23", "5", "Active"));
    } else {
        contexts->append(context("6", bearer, "voice.example", "0.0.0.0", "5", "Inactive"));
    }
    return contexts;
}

} // namespace orvex::korat::subscriber

#pragma once

// Texts and numbers of the telephony service, shared by the monitor and the service.
namespace orvex::telephony {

// Message ports.
inline constexpr const char* kServicePortName = "org.orvex.Korat";
inline constexpr const char* kLogChannelPortName = "org.orvex.BasebandStateReport.LogChannel";
inline constexpr int kLogChannelMessageId = 0; // of every message on the log channel

// Log technologies of a baseband, as the answer to "GetTechnology" names them.
inline constexpr const char* kTechnologyIFX = "IFX";
inline constexpr const char* kTechnologyMRL_GSM = "MRL_GSM";
inline constexpr const char* kTechnologyMRL_CDMA = "MRL_CDMA";
inline constexpr const char* kTechnologyMRL_LTE = "MRL_LTE";
inline constexpr const char* kTechnologyMRL_UTRAN2 = "MRL_UTRAN2";
inline constexpr const char* kTechnologies[] = {
    kTechnologyIFX, kTechnologyMRL_GSM, kTechnologyMRL_CDMA, kTechnologyMRL_LTE, kTechnologyMRL_UTRAN2};

// Log channel commands.
inline constexpr const char* kGetTechnology = "GetTechnology";
inline constexpr const char* kSetState = "SetState";
inline constexpr const char* kStreaming = "Streaming";
inline constexpr const char* kSetMarlinLogCodes = "SetMarlinLogCodes";
inline constexpr const char* kSetKoratExtraCodes = "SetKoratExtraCodes";

// The request that opens a log channel, on the service port.
inline constexpr int kCreateLogChannelMessageId = 1;
inline constexpr const char* kRequest = "Request";
inline constexpr const char* kCreateLogChannelRequest = "NetworkMonitorCreateLogChannel";
inline constexpr const char* kPortName = "PortName";
inline constexpr const char* kErrorDomain = "ErrorDomain";
inline constexpr const char* kErrorCode = "ErrorCode";
inline constexpr const char* kRemotePortName = "RemotePortName";

// Cell-monitor records: the keys, and the values of the two that are texts.
inline constexpr const char* kCellRadioAccessTechnology = "RadioAccessTechnology";
inline constexpr const char* kCellType = "CellType";
inline constexpr const char* kCellMCC = "MCC";
inline constexpr const char* kCellMNC = "MNC";
inline constexpr const char* kCellLAC = "LAC";
inline constexpr const char* kCellTAC = "TAC";
inline constexpr const char* kCellID = "CellID";
inline constexpr const char* kCellPhysicalCellID = "PhysicalCellID";
inline constexpr const char* kCellBandInfo = "BandInfo";
inline constexpr const char* kCellARFCN = "ARFCN";
inline constexpr const char* kCellUARFCN = "UARFCN";
inline constexpr const char* kCellScramblingCode = "ScramblingCode";
inline constexpr const char* kCellRSSI = "RSSI";
inline constexpr const char* kCellRSCP = "RSCP";
inline constexpr const char* kCellECN0 = "ECN0";

inline constexpr const char* kRadioGSM = "GSM";
inline constexpr const char* kRadioUMTS = "UMTS";
inline constexpr const char* kRadioUTRAN = "UTRAN";
inline constexpr const char* kRadioLTE = "LTE";
inline constexpr const char* kCellTypeServing = "Serving";
inline constexpr const char* kCellTypeNeighbor = "Neighbor";

// SIM files (extra code 0).
inline constexpr const char* kSimFileICCID = "kSimFile_ICCID";
inline constexpr const char* kSimFileMSISDN = "kSimFile_MSISDN";
inline constexpr const char* kSimFileMBDN = "kSimFile_MBDN";
inline constexpr const char* kSimFileHPPLMN = "kSimFile_HPPLMN";
inline constexpr const char* kSimFileLOCI = "kSimFile_LOCI";
inline constexpr const char* kSimFilePSLOCI = "kSimFile_PSLOCI";
inline constexpr const char* kSimFileACC = "kSimFile_ACC";
inline constexpr const char* kSimFileAD = "kSimFile_AD";
inline constexpr const char* kSimFileFPLMN = "kSimFile_FPLMN";
inline constexpr const char* kSimFileAHPLMN = "kSimFile_AHPLMN";
inline constexpr const char* kSimFileRATMODE = "kSimFile_RATMODE";
inline constexpr const char* kSimFilePNN = "kSimFile_PNN";
inline constexpr const char* kSimFileOPL = "kSimFile_OPL";
inline constexpr const char* kSimFileOPLMNAcT = "kSimFile_OPLMNAcT";

} // namespace orvex::telephony

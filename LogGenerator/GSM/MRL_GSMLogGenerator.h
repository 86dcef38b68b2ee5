#pragma once

#include "ClassIndex.h"
#include "ExtraPackets.h"
#include "GSM/GPRSInformation.h"
#include "GSM/GSMCells.h"
#include "GSM/GSMRRInfo.h"
#include "GSM/MobilityManagement.h"
#include "GSM/PlaceholderSections.h"
#include "GSM/RankedCells.h"
#include "GSM/ServingPLMN.h"
#include "GSM/UMTSRRInfo.h"
#include "GSM/WCDMACellSets.h"
#include "GSM/WCDMADownlink.h"
#include "MRLLogGenerator2.h"

namespace orvex {

// The sections of GSM and UMTS, in their order of creation.
class MRL_GSMClassIndex final : public ClassIndex {
public:
    ~MRL_GSMClassIndex() override;

private:
    ActiveSet objActiveSet{_classDict, _codeDictionary};
    CodingScheme objCodingScheme{_classDict, _codeDictionary};
    GPRSInformation objGPRSInformation{_classDict, _codeDictionary};
    GSMServingCell objGSMServingCell{_classDict, _codeDictionary};
    MobileAllocation objMobileAllocation{_classDict, _codeDictionary};
    NeighboringCells objNeighboringCells{_classDict, _codeDictionary};
    PDPContextList objPDPContextList{_classDict, _codeDictionary};
    ProcessPS objProcessPS{_classDict, _codeDictionary};
    UMTSRRMeasurement objUMTSRRMeasurement{_classDict, _codeDictionary};
    CellChangeCounters objCellChangeCounter{_classDict, _codeDictionary};
    DetectedSet objDetectedSet{_classDict, _codeDictionary};
    GSMSet objGSMSet{_classDict, _codeDictionary};
    NonRankedGSMSet objNonRankedGSMSet{_classDict, _codeDictionary};
    ProcessCO objProcessCO{_classDict, _codeDictionary};
    ServingPLMN objServingPLMN{_classDict, _codeDictionary};
    UMTSSet objUMTSSet{_classDict, _codeDictionary};
    EquivalentPLMNList objEquivalentPLMNList{_classDict, _codeDictionary};
    GSMRRInfo objGSMRRInfo{_classDict, _codeDictionary};
    MonitoredSet objMonitoredSet{_classDict, _codeDictionary};
    NonRankedUMTSSet objNonRankedUMTSSet{_classDict, _codeDictionary};
    ProcessCS objProcessCS{_classDict, _codeDictionary};
    UMTSRRInfo objUMTSRRInfo{_classDict, _codeDictionary};
    BLER objBLER{_classDict, _codeDictionary};
    VirtualActiveSet objVirtualActiveSet{_classDict, _codeDictionary};
    SimInfo objSimInfo{_classDict, _codeDictionary};
    HSDPAInformation objHSDPAInformation{_classDict, _codeDictionary};
};

// The generator of MRL_GSM: template "MRL_GSM", sections of MRL_GSMClassIndex.
class MRL_GSMLogGenerator final : public MRLLogGenerator2 {
public:
    static std::unique_ptr<LogGenerator> generator(const GeneratorEnvironment& environment);

    explicit MRL_GSMLogGenerator(const GeneratorEnvironment& environment);
    ~MRL_GSMLogGenerator() override;
};

} // namespace orvex

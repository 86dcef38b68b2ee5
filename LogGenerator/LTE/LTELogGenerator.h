#pragma once

#include "ClassIndex.h"
#include "ExtraPackets.h"
#include "LTE/ConnectedModeMeasurement.h"
#include "LTE/LTEServingCellInfo.h"
#include "LTE/NeighborMeasurement.h"
#include "LTE/ReselectionCandidates.h"
#include "LTE/ServingCellMeasurement.h"
#include "MRLLogGenerator2.h"

namespace orvex {

// The sections of LTE, in their order of creation.
class LTEClassIndex final : public ClassIndex {
public:
    ~LTEClassIndex() override;

private:
    LTEServingCellInfo objLTEServingCellInfo{_classDict, _codeDictionary};
    ConnectedModeMeasurementMisc objConnectedModeMeasurementMisc{_classDict, _codeDictionary};
    MeasuredNeighborCells objMeasuredNeighborCells{_classDict, _codeDictionary};
    DetectedCells objDetectedCells{_classDict, _codeDictionary};
    ServingCellMeasurement objServingCellMeasurement{_classDict, _codeDictionary};
    NeighborMeasurementMisc objNeighborMeasurementMisc{_classDict, _codeDictionary};
    NeighborCellsList objNeighborCellsList{_classDict, _codeDictionary};
    ReselectionCandidatesMisc objReselectionCandidatesMisc{_classDict, _codeDictionary};
    ReselectionCandidatesList objReselectionCandidatesList{_classDict, _codeDictionary};
    SimInfo objSimInfo{_classDict, _codeDictionary};
    PDPContextList objPDPContextList{_classDict, _codeDictionary};
};

// The generator of MRL_LTE: template "LTE", sections of LTEClassIndex.
class LTELogGenerator final : public MRLLogGenerator2 {
public:
    static std::unique_ptr<LogGenerator> generator(const GeneratorEnvironment& environment);

    explicit LTELogGenerator(const GeneratorEnvironment& environment);
    ~LTELogGenerator() override;
};

} // namespace orvex

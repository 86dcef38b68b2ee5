#pragma once

#include "ClassIndex.h"
#include "GSM/PDPContextList.h"
#include "LTE/ConnectedModeMeasurementMisc.h"
#include "LTE/DetectedCells.h"
#include "LTE/LTEServingCellInfo.h"
#include "LTE/MeasuredNeighborCells.h"
#include "LTE/NeighborCellsList.h"
#include "LTE/NeighborMeasurementMisc.h"
#include "LTE/ReselectionCandidatesList.h"
#include "LTE/ReselectionCandidatesMisc.h"
#include "LTE/ServingCellMeasurement.h"
#include "SimInfo.h"

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

} // namespace orvex

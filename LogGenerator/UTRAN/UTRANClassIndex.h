#pragma once

#include "ClassIndex.h"
#include "GSM/PDPContextList.h"
#include "RRC_State.h"
#include "SimInfo.h"
#include "UTRAN/CCTRCHSIRMeasurement.h"
#include "UTRAN/GSMNeighbhorMeasurements.h"
#include "UTRAN/TRCHBLERMeasurement.h"
#include "UTRAN/UTRANNeighbhorMeasurements.h"
#include "UTRAN/UTRANServingCellInfo.h"

namespace orvex {

// The sections of UTRAN, in their order of creation.
class UTRANClassIndex final : public ClassIndex {
private:
    RRC_State rrc_state{_classDict, _codeDictionary};
    UTRANServingCellInfo servingCellInfo{_classDict, _codeDictionary};
    UTRANNeighbhorMeasurements tdMeasurements{_classDict, _codeDictionary};
    GSMNeighbhorMeasurements gsmMeasurements{_classDict, _codeDictionary};
    TRCHBLERMeasurement trchMeasurements{_classDict, _codeDictionary};
    CCTRCHSIRMeasurement cctrchMeasurements{_classDict, _codeDictionary};
    PDPContextList pdpList{_classDict, _codeDictionary};
    SimInfo simInfo{_classDict, _codeDictionary};
};

} // namespace orvex

#pragma once

#include "ClassIndex.h"
#include "ExtraPackets.h"
#include "MRLLogGenerator2.h"
#include "UTRAN/NeighbhorMeasurements.h"
#include "UTRAN/TransportChannels.h"
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

// The generator of MRL_UTRAN2: sections of UTRANClassIndex, and as its template the first resource with
// "UTRAN" in its path, in any case of letters. Without such a resource the generator is never set up: it
// wants no log codes and routes nothing.
class UTRANLogGenerator final : public MRLLogGenerator2 {
public:
    static std::unique_ptr<LogGenerator> generator(const GeneratorEnvironment& environment);
    std::string templateError(const Dictionary& state) const override;

private:
    UTRANLogGenerator(const GeneratorEnvironment& environment, const std::string& templateName);
    UTRANLogGenerator(const GeneratorEnvironment& environment, NeverSetUp);
};

} // namespace orvex

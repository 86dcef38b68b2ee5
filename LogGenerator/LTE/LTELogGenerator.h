#pragma once

#include "MRLLogGenerator2.h"

namespace orvex {

// The generator of MRL_LTE: template "LTE", sections of LTEClassIndex.
class LTELogGenerator final : public MRLLogGenerator2 {
public:
    static std::unique_ptr<LogGenerator> generator(const GeneratorEnvironment& environment);

    explicit LTELogGenerator(const GeneratorEnvironment& environment);
    ~LTELogGenerator() override;
};

} // namespace orvex

#pragma once

#include "MRLLogGenerator2.h"

namespace orvex {

// The generator of MRL_GSM: template "MRL_GSM", sections of MRL_GSMClassIndex.
class MRL_GSMLogGenerator final : public MRLLogGenerator2 {
public:
    static std::unique_ptr<LogGenerator> generator(const GeneratorEnvironment& environment);

    explicit MRL_GSMLogGenerator(const GeneratorEnvironment& environment);
    ~MRL_GSMLogGenerator() override;
};

} // namespace orvex

#pragma once

#include "MRLLogGenerator2.h"

namespace orvex {

// The generator of MRL_UTRAN2: sections of UTRANClassIndex, and as its template the first resource with
// "UTRAN" in its path, in any case of letters. A build without such a resource has a generator that was never
// set up: it wants no log codes and routes nothing.
class UTRANLogGenerator final : public MRLLogGenerator2 {
public:
    static std::unique_ptr<LogGenerator> generator(const GeneratorEnvironment& environment);
    std::string templateError(const Dictionary& state) const override;

private:
    UTRANLogGenerator(const GeneratorEnvironment& environment, const std::string& templateName);
    UTRANLogGenerator(const GeneratorEnvironment& environment, NeverSetUp);
};

} // namespace orvex

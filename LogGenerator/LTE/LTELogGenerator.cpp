#include "LTE/LTELogGenerator.h"

#include "SystemLog.h"

namespace orvex {

LTEClassIndex::~LTEClassIndex()
{
    writeConsoleLine("Deallocing LTEClassIndex");
}

namespace {
// Runs, and logs, before the base classes are constructed.
std::unique_ptr<ClassIndex> makeLTEClassIndex()
{
    systemLog(Priority::error, "Creating LTELogGenerator object");
    return std::make_unique<LTEClassIndex>();
}
} // namespace

std::unique_ptr<LogGenerator> LTELogGenerator::generator(const GeneratorEnvironment& environment)
{
    return std::make_unique<LTELogGenerator>(environment);
}

LTELogGenerator::LTELogGenerator(const GeneratorEnvironment& environment)
    : MRLLogGenerator2(environment, "LTE", makeLTEClassIndex())
{
}

LTELogGenerator::~LTELogGenerator()
{
    systemLog(Priority::warning, "LTELogGenerator is destructed %p", static_cast<const void*>(this));
}

} // namespace orvex

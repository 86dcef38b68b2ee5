#include "GSM/MRL_GSMLogGenerator.h"

#include "SystemLog.h"

namespace orvex {

MRL_GSMClassIndex::~MRL_GSMClassIndex()
{
    writeConsoleLine("Deallocing MRL_GSMClassIndex");
}

namespace {
// Runs, and logs, before the base classes are constructed.
std::unique_ptr<ClassIndex> makeGSMClassIndex()
{
    systemLog(Priority::error, "Creating MRL_GSMLogGenerator object");
    return std::make_unique<MRL_GSMClassIndex>();
}
} // namespace

std::unique_ptr<LogGenerator> MRL_GSMLogGenerator::generator(const GeneratorEnvironment& environment)
{
    return std::make_unique<MRL_GSMLogGenerator>(environment);
}

MRL_GSMLogGenerator::MRL_GSMLogGenerator(const GeneratorEnvironment& environment)
    : MRLLogGenerator2(environment, "MRL_GSM", makeGSMClassIndex())
{
}

MRL_GSMLogGenerator::~MRL_GSMLogGenerator()
{
    systemLog(Priority::warning, "MRL_GSMLogGenerator is destructed %p", static_cast<const void*>(this));
}

} // namespace orvex

#include "UTRAN/UTRANLogGenerator.h"

#include "SystemLog.h"

#include <algorithm>
#include <filesystem>

namespace orvex {

namespace {

bool mentionsUTRAN(const std::string& path)
{
    std::string upper = path;
    std::ranges::transform(upper, upper.begin(),
        [](char letter) { return letter >= 'a' && letter <= 'z' ? letter - 32 : letter; });
    return upper.find("UTRAN") != std::string::npos;
}

} // namespace

std::unique_ptr<LogGenerator> UTRANLogGenerator::generator(const GeneratorEnvironment& environment)
{
    const auto paths = environment.resources.propertyListPaths();
    const auto path = std::ranges::find_if(paths, mentionsUTRAN);
    if (path == paths.end())
        return std::unique_ptr<LogGenerator>(new UTRANLogGenerator(environment, NeverSetUp()));
    const std::string templateName = std::filesystem::path(*path).stem().string();
    return std::unique_ptr<LogGenerator>(new UTRANLogGenerator(environment, templateName));
}

UTRANLogGenerator::UTRANLogGenerator(const GeneratorEnvironment& environment, const std::string& templateName)
    : MRLLogGenerator2(environment, templateName, std::make_unique<UTRANClassIndex>())
{
    systemLog(Priority::error, "Created UTRANLogGenerator object");
}

UTRANLogGenerator::UTRANLogGenerator(const GeneratorEnvironment& environment, NeverSetUp tag)
    : MRLLogGenerator2(environment, tag)
{
}

std::string UTRANLogGenerator::templateError(const Dictionary& state) const
{
    // No resource fits: name the one that an installation has.
    return isSetUp() ? MRLLogGenerator2::templateError(state)
                     : environment().resources.dictionaryNamed("MRL_UTRAN2").error;
}

} // namespace orvex

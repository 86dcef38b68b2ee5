#include "LinuxPlatform.h"

#include "VisibleText.h"

#include <cstdio>

namespace orvex {

void printError(const std::string& why)
{
    std::fprintf(stderr, "orvex: %s\n", visibleText(why).c_str());
}

AppPlatform LinuxPlatform::forApp()
{
    return {.session = {.runLoop = runLoop,
                .ports = ports,
                .telephony = telephony,
                .generators = {.resources = resources, .clock = clock, .buildVersion = ORVEX_VERSION},
                .printError = printError},
        .preferences = preferences};
}

GeneratorEnvironment LinuxPlatform::forFiles() const
{
    return {.resources = resources, .clock = clock, .buildVersion = ORVEX_VERSION, .rawPacketLimit = 0};
}

} // namespace orvex

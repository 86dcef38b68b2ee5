#pragma once

#include "AppPlatform.h"

#include "FileStorage.h"
#include "KoratTelephonyService.h"
#include "QtRunLoop.h"
#include "SocketMessagePorts.h"

#include <string>

namespace orvex {

// Prints "orvex: WHY" on standard error.
void printError(const std::string& why);

// The platform on Linux, in the order of dependency.
struct LinuxPlatform {
    explicit LinuxPlatform(const std::string& resourceDirectory)
        : resources(resourceDirectory)
    {
    }

    AppPlatform forApp();
    // For captures, which are not saved.
    GeneratorEnvironment forFiles() const;

    QtRunLoop runLoop;
    SocketMessagePorts ports;
    KoratTelephonyService telephony{ports};
    FileResources resources;
    SystemClock clock;
    IniPreferences preferences;
};

} // namespace orvex

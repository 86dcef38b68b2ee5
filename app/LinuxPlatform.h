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

// The implementations of the platform on Linux, in the order of their dependencies.
struct LinuxPlatform {
    explicit LinuxPlatform(const std::string& resourceDirectory)
        : resources(resourceDirectory)
    {
    }

    AppPlatform forApp();
    // For captures, of which no snapshot is made.
    GeneratorEnvironment forFiles() const;

    QtRunLoop runLoop;
    SocketMessagePorts ports;
    KoratTelephonyService telephony{ports};
    FileResources resources;
    SystemClock clock;
    IniPreferences preferences;
};

} // namespace orvex

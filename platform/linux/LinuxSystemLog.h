#pragma once

#include "SystemLog.h"

#include <memory>
#include <string>

namespace orvex {

// The log of the system: syslog(3) under the program's name, where a priority that it does not know
// becomes an error whose text begins with the value, "<16>" say; or, when $ORVEX_LOG is "stderr", standard
// error with lines of the form "<PRIORITY>TEXT". Lines are written by a thread of its own, so whoever logs
// never waits. When more come than can be written some are dropped, and a line says how many.
std::unique_ptr<SystemLog> makeLinuxSystemLog(const std::string& programName);

} // namespace orvex

#include "FixedPaths.h"

#include <cstdlib>

namespace orvex::paths {

namespace {
std::string variable(const char* name)
{
    const char* value = std::getenv(name);
    return value ? value : "";
}

std::string root()
{
    return variable("ORVEX_ROOT");
}

// The directory that the variable names, which counts only when it is absolute, or the usual one below the
// home directory.
std::string userDirectory(const char* name, const char* usual)
{
    const auto chosen = variable(name);
    return root() + (chosen.starts_with('/') ? chosen : variable("HOME") + usual);
}
} // namespace

std::string internalBuildMarker()
{
    return root() + "/usr/lib/orvex/internal/Carrier Settings.bundle";
}

std::string diagnosticReports()
{
    return userDirectory("XDG_STATE_HOME", "/.local/state") + "/orvex/diagnostic-reports";
}

std::string preferences()
{
    return userDirectory("XDG_CONFIG_HOME", "/.config");
}

} // namespace orvex::paths

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

// A directory below the one that the variable names, which counts only when it is absolute, or below the
// usual one in the home directory. Empty without either.
std::string userDirectory(const char* name, const char* usual, const char* below = "")
{
    const auto chosen = variable(name);
    const auto home = variable("HOME");
    if (chosen.starts_with('/'))
        return root() + chosen + below;
    return home.starts_with('/') ? root() + home + usual + below : "";
}
} // namespace

std::string internalBuildMarker()
{
    return root() + "/usr/lib/orvex/internal/Carrier Settings.bundle";
}

std::string diagnosticReports()
{
    return userDirectory("XDG_STATE_HOME", "/.local/state", "/orvex/diagnostic-reports");
}

std::string preferences()
{
    return userDirectory("XDG_CONFIG_HOME", "/.config");
}

} // namespace orvex::paths

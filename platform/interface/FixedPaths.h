#pragma once

#include <string>

// Paths that the system has once and for all. Each stands under the prefix $ORVEX_ROOT when that is set, so
// that a whole handset can be laid out in a folder.
namespace orvex::paths {

// Exists on internal builds only: the bundle with the carrier-settings preferences.
std::string internalBuildMarker();

// Where snapshots and other reports are collected: $XDG_STATE_HOME/orvex/diagnostic-reports, by default
// below ~/.local/state. Empty when $HOME is not set either.
std::string diagnosticReports();

// Where the preferences of applications are kept: $XDG_CONFIG_HOME, by default ~/.config. Empty when $HOME is
// not set either.
std::string preferences();

} // namespace orvex::paths

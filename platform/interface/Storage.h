#pragma once

#include "Value.h"

#include <string>
#include <vector>

namespace orvex {

struct DictionaryResult {
    DictionaryRef dictionary;
    std::string error; // without a dictionary: which file and why, in one line
};

// The application's resources of type "plist". Logs nothing; the caller decides what to say.
class Resources {
public:
    virtual ~Resources() = default;

    // The file names of all of them, relative to the resource directory, sorted. Empty when the directory
    // cannot be read.
    virtual std::vector<std::string> propertyListPaths() const = 0;
    // The dictionary in the resource of that base name; null when the resource is missing, is not a property
    // list or holds something else.
    virtual DictionaryResult dictionaryNamed(const std::string& baseName) const = 0;
};

// Preferences that belong to another application.
class Preferences {
public:
    virtual ~Preferences() = default;

    virtual void setValue(const std::string& domain, const std::string& key, const Value& value) = 0;
    // Writes pending changes to storage.
    virtual void synchronize(const std::string& domain) = 0;
    // Tells every application that a preference has changed.
    virtual void postChanged(const std::string& domain, const std::string& key) = 0;
};

// Well-known paths. The prefix $ORVEX_ROOT, when set, goes before each, so that a whole handset can be laid
// out in a folder.
namespace paths {

// Exists on internal builds only: the bundle with the carrier-settings preferences.
std::string internalBuildMarker();

// Where snapshots and other reports are collected: $XDG_STATE_HOME/orvex/diagnostic-reports, by default
// below ~/.local/state. Empty without $HOME too.
std::string diagnosticReports();

// Where applications keep their preferences: $XDG_CONFIG_HOME, by default ~/.config. Empty without $HOME
// too.
std::string preferences();

} // namespace paths

} // namespace orvex

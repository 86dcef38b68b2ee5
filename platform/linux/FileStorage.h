#pragma once

#include "Storage.h"

#include <map>
#include <memory>
#include <string>
#include <utility>

class QSettings;

namespace orvex {

// The plist files of one directory, read anew at every call.
class FileResources final : public Resources {
public:
    explicit FileResources(std::string directory)
        : _directory(std::move(directory))
    {
    }

    // $ORVEX_RESOURCES, else the data directory; in the source tree, "resources".
    static std::string defaultDirectory();
    // The first of: the data directory of the installation that the program is part of, wherever that has
    // moved; for a program run from the build tree, this folder of the source tree; the data directory chosen
    // at configuration.
    static std::string dataDirectory(const char* inSources);

    std::vector<std::string> propertyListPaths() const override;
    DictionaryResult dictionaryNamed(const std::string& baseName) const override;

private:
    std::string _directory;
};

// Preferences as INI files, DOMAIN.ini in the user's configuration directory. Failures go to the system log.
class IniPreferences final : public Preferences {
public:
    IniPreferences();
    // Writes pending changes.
    ~IniPreferences() override;
    IniPreferences(const IniPreferences&) = delete;
    IniPreferences& operator=(const IniPreferences&) = delete;

    // Takes scalars and data only; an INI file has no form for other values.
    void setValue(const std::string& domain, const std::string& key, const Value& value) override;
    void synchronize(const std::string& domain) override;
    // Sends the signal Changed(domain, key) of org.orvex.Preferences at /org/orvex/Preferences on the session
    // bus, if one runs.
    void postChanged(const std::string& domain, const std::string& key) override;

private:
    QSettings* settingsOf(const std::string& domain);

    std::map<std::string, std::unique_ptr<QSettings>> _settings;
};

} // namespace orvex

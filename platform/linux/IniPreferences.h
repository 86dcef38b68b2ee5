#pragma once

#include "Preferences.h"

#include <map>
#include <memory>

class QSettings;

namespace orvex {

// Preferences as INI files, DOMAIN.ini in the user's configuration directory. Failures go to the system log.
class IniPreferences final : public Preferences {
public:
    IniPreferences();
    // What was set is brought to storage.
    ~IniPreferences() override;
    IniPreferences(const IniPreferences&) = delete;
    IniPreferences& operator=(const IniPreferences&) = delete;

    // Scalars and data only: other values have no form in such a file.
    void setValue(const std::string& domain, const std::string& key, const Value& value) override;
    void synchronize(const std::string& domain) override;
    // Sends the signal Changed(domain, key) of org.orvex.Preferences at /org/orvex/Preferences on the session
    // bus; nothing where none runs.
    void postChanged(const std::string& domain, const std::string& key) override;

private:
    QSettings* settingsOf(const std::string& domain);

    std::map<std::string, std::unique_ptr<QSettings>> _settings;
};

} // namespace orvex

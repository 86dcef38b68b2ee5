#include "FileStorage.h"

#include "PropertyList.h"
#include "RegularFile.h"
#include "SystemLog.h"

#include <QDBusConnection>
#include <QDBusMessage>
#include <QDateTime>
#include <QFileInfo>
#include <QSettings>

#include <algorithm>
#include <cstdlib>
#include <filesystem>

namespace orvex {

namespace {
namespace fs = std::filesystem;

bool isInside(const fs::path& path, const fs::path& directory)
{
    const auto [inPath, inDirectory] =
        std::mismatch(path.begin(), path.end(), directory.begin(), directory.end());
    return inDirectory == directory.end();
}

DictionaryResult noDictionary(const std::string& path, const std::string& why)
{
    return {nullptr, path + ": " + why};
}

QVariant variantOf(const Value& value)
{
    switch (value.kind()) {
    case Value::Kind::string: return QString::fromStdString(*value.string());
    case Value::Kind::integer: return QVariant::fromValue<qlonglong>(*value.integer());
    case Value::Kind::real: return *value.real();
    case Value::Kind::boolean: return *value.boolean();
    case Value::Kind::date: return QString::fromStdString(dateText(*value.date()));
    case Value::Kind::data: {
        const auto data = value.data();
        return QByteArray(reinterpret_cast<const char*>(data->data()), static_cast<qsizetype>(data->size()));
    }
    default: return {};
    }
}

// Connecting to a missing bus would start one, or wait for it.
bool hasSessionBus()
{
    if (!qEnvironmentVariable("DBUS_SESSION_BUS_ADDRESS").isEmpty())
        return true;
    const QString runtime = qEnvironmentVariable("XDG_RUNTIME_DIR");
    return !runtime.isEmpty() && QFileInfo::exists(runtime + QStringLiteral("/bus"));
}

std::string variable(const char* name)
{
    const char* value = std::getenv(name);
    return value ? value : "";
}

std::string root()
{
    return variable("ORVEX_ROOT");
}

// A directory below the one that the variable names, if that is absolute, else below the usual one in the
// home directory. Empty without a home directory too.
std::string userDirectory(const char* name, const char* usual, const char* below = "")
{
    const auto chosen = variable(name);
    const auto home = variable("HOME");
    if (chosen.starts_with('/'))
        return root() + chosen + below;
    return home.starts_with('/') ? root() + home + usual + below : "";
}
} // namespace

std::string FileResources::defaultDirectory()
{
    const char* chosen = std::getenv("ORVEX_RESOURCES");
    return chosen && *chosen ? chosen : dataDirectory("resources");
}

std::string FileResources::dataDirectory(const char* inSources)
{
    std::error_code error;
    const fs::path program = fs::read_symlink("/proc/self/exe", error);
    if (error)
        return ORVEX_DATA_DIRECTORY;
    const fs::path besideProgram = (program.parent_path() / ORVEX_DATA_FROM_PROGRAM).lexically_normal();
    if (fs::is_directory(besideProgram, error))
        return besideProgram.string();
    // An installed program does not look at the source tree.
    const fs::path sources = (fs::path(ORVEX_SOURCE_DIRECTORY) / inSources).lexically_normal();
    if (isInside(program, ORVEX_BUILD_DIRECTORY) && fs::is_directory(sources, error))
        return sources.string();
    return ORVEX_DATA_DIRECTORY;
}

std::vector<std::string> FileResources::propertyListPaths() const
{
    std::vector<std::string> names;
    std::error_code error;
    fs::directory_iterator entry(_directory, error);
    for (; !error && entry != fs::directory_iterator(); entry.increment(error)) {
        if (entry->path().extension() == ".plist")
            names.push_back(entry->path().filename().string());
    }
    std::sort(names.begin(), names.end());
    return names;
}

DictionaryResult FileResources::dictionaryNamed(const std::string& baseName) const
{
    const std::string path = fs::path(_directory) / (baseName + ".plist");
    const auto [data, error] = readFile(path, PropertyListLimits().maximumBytes);
    if (!error.empty())
        return noDictionary(path, error);
    const auto list = propertyListFromData(data);
    if (!list.value)
        return noDictionary(path, list.error);
    if (auto dictionary = list.value->dictionary())
        return {std::move(dictionary), {}};
    return noDictionary(path, std::string("it holds no dictionary but: ") + nameOf(list.value->kind()));
}

IniPreferences::IniPreferences() = default;

IniPreferences::~IniPreferences() = default;

QSettings* IniPreferences::settingsOf(const std::string& domain)
{
    if (domain.empty() || domain.find('/') != std::string::npos) {
        systemLog(Priority::error, "\"%s\" cannot be the name of a preferences domain", domain.c_str());
        return nullptr;
    }
    const auto [settings, isNew] = _settings.try_emplace(domain);
    if (isNew) {
        if (const std::string directory = paths::preferences(); !directory.empty())
            settings->second = std::make_unique<QSettings>(
                QString::fromStdString(directory + '/' + domain + ".ini"), QSettings::IniFormat);
        else
            systemLog(Priority::error, "Preferences of %s are not kept: $HOME is not set", domain.c_str());
    }
    return settings->second.get();
}

void IniPreferences::setValue(const std::string& domain, const std::string& key, const Value& value)
{
    QSettings* settings = settingsOf(domain);
    if (!settings)
        return;
    const QVariant variant = variantOf(value);
    if (!variant.isValid())
        return systemLog(Priority::error, "Preference %s of %s cannot hold a value of kind %s", key.c_str(),
            domain.c_str(), nameOf(value.kind()));
    settings->setValue(QString::fromStdString(key), variant);
}

void IniPreferences::synchronize(const std::string& domain)
{
    QSettings* settings = settingsOf(domain);
    if (!settings)
        return;
    settings->sync();
    if (settings->status() != QSettings::NoError)
        systemLog(Priority::error, "Preferences %s could not be written", qPrintable(settings->fileName()));
}

void IniPreferences::postChanged(const std::string& domain, const std::string& key)
{
    if (!hasSessionBus())
        return;
    auto bus = QDBusConnection::sessionBus();
    if (!bus.isConnected())
        return;
    auto changed = QDBusMessage::createSignal(QStringLiteral("/org/orvex/Preferences"),
        QStringLiteral("org.orvex.Preferences"), QStringLiteral("Changed"));
    changed << QString::fromStdString(domain) << QString::fromStdString(key);
    bus.send(changed);
    // The process may be about to end. A call answered after the signal proves that the bus has the signal
    // too.
    constexpr int kLongestMilliseconds = 500;
    bus.call(QDBusMessage::createMethodCall(QStringLiteral("org.freedesktop.DBus"),
                 QStringLiteral("/org/freedesktop/DBus"), QStringLiteral("org.freedesktop.DBus"),
                 QStringLiteral("GetId")),
        QDBus::Block, kLongestMilliseconds);
}

std::string paths::internalBuildMarker()
{
    return root() + "/usr/lib/orvex/internal/Carrier Settings.bundle";
}

std::string paths::diagnosticReports()
{
    return userDirectory("XDG_STATE_HOME", "/.local/state", "/orvex/diagnostic-reports");
}

std::string paths::preferences()
{
    return userDirectory("XDG_CONFIG_HOME", "/.config");
}

} // namespace orvex

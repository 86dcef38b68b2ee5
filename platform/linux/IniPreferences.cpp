#include "IniPreferences.h"

#include "FixedPaths.h"
#include "SystemLog.h"

#include <QDBusConnection>
#include <QDBusMessage>
#include <QDateTime>
#include <QFileInfo>
#include <QSettings>

namespace orvex {

namespace {
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

// Asking for a bus where there is none would start one, or wait for it.
bool hasSessionBus()
{
    if (!qEnvironmentVariable("DBUS_SESSION_BUS_ADDRESS").isEmpty())
        return true;
    const QString runtime = qEnvironmentVariable("XDG_RUNTIME_DIR");
    return !runtime.isEmpty() && QFileInfo::exists(runtime + QStringLiteral("/bus"));
}
} // namespace

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
    // The process may be about to end. The answer to a question that follows the signal shows that the bus
    // has the signal too.
    constexpr int kLongestMilliseconds = 500;
    bus.call(QDBusMessage::createMethodCall(QStringLiteral("org.freedesktop.DBus"),
                 QStringLiteral("/org/freedesktop/DBus"), QStringLiteral("org.freedesktop.DBus"),
                 QStringLiteral("GetId")),
        QDBus::Block, kLongestMilliseconds);
}

} // namespace orvex

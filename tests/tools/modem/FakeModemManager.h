#pragma once

#include "modem/ModemManagerState.h"

#include "PrivateBus.h"

#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusMetaType>
#include <QDBusObjectPath>
#include <QDBusVariant>
#include <QDBusVirtualObject>

#include <string>
#include <vector>

namespace orvex::test {

// ModemManager's objects on such a bus: one enabled LTE modem with a SIM card and a bearer. It answers as the
// test says.
class FakeModemManager : public QDBusVirtualObject {
public:
    using Interfaces = QMap<QString, QVariantMap>;

    explicit FakeModemManager(const PrivateBus& bus)
        : _bus(QDBusConnection::connectToBus(
            QString::fromStdString(bus.address()), QString::fromStdString(bus.address())))
    {
        qDBusRegisterMetaType<Interfaces>();
        qDBusRegisterMetaType<QMap<QDBusObjectPath, Interfaces>>();
        qDBusRegisterMetaType<QList<QVariantMap>>();
        qDBusRegisterMetaType<QMap<uint, QDBusVariant>>();
        _bus.registerVirtualObject("/org/freedesktop/ModemManager1", this, QDBusConnection::SubPath);
        startService();
    }

    // ModemManager is killed, and starts again.
    void stopService() { _bus.unregisterService(kService); }
    void startService() { _bus.registerService(kService); }

    void unplug()
    {
        isPlugged = false;
        signal(kRoot, "org.freedesktop.DBus.ObjectManager", "InterfacesRemoved",
            {QVariant::fromValue(QDBusObjectPath(kModem)), QStringList(modem.keys())});
    }
    void plug()
    {
        isPlugged = true;
        signal(kRoot, "org.freedesktop.DBus.ObjectManager", "InterfacesAdded",
            {QVariant::fromValue(QDBusObjectPath(kModem)), QVariant::fromValue(modem)});
    }
    void change(const char* interface, const char* property, const QVariant& value)
    {
        modem[interface][property] = value;
        signal(kModem, "org.freedesktop.DBus.Properties", "PropertiesChanged",
            {interface, QVariantMap{{property, value}}, QStringList()});
    }

    // What was called of what reaches a modem: "GetCellInfo", "Setup 5"...
    std::vector<std::string> calls;
    QList<QVariantMap> cells{{{"cell-type", 5U}, {"serving", true}, {"tac", "84CD"}, {"ci", "1A2D001"}}};
    QString cellError;      // in place of the cells
    bool isHanging = false; // GetCellInfo is not answered
    bool isPlugged = true;
    Interfaces modem{
        {korat::kModemInterface,
            {{"Manufacturer", "Example"}, {"Model", "M1"}, {"State", 8}, {"AccessTechnologies", 1U << 14},
                {"Sim", QVariant::fromValue(QDBusObjectPath(kSim))},
                {"Bearers", QVariant::fromValue(QList<QDBusObjectPath>{QDBusObjectPath(kBearer)})}}},
        {korat::kModem3gppInterface, {{"RegistrationState", 1U}, {"OperatorCode", "00101"}}},
        {korat::kSignalInterface, {{"Rate", 0U}, {"Lte", QVariantMap()}}},
        {korat::kLocationInterface, {{"Enabled", 1U}}},
    };

protected:
    QString introspect(const QString&) const override { return {}; }
    bool handleMessage(const QDBusMessage& message, const QDBusConnection&) override
    {
        const QString method = message.member();
        if (method == "GetManagedObjects")
            return reply(message, QVariant::fromValue(managedObjects()));
        if (method == "GetAll")
            return reply(message, message.path() == kSim ? sim() : bearer());
        const QVariantList arguments = message.arguments();
        calls.push_back(
            (method + (method == "Setup" ? " " + arguments.value(0).toString() : "")).toStdString());
        if (method == "GetLocation")
            return reply(message,
                QVariant::fromValue(QMap<uint, QDBusVariant>{{1, QDBusVariant("001,01,0,1A2D001,84CD")}}));
        if (method == "Setup") {
            change(korat::kSignalInterface, "Rate", arguments.value(0));
            change(korat::kSignalInterface, "Lte", QVariantMap{{"rsrp", -94.0}});
            return _bus.send(message.createReply());
        }
        if (method != "GetCellInfo")
            return false;
        if (isHanging)
            return true;
        return cellError.isEmpty() ? reply(message, QVariant::fromValue(cells))
                                   : _bus.send(message.createErrorReply(cellError, "no"));
    }

private:
    static constexpr const char* kService = "org.freedesktop.ModemManager1";
    static constexpr const char* kRoot = "/org/freedesktop/ModemManager1";
    static constexpr const char* kModem = "/org/freedesktop/ModemManager1/Modem/0";
    static constexpr const char* kSim = "/org/freedesktop/ModemManager1/SIM/0";
    static constexpr const char* kBearer = "/org/freedesktop/ModemManager1/Bearer/0";

    QMap<QDBusObjectPath, Interfaces> managedObjects() const
    {
        QMap<QDBusObjectPath, Interfaces> result;
        if (isPlugged)
            result[QDBusObjectPath(kModem)] = modem;
        return result;
    }
    static QVariantMap sim()
    {
        return {{"SimIdentifier", "89000101123456789001"}, {"Imsi", "001010123456789"}};
    }
    static QVariantMap bearer() { return {{"Connected", true}, {"Interface", "wwan0"}}; }

    bool reply(const QDBusMessage& message, const QVariant& answer)
    {
        return _bus.send(message.createReply(answer));
    }
    void signal(const char* path, const char* interface, const char* name, const QVariantList& arguments)
    {
        QDBusMessage message = QDBusMessage::createSignal(path, interface, name);
        message.setArguments(arguments);
        _bus.send(message);
    }

    QDBusConnection _bus;
};

} // namespace orvex::test

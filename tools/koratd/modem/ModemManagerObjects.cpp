#include "modem/ModemManagerObjects.h"

#include "modem/ModemManagerState.h"

#include "Array.h"

#include <QDBusError>

#include <utility>

namespace orvex::korat {

namespace {
using namespace std::chrono_literals;

constexpr const char* kRoot = "/org/freedesktop/ModemManager1";
constexpr const char* kObjectManager = "org.freedesktop.DBus.ObjectManager";
constexpr const char* kProperties = "org.freedesktop.DBus.Properties";
constexpr auto kAnswerTime = 10s;
constexpr auto kRetryTime = 5s;

std::string textOf(const Value& value)
{
    const std::string* string = value.string();
    return string ? *string : std::string();
}

// The dictionary under the key, made when there is none.
DictionaryRef madeIn(Dictionary& parent, const std::string& key)
{
    if (DictionaryRef known = parent[key].dictionary())
        return known;
    auto made = Dictionary::make();
    parent.set(key, made);
    return made;
}
} // namespace

ModemManagerObjects::ModemManagerObjects(ModemManagerBus& bus, std::function<void()> onChange)
    : _bus(bus)
    , _onChange(std::move(onChange))
    , _watcher(ModemManagerBus::kService, bus.connection(), QDBusServiceWatcher::WatchForOwnerChange)
{
    _retry.setSingleShot(true);
    _retry.setInterval(kRetryTime);
    QObject::connect(&_retry, &QTimer::timeout, &_retry, [this] { readAll(); });
    QObject::connect(&_watcher, &QDBusServiceWatcher::serviceOwnerChanged, &_watcher,
        [this](const QString&, const QString&, const QString& newOwner) {
            lose();
            if (!newOwner.isEmpty())
                readAll();
        });
}

std::string ModemManagerObjects::start()
{
    if (!_bus.connection().isConnected())
        return "the system bus cannot be reached: " + _bus.connection().lastError().message().toStdString();
    _bus.listen(
        kRoot, kObjectManager, "InterfacesAdded", [this](const auto& signal) { addInterfaces(signal); });
    _bus.listen(
        kRoot, kObjectManager, "InterfacesRemoved", [this](const auto& signal) { removeInterfaces(signal); });
    // Of any path: modems, SIM cards and bearers.
    _bus.listen(
        "", kProperties, "PropertiesChanged", [this](const auto& signal) { changeProperties(signal); });
    readAll();
    return {};
}

DictionaryRef ModemManagerObjects::properties(const std::string& path, const char* interface) const
{
    return propertiesIn(*_objects, path, interface);
}

void ModemManagerObjects::readAll()
{
    _bus.call(kRoot, kObjectManager, "GetManagedObjects", {}, kAnswerTime, [this](const auto& answer) {
        if (DictionaryRef objects = answer.value.dictionary()) {
            _service = Service::isThere;
            _objects = objects;
            _wantedParts.clear();
            changed();
        } else if (answer.error == "org.freedesktop.DBus.Error.ServiceUnknown"
            || answer.error == "org.freedesktop.DBus.Error.NameHasNoOwner") {
            lose();
        } else {
            _retry.start();
        }
    });
}

void ModemManagerObjects::lose()
{
    _service = Service::isMissing;
    _objects = Dictionary::make();
    _wantedParts.clear();
    changed();
}

void ModemManagerObjects::changed()
{
    readParts();
    _onChange();
}

void ModemManagerObjects::readParts()
{
    const std::string modem = watchedModemIn(*_objects);
    const std::vector<std::string> sims = simsOf(*_objects, modem);
    const std::vector<std::string> bearers = bearersOf(*_objects, modem);
    std::set<std::string> wanted(sims.begin(), sims.end());
    wanted.insert(bearers.begin(), bearers.end());
    for (const std::string& path : _wantedParts) {
        if (!wanted.contains(path))
            _objects->remove(path);
    }
    const std::set<std::string> before = std::exchange(_wantedParts, std::move(wanted));
    for (const std::string& path : sims) {
        if (!before.contains(path))
            readPart(path, kSimInterface);
    }
    for (const std::string& path : bearers) {
        if (!before.contains(path))
            readPart(path, kBearerInterface);
    }
}

void ModemManagerObjects::readPart(const std::string& path, const char* interface)
{
    _bus.call(path, kProperties, "GetAll", {QString::fromLatin1(interface)}, kAnswerTime,
        [this, path, interface](const auto& answer) {
            DictionaryRef properties = answer.value.dictionary();
            if (!properties || !_wantedParts.contains(path))
                return;
            madeIn(*_objects, path)->set(interface, properties);
            _onChange();
        });
}

void ModemManagerObjects::addInterfaces(const Signal& signal)
{
    if (signal.arguments.size() < 2)
        return;
    const std::string path = textOf(signal.arguments[0]);
    const DictionaryRef added = signal.arguments[1].dictionary();
    if (path.empty() || !added)
        return;
    const DictionaryRef interfaces = madeIn(*_objects, path);
    for (const auto& [name, properties] : *added)
        interfaces->set(name, properties);
    changed();
}

void ModemManagerObjects::removeInterfaces(const Signal& signal)
{
    if (signal.arguments.size() < 2)
        return;
    const std::string path = textOf(signal.arguments[0]);
    const DictionaryRef interfaces = (*_objects)[path].dictionary();
    const ArrayRef removed = signal.arguments[1].array();
    if (!interfaces || !removed)
        return;
    for (const Value& name : *removed)
        interfaces->remove(textOf(name));
    if (interfaces->isEmpty())
        _objects->remove(path);
    changed();
}

void ModemManagerObjects::changeProperties(const Signal& signal)
{
    if (signal.arguments.size() < 2)
        return;
    // Of an object that is not watched there are none.
    const DictionaryRef known = properties(signal.path, textOf(signal.arguments[0]).c_str());
    const DictionaryRef changes = signal.arguments[1].dictionary();
    if (!known || !changes)
        return;
    for (const auto& [name, value] : *changes)
        known->set(name, value);
    changed();
}

} // namespace orvex::korat

#pragma once

#include "modem/ModemManagerBus.h"

#include "Dictionary.h"

#include <QDBusServiceWatcher>
#include <QTimer>

#include <set>

namespace orvex::korat {

// ModemManager's objects: modems with all their interfaces, and the SIM card and bearers of the watched
// modem. Follows the service as it starts, stops and restarts.
//
// Never queries the modem: ModemManager answers from its own properties.
class ModemManagerObjects {
public:
    // Calls back after each change.
    ModemManagerObjects(ModemManagerBus& bus, std::function<void()> onChange);
    // Starts listening. Returns an error in one line, or an empty text.
    std::string start();

    enum class Service { unknown, isMissing, isThere };
    Service service() const { return _service; }
    // Properties by path and interface.
    const Dictionary& objects() const { return *_objects; }
    DictionaryRef properties(const std::string& path, const char* interface) const;

private:
    using Signal = ModemManagerBus::Signal;

    void addInterfaces(const Signal& signal);
    void removeInterfaces(const Signal& signal);
    void changeProperties(const Signal& signal);
    void readAll();
    void lose();
    void readParts();
    void readPart(const std::string& path, const char* interface);
    void changed();

    ModemManagerBus& _bus;
    std::function<void()> _onChange;
    Service _service = Service::unknown;
    DictionaryRef _objects = Dictionary::make();
    std::set<std::string> _wantedParts; // SIM card and bearers of the watched modem
    QDBusServiceWatcher _watcher;
    QTimer _retry;
};

} // namespace orvex::korat

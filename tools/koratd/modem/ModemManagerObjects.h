#pragma once

#include "modem/ModemManagerBus.h"

#include "Dictionary.h"

#include <QDBusServiceWatcher>
#include <QTimer>

#include <set>

namespace orvex::korat {

// ModemManager's objects as it tells them by itself: modems with all their interfaces, and the SIM card and
// bearers of the modem that is watched. Follows the service when it comes, goes and comes again.
//
// Nothing here reaches a modem: ModemManager answers from what it knows.
class ModemManagerObjects {
public:
    // Is told after each change.
    ModemManagerObjects(ModemManagerBus& bus, std::function<void()> onChange);
    // Begins to listen. Returns why it cannot, in one line; empty when it can.
    std::string start();

    enum class Service { unknown, isMissing, isThere };
    Service service() const { return _service; }
    // Paths, of each its interfaces, of each its properties.
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

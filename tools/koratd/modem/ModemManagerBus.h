#pragma once

#include "Value.h"

#include <QDBusConnection>
#include <QObject>
#include <QVariantList>

#include <chrono>
#include <functional>
#include <string>
#include <vector>

namespace orvex::korat {

// ModemManager's methods and signals. No call starts the service where it is not running.
class ModemManagerBus {
public:
    static constexpr const char* kService = "org.freedesktop.ModemManager1";

    // The answer's first argument, or the name of an error: exactly one of the two.
    struct Answer {
        Value value;
        std::string error;

        // Whether the bus, or the service itself, does not let this user ask.
        bool isDenied() const;
        bool isNotSupported() const;
    };

    explicit ModemManagerBus(const QDBusConnection& connection)
        : _connection(connection)
    {
    }

    const QDBusConnection& connection() const { return _connection; }

    struct Signal {
        std::string path;
        std::vector<Value> arguments;
    };
    // Listens to a signal, of any path when the path is empty, as long as this object lives.
    void listen(const char* path, const char* interface, const char* name,
        std::function<void(const Signal&)> onSignal);

    // The answer comes on the event loop, unless this object has gone by then.
    void call(const std::string& path, const char* interface, const char* method,
        const QVariantList& arguments, std::chrono::milliseconds timeout,
        std::function<void(const Answer&)> onAnswer);
    // Waits for the answer.
    Answer callAndWait(const std::string& path, const char* interface, const char* method,
        const QVariantList& arguments, std::chrono::milliseconds timeout);

private:
    QDBusConnection _connection;
    QObject _context; // calls into it end with it
};

} // namespace orvex::korat

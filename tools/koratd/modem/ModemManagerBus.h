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

// ModemManager's methods and signals. Calls never start the service.
class ModemManagerBus {
public:
    static constexpr const char* kService = "org.freedesktop.ModemManager1";

    // Either the reply's first argument or the name of an error.
    struct Answer {
        Value value;
        std::string error;

        // True if the bus or the service denies this user the call.
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
    // Listens to a signal as long as this object lives; an empty path stands for any.
    void listen(const char* path, const char* interface, const char* name,
        std::function<void(const Signal&)> onSignal);

    // The reply arrives on the event loop, unless this object is gone by then.
    void call(const std::string& path, const char* interface, const char* method,
        const QVariantList& arguments, std::chrono::milliseconds timeout,
        std::function<void(const Answer&)> onAnswer);
    // Waits for the reply.
    Answer callAndWait(const std::string& path, const char* interface, const char* method,
        const QVariantList& arguments, std::chrono::milliseconds timeout);

private:
    QDBusConnection _connection;
    QObject _context; // calls into it end with it
};

} // namespace orvex::korat

#pragma once

#include <QDBusMessage>
#include <QObject>

#include <functional>
#include <utility>

namespace orvex::korat {

// Passes a D-Bus signal to a function; Qt delivers signals to slots only. Includes none of our headers,
// because moc does not understand concepts.
class BusSignal final : public QObject {
    Q_OBJECT

public:
    BusSignal(std::function<void(const QDBusMessage&)> onSignal, QObject* parent)
        : QObject(parent)
        , _onSignal(std::move(onSignal))
    {
    }

    Q_SLOT void receive(const QDBusMessage& signal) { _onSignal(signal); }

private:
    std::function<void(const QDBusMessage&)> _onSignal;
};

} // namespace orvex::korat

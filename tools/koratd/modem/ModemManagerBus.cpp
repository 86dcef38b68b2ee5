#include "modem/ModemManagerBus.h"

#include "modem/BusSignal.h"
#include "modem/BusValue.h"

#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QDBusPendingReply>

#include <algorithm>
#include <string_view>
#include <utility>

namespace orvex::korat {

namespace {
constexpr std::string_view kDenials[] = {
    "org.freedesktop.DBus.Error.AccessDenied", "org.freedesktop.ModemManager1.Error.Core.Unauthorized"};
constexpr std::string_view kGaps[] = {
    "org.freedesktop.ModemManager1.Error.Core.Unsupported", "org.freedesktop.DBus.Error.UnknownMethod"};

QDBusMessage message(
    const std::string& path, const char* interface, const char* method, const QVariantList& arguments)
{
    QDBusMessage result = QDBusMessage::createMethodCall(
        ModemManagerBus::kService, QString::fromStdString(path), interface, method);
    result.setArguments(arguments);
    result.setAutoStartService(false);
    return result;
}

ModemManagerBus::Answer answerIn(const QDBusMessage& reply)
{
    if (reply.type() == QDBusMessage::ErrorMessage)
        return {{}, reply.errorName().toStdString()};
    const QVariantList arguments = reply.arguments();
    return {arguments.isEmpty() ? Value() : valueFromBus(arguments.first()), {}};
}
} // namespace

bool ModemManagerBus::Answer::isDenied() const
{
    return std::ranges::find(kDenials, error) != std::end(kDenials);
}

bool ModemManagerBus::Answer::isNotSupported() const
{
    return std::ranges::find(kGaps, error) != std::end(kGaps);
}

void ModemManagerBus::listen(
    const char* path, const char* interface, const char* name, std::function<void(const Signal&)> onSignal)
{
    const auto pass = [onSignal = std::move(onSignal)](const QDBusMessage& message) {
        Signal signal{message.path().toStdString(), {}};
        for (const QVariant& argument : message.arguments())
            signal.arguments.push_back(valueFromBus(argument));
        onSignal(signal);
    };
    _connection.connect(
        kService, path, interface, name, new BusSignal(pass, &_context), SLOT(receive(QDBusMessage)));
}

void ModemManagerBus::call(const std::string& path, const char* interface, const char* method,
    const QVariantList& arguments, std::chrono::milliseconds timeout,
    std::function<void(const Answer&)> onAnswer)
{
    const QDBusPendingCall pending =
        _connection.asyncCall(message(path, interface, method, arguments), static_cast<int>(timeout.count()));
    auto* const watcher = new QDBusPendingCallWatcher(pending, &_context);
    QObject::connect(watcher, &QDBusPendingCallWatcher::finished, &_context,
        [onAnswer = std::move(onAnswer)](QDBusPendingCallWatcher* finished) {
            finished->deleteLater();
            onAnswer(answerIn(QDBusPendingReply<>(*finished).reply()));
        });
}

ModemManagerBus::Answer ModemManagerBus::callAndWait(const std::string& path, const char* interface,
    const char* method, const QVariantList& arguments, std::chrono::milliseconds timeout)
{
    return answerIn(_connection.call(
        message(path, interface, method, arguments), QDBus::Block, static_cast<int>(timeout.count())));
}

} // namespace orvex::korat

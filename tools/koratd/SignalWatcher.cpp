#include "SignalWatcher.h"

#include <QSocketNotifier>

#include <csignal>
#include <sys/signalfd.h>
#include <unistd.h>

namespace orvex::korat {

namespace {
int blockedSignals()
{
    sigset_t stopSignals;
    sigemptyset(&stopSignals);
    sigaddset(&stopSignals, SIGTERM);
    sigaddset(&stopSignals, SIGINT);
    pthread_sigmask(SIG_BLOCK, &stopSignals, nullptr);
    return signalfd(-1, &stopSignals, SFD_NONBLOCK | SFD_CLOEXEC);
}
} // namespace

SignalWatcher::SignalWatcher()
    : _descriptor(blockedSignals())
{
}

SignalWatcher::~SignalWatcher()
{
    _notifier.reset();
    close(_descriptor);
}

void SignalWatcher::watch(std::function<void()> onSignal)
{
    _notifier = std::make_unique<QSocketNotifier>(_descriptor, QSocketNotifier::Read);
    QObject::connect(_notifier.get(), &QSocketNotifier::activated, _notifier.get(),
        [descriptor = _descriptor, onSignal = std::move(onSignal)] {
            signalfd_siginfo info{};
            if (read(descriptor, &info, sizeof info) > 0)
                onSignal();
        });
}

} // namespace orvex::korat

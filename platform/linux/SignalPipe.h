#pragma once

#include <functional>
#include <memory>
#include <span>
#include <vector>

class QSocketNotifier;

namespace orvex {

// Turns signals into calls on the event loop. A signal belongs to one object at a time, whose destructor
// restores the default effect.
class SignalPipe {
public:
    using InHandler = void (*)(int number);

    // The second function, if any, runs at once in the signal handler and may do only what a handler may.
    SignalPipe(std::span<const int> numbers, std::function<void(int number)> onSignal,
        InHandler inHandler = nullptr);
    ~SignalPipe();
    SignalPipe(const SignalPipe&) = delete;
    SignalPipe& operator=(const SignalPipe&) = delete;

private:
    void readNumbers();

    std::vector<int> _numbers;
    std::function<void(int number)> _onSignal;
    int _readEnd = -1;
    int _writeEnd = -1;
    std::unique_ptr<QSocketNotifier> _notifier;
};

// Sets the handler for each of the signals.
void setSignalHandler(std::span<const int> numbers, void (*handler)(int), unsigned flags);

} // namespace orvex

#pragma once

#include <functional>
#include <memory>
#include <string_view>

class QSocketNotifier;

namespace orvex {

// The terminal that a program draws on in place: keys as they are typed, without an echo, and word of a
// changed size. Ctrl+C and Ctrl+Z keep their meaning.
//
// The terminal's modes are put back while the process is stopped or in the background and whenever it ends,
// also by a crash. Only SIGKILL leaves them changed. Only one object may exist at a time.
class RawTerminal {
public:
    struct Events {
        std::function<void(std::string_view bytes)> onInput;
        std::function<void()> onRedraw; // resized or back after a stop: draw everything again
    };

    explicit RawTerminal(Events events);
    ~RawTerminal();
    RawTerminal(const RawTerminal&) = delete;
    RawTerminal& operator=(const RawTerminal&) = delete;

    // Whether keys are read: standard input is a terminal and the process in its foreground. Takes the
    // terminal when the process has come into the foreground.
    bool readsKeys();

private:
    void readInput();
    void handleSignals();

    Events _events;
    int _readEnd = -1;
    int _writeEnd = -1;
    std::unique_ptr<QSocketNotifier> _signals;
    std::unique_ptr<QSocketNotifier> _input;
};

} // namespace orvex

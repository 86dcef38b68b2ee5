#pragma once

#include "SignalPipe.h"

#include <functional>
#include <memory>
#include <optional>
#include <string_view>

class QSocketNotifier;

namespace orvex {

// A terminal in raw mode: keys as they are typed, without echo, and notice of a changed size. Ctrl+C and
// Ctrl+Z keep their meaning.
//
// The terminal's modes are restored while the process is stopped or in the background and when it ends, even
// by a crash; only SIGKILL leaves them changed. Only one object may exist at a time.
class RawTerminal {
public:
    struct Events {
        std::function<void(std::string_view bytes)> onInput;
        std::function<void()> onRedraw; // resized, or continued after a stop
    };

    explicit RawTerminal(Events events);
    ~RawTerminal();
    RawTerminal(const RawTerminal&) = delete;
    RawTerminal& operator=(const RawTerminal&) = delete;

    // True if keys are read: standard input is a terminal and the process in its foreground. Enters raw mode
    // if the process has just come into the foreground.
    bool readsKeys();

private:
    void readInput();
    void handle(int signal);

    Events _events;
    std::unique_ptr<QSocketNotifier> _input;
    std::optional<SignalPipe> _signals;
};

} // namespace orvex

#pragma once

#include "LogCode.h"

#include "Value.h"

#include <chrono>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>

namespace orvex::korat {

using Microseconds = std::chrono::microseconds;

// One message of the log channel, as it goes over the wire.
struct Message {
    Microseconds due{};          // since the start of the stream
    std::optional<LogCode> code; // none: it is no packet
    Bytes bytes;
};

// Where the messages of one stream come from.
class Source {
public:
    virtual ~Source() = default;

    // The next message of this round; none at its end, or while a live source has nothing to say. The time
    // is that since the start of the stream.
    virtual std::optional<Message> next(Microseconds now) = 0;
    // Begins the next round. False when there is none.
    virtual bool restart() { return false; }
    // A live source has no rounds: it may have something to say later.
    virtual bool isLive() const { return false; }
};

// What a service streams from: opens a source for each stream, and knows its technology.
class Feed {
public:
    virtual ~Feed() = default;

    // Gets ready. Returns why it cannot, in one line; empty when it can.
    virtual std::string start() = 0;
    // The log technology, which may change while a monitor is there; it is told by a new log channel.
    virtual std::string technology() = 0;
    virtual std::unique_ptr<Source> open(const std::string& technology) = 0;
    // A monitor has opened or left a log channel.
    virtual void setMonitored(bool /*isMonitored*/) { }
};

} // namespace orvex::korat

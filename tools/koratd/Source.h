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
    std::optional<LogCode> code; // none if it is not a packet
    Bytes bytes;
};

// The messages of one stream.
class Source {
public:
    virtual ~Source() = default;

    // The next message of this round. None at its end, or while a live source has nothing to send. Times
    // count from the start of the stream.
    virtual std::optional<Message> next(Microseconds now) = 0;
    // Begins the next round. False if there is none.
    virtual bool restart() { return false; }
    // A live source has no rounds and may have something to send later.
    virtual bool isLive() const { return false; }
};

// What the service streams: opens a source for each stream and knows its technology.
class Feed {
public:
    virtual ~Feed() = default;

    // Prepares the feed. Returns an error in one line, or an empty text.
    virtual std::string start() = 0;
    // The log technology. It may change while a monitor is connected, which learns of it through a new log
    // channel.
    virtual std::string technology() = 0;
    virtual std::unique_ptr<Source> open(const std::string& technology) = 0;
    // Called when a monitor opens or leaves a log channel.
    virtual void setMonitored(bool /*isMonitored*/) { }
};

} // namespace orvex::korat

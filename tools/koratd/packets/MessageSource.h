#pragma once

#include "LogMessage.h"

#include <vector>

namespace orvex::korat {

// Where the messages come from that koratd streams. It runs on a clock of its own, as fast as it is asked.
class MessageSource {
public:
    struct Item {
        Microseconds due{}; // since the source's start
        LogMessage message;
    };

    virtual ~MessageSource() = default;

    // The next message; their times never go back. None at the end.
    virtual std::optional<Item> nextIfAny() = 0;
    // After the end: begins again with the first message, while the times go on. False when it was the end
    // for good.
    virtual bool restart() { return false; }
    // The codes of all messages that can come; empty when they carry none, or the source cannot tell.
    virtual std::vector<LogCode> codes() const = 0;
};

} // namespace orvex::korat

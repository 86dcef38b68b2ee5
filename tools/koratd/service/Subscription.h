#pragma once

#include "packets/LogMessage.h"

#include <set>

namespace orvex::korat {

// What a client's start command asks for.
class Subscription {
public:
    // A command that names no codes at all asks for everything. Entries that are no codes are passed over.
    // Codes choose among packets only: messages without a code go to whoever streams.
    explicit Subscription(const Dictionary& startCommand);

    // Whether a command is one to start the stream.
    static bool isStartCommand(const Dictionary& command);

    bool wants(std::optional<LogCode> code) const
    {
        return !code || _wantsEverything || _codes.contains(*code);
    }
    // Whether anything of a scenario is wanted whose codes these are; none at all: it sends no packets.
    bool wantsAny(const std::vector<LogCode>& codes) const;

private:
    bool _wantsEverything;
    std::set<LogCode> _codes;
};

} // namespace orvex::korat

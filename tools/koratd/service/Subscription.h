#pragma once

#include "packets/LogMessage.h"

#include <set>

namespace orvex::korat {

// What a client's start command asks for.
class Subscription {
public:
    // A command that names no codes at all asks for everything. Entries that are no codes are passed over.
    explicit Subscription(const Dictionary& startCommand);

    // Whether a command is one to start the stream.
    static bool isStartCommand(const Dictionary& command);

    bool wants(LogCode code) const { return _wantsEverything || _codes.contains(code); }
    bool wantsAny(const std::vector<LogCode>& codes) const;

private:
    bool _wantsEverything;
    std::set<LogCode> _codes;
};

} // namespace orvex::korat

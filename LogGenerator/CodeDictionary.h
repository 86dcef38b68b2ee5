#pragma once

#include "PacketReader.h"

#include <string>
#include <vector>

namespace orvex {

class Base;

// Which sections want which log code. Sections of one code stand in the order in which they subscribed.
class CodeDictionary {
public:
    using Subscribers = std::vector<Base*>;

    // A section that subscribes twice receives each packet twice.
    void subscribe(LogCode code, Base& section);
    // Null when nobody wants the code.
    const Subscribers* subscribers(LogCode code) const;
    // Every code as a decimal text, in the order of the first subscription.
    std::vector<std::string> keys() const;

private:
    // Thirty codes at most, asked for with every packet: a look along them is as fast as any hash.
    std::vector<LogCode> _codes;
    std::vector<Subscribers> _subscribers; // of the code at the same place
};

} // namespace orvex

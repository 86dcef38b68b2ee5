#pragma once

#include "Base.h"

#include <stdexcept>

namespace orvex {

// "PDP Context Info": the packet data contexts (extra code 0xFF0002), a property list with an array from byte
// 13 on. What stands in each context is the telephony service's own; it is shown as it comes. A list of
// another kind is dropped without a word.
class PDPContextList final : public Base {
public:
    // There is no property list at all. Nobody catches it.
    class UnknownDataException : public std::runtime_error {
    public:
        using std::runtime_error::runtime_error;
    };

    PDPContextList(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

} // namespace orvex

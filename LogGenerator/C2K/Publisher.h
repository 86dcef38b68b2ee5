#pragma once

#include "PacketReader.h"

#include "DeferredText.h"
#include "Dictionary.h"
#include "SystemLog.h"

namespace orvex {

// Puts values into the display by internal key, such as "kRxAGC0". The lookup leads from a key to every row
// that shows it.
//
// The lookup is a dictionary: internal key to an array of {"key": the row's name, "dict": the display
// dictionary that holds the row}.
class Publisher {
public:
    // A publisher without a lookup drops what it is given.
    explicit Publisher(DictionaryRef lookup)
        : _lookup(std::move(lookup))
    {
    }

    // Adds a row that shows the internal key.
    static void addRow(Dictionary& lookup, const std::string& internalKey, const std::string& row,
        const DictionaryRef& dict);

    // Sets every row of the key to the value, in the order in which the rows were added, up to the first
    // damaged entry.
    void publish(const char* internalKey, const Value& value) const;
    // Formatted as by printf.
    template <typename... Arguments>
    void setText(const char* internalKey, PrintfFormat<std::type_identity_t<Arguments>...> format,
        Arguments... arguments) const
    {
        publish(internalKey, DeferredText(format, arguments...));
    }

private:
    DictionaryRef _lookup;
};

// The rows of a list of pilots, "INDEX;PN" each: a display sorts them by the text before the semicolon and
// shows the one after it.
class PilotList {
public:
    PilotList();

    void add(int index, int pn, DeferredText content);

    const DictionaryRef& rows() const { return _rows; }
    // "(none)" in place of a list without pilots.
    Value rowsOrNone() const;

private:
    DictionaryRef _rows;
    bool _isEmpty = true;
};

// 10 log10 of a linear ratio, and the unit. A ratio of zero shows as minus infinity.
std::string decibelText(double ratio);

// The text of a CDMA2000 band class, shared by 1x and EV-DO.
DeferredText bandClassText(int bandClass);

// True when the packet has its reader's minimum length; otherwise logs that it is too short.
template <typename Reader>
bool hasMinimumLength(Packet packet)
{
    if (packet.size() >= Reader::kMinimumLength)
        return true;
    systemLog(Priority::error, "Log code 0x%x is %u bytes long but must be at least %lu bytes.",
        static_cast<unsigned>(Reader::kCode), static_cast<unsigned>(packet.size()),
        static_cast<unsigned long>(Reader::kMinimumLength));
    return false;
}

} // namespace orvex

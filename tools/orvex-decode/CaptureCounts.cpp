#include "CaptureCounts.h"

#include "MessageFrame.h"

#include <algorithm>

namespace orvex {

void CaptureCounts::add(ByteView message, std::chrono::microseconds time)
{
    const LogCode code = codeOfMessage(message);
    const auto [entry, isNew] = _rows.try_emplace(code);
    Row& row = entry->second;
    if (isNew)
        row = {.kind = _kinds.find(code), .first = time, .last = time};
    ++row.messages;
    row.bytes += message.size();
    row.first = std::min(row.first, time);
    row.last = std::max(row.last, time);
    if (!row.kind)
        return;
    const bool isTooShort = MessageFrame(message).packet().size() < row.kind->minimumLength;
    ++(isTooShort ? row.tooShort : row.decoded);
}

CaptureCounts::Row CaptureCounts::total() const
{
    Row total;
    for (const auto& [code, row] : _rows) {
        total.first = total.messages == 0 ? row.first : std::min(total.first, row.first);
        total.last = std::max(total.last, row.last);
        total.messages += row.messages;
        total.bytes += row.bytes;
        total.decoded += row.decoded;
        total.tooShort += row.tooShort;
    }
    return total;
}

TechnologyGuess::Counts CaptureCounts::messagesByCode() const
{
    TechnologyGuess::Counts counts;
    for (const auto& [code, row] : _rows)
        counts[code] = row.messages;
    return counts;
}

} // namespace orvex

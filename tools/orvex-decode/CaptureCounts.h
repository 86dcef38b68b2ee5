#pragma once

#include "TechnologyGuess.h"

#include <chrono>
#include <map>

namespace orvex {

// Counts the messages of a capture by log code, and what a technology makes of them.
class CaptureCounts {
public:
    struct Row {
        std::size_t unwanted() const { return messages - decoded - tooShort; }

        const PacketKind* kind = nullptr; // null when nobody wants the code
        std::size_t messages = 0;
        std::size_t bytes = 0;
        std::size_t decoded = 0;
        std::size_t tooShort = 0;
        std::chrono::microseconds first{}; // the earliest and the latest message
        std::chrono::microseconds last{};
    };

    // `kinds` outlives the counts.
    explicit CaptureCounts(const PacketKinds& kinds)
        : _kinds(kinds)
    {
    }

    void add(ByteView message, std::chrono::microseconds time);

    // By the code of codeOfMessage().
    const std::map<LogCode, Row>& rows() const { return _rows; }
    Row total() const;
    TechnologyGuess::Counts messagesByCode() const;

private:
    const PacketKinds& _kinds;
    std::map<LogCode, Row> _rows;
};

} // namespace orvex

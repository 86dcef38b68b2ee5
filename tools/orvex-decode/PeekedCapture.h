#pragma once

#include "CaptureReader.h"
#include "TechnologyGuess.h"

#include <deque>
#include <optional>

namespace orvex {

// A capture whose first messages can be looked at before they are read. It may be a stream, so they are kept.
class PeekedCapture final : public CaptureReader {
public:
    explicit PeekedCapture(std::unique_ptr<CaptureReader> reader)
        : CaptureReader({})
        , _reader(std::move(reader))
    {
    }

    // The codes of up to 10,000 messages and 16 MiB. Called before the first next().
    TechnologyGuess::Counts peekCodes();

    Status next() override;
    std::string omissions() const override { return _reader->omissions(); }

private:
    struct Message {
        Bytes bytes;
        std::chrono::microseconds time;
    };

    Status readOn();

    std::unique_ptr<CaptureReader> _reader;
    std::deque<Message> _peeked;
    Bytes _current;                    // the last one taken of those
    std::optional<Status> _endingSeen; // what the reader said behind them, unless it has more
};

} // namespace orvex

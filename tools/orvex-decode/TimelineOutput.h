#pragma once

#include "CaptureDecoding.h"

#include "TimelineSink.h"

#include <chrono>
#include <string>

namespace orvex {

// A file that shows captures over time. It takes one capture after the other: begin(), messages and samples
// in the order of the capture, end(). A capture that fails has no end(). Rows are numbered anew for each.
class TimelineOutput : public TimelineSink {
public:
    // Path and technology of the capture are known.
    virtual void begin(const DecodedCapture& capture) = 0;
    // Each message, also those without a time (captureDate()).
    virtual void message(ByteView /*message*/, std::chrono::microseconds /*time*/) { }
    // The capture has been decoded, up to where it is cut: counts, errors and last display are known. Writes
    // the file. Returns an error line that names it; empty for none.
    virtual std::string end(const DecodedCapture& capture) = 0;
};

} // namespace orvex

#pragma once

#include "OfflineSession.h"
#include "TimelineOutput.h"

#include "Sampling.h"
#include "Timeline.h"

#include <chrono>
#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace orvex {

// Looks at the display of a session by the clock of its capture: at every tick after the first message,
// before the message that follows, and once more at the end. A gap in the capture takes no samples.
//
// When the clock goes back by more than a second, ticks start anew from there. Messages without a time belong
// to the sample that comes next.
class CaptureSampler {
public:
    // The session and the output outlive the sampler.
    CaptureSampler(const Sampling& sampling, OfflineSession& session, TimelineOutput& output);

    // Samples what is due before the message. Called before the session takes it.
    void take(ByteView message, std::chrono::microseconds time);
    // Samples the end. Returns false when no message had a time.
    bool finish();

    // How the clock went back; empty if it did not.
    std::string clockNote() const;
    // The wanted paths at which nothing was shown.
    std::vector<std::string> missingFields() const { return _fields.missing(); }

private:
    void advance(std::chrono::microseconds time);
    void goBack(std::chrono::microseconds time);
    void sample(std::chrono::microseconds time);

    OfflineSession& _session;
    TimelineOutput& _output;
    TimelineFields _fields;
    Timeline _timeline;
    std::chrono::microseconds _every;

    std::size_t _messages = 0;
    std::optional<std::chrono::microseconds> _newest; // of the messages since the ticks started
    std::chrono::microseconds _next{};                // tick

    struct Jump {
        std::chrono::microseconds back;
        std::size_t message; // from 1
    };
    std::optional<Jump> _firstJump;
    std::size_t _jumps = 0;
};

} // namespace orvex

#pragma once

#include "C2K/Publisher.h"

namespace orvex {

// The frame-error rate of the 1x traffic channel: a running average over about 64 frames, kept in the
// generator state as "TrafficFER", 0 to 1. All of it is in single precision, as the last digit shows.
class TrafficFER {
public:
    TrafficFER(Dictionary& state, const Publisher& publisher)
        : _state(state)
        , _publisher(publisher)
    {
    }

    void addFrame(bool isErroneous);
    // Traffic is over: the average is shown once more, as an old one. The next frame begins a new one.
    void endTraffic();

private:
    Dictionary& _state;
    const Publisher& _publisher;
};

} // namespace orvex

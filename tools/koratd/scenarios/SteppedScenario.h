#pragma once

#include "Scenario.h"

#include <deque>

namespace orvex::korat {

// A scenario that is computed in steps of a tenth of a second; a step emits any number of messages.
class SteppedScenario : public Scenario {
public:
    explicit SteppedScenario(Microseconds start)
        : _start(start)
    {
    }

    Item next() final;

protected:
    static constexpr std::int64_t kStepsPerSecond = 10;
    static constexpr Microseconds kStep{1'000'000 / kStepsPerSecond};

    // Computes the state at this moment and emits what it brings.
    virtual void step() = 0;

    // Messages of one step are emitted in the order of their times, which may lie later within the step.
    void emit(LogMessage message, Microseconds later = {})
    {
        _due.push_back({elapsed() + later, std::move(message)});
    }
    // The time in packets.
    Microseconds now() const { return _start + elapsed(); }
    Microseconds elapsed() const { return kStep * _stepNumber; }
    double elapsedSeconds() const { return static_cast<double>(_stepNumber) / kStepsPerSecond; }
    // True in every n-th step, the first one included.
    bool isEvery(std::int64_t steps) const { return _stepNumber % steps == 0; }

private:
    Microseconds _start;
    std::int64_t _stepNumber = 0;
    std::deque<Item> _due;
};

} // namespace orvex::korat

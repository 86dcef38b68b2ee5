#pragma once

#include "modem/ModemManagerObjects.h"
#include "modem/ModemQuestion.h"
#include "modem/ModemReader.h"

#include "RunLoop.h"

namespace orvex::korat {

// Reads ModemManager's first modem through D-Bus. It never enables or connects a modem and never changes its
// settings, with one exception: while querying, a signal refresh rate of 0 becomes 5 seconds. The rate is
// restored 10 seconds after the last query, as a monitor may come back, or by the destructor.
class ModemManagerReader final : public ModemReader {
public:
    ModemManagerReader(RunLoop& runLoop, const QDBusConnection& connection, bool withIdentities);
    ~ModemManagerReader() override;
    ModemManagerReader(const ModemManagerReader&) = delete;
    ModemManagerReader& operator=(const ModemManagerReader&) = delete;

    std::string start() override { return _objects.start(); }
    void setAsking(bool isAsking) override;
    const ModemState& state() const override { return _state; }
    std::uint64_t version() const override { return _version; }

private:
    using Time = ModemQuestion::Time;
    using Answer = ModemManagerBus::Answer;

    void update();
    void forgetAnswers();
    void ask();
    void askForCells(Time now);
    void takeCellAnswer(const Answer& answer);
    void askForLocation(Time now);
    void setUpSignal(Time now);
    bool isSignalRateOurs() const;
    void putSignalBack();
    static void retryAfter(const Answer& answer, ModemQuestion& question);

    RunLoop& _runLoop;
    ModemManagerBus _bus;
    bool _withIdentities;
    ModemState _state;
    std::uint64_t _version = 0;

    std::string _modem; // the watched one; empty if there is none
                        // Its replies.
    ModemState _cells;
    std::optional<Location> _location;

    ModemQuestion _cellQuestion;
    ModemQuestion _locationQuestion;
    ModemQuestion _signalQuestion;
    std::string _signalModem;               // the one whose rate must be restored
    std::unique_ptr<RunLoop::Timer> _timer; // while querying
    std::unique_ptr<RunLoop::Timer> _end;   // then restores the rate
    ModemManagerObjects _objects;
};

} // namespace orvex::korat

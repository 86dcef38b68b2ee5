#pragma once

#include "ProcessFigures.h"
#include "Steps.h"

#include <map>

namespace orvex::soak {

// A window of orvex that stays open through steps of all kinds. After each step it has no session, so what it
// holds then can be compared.
class Soak {
public:
    // Everything may take so much longer than it should.
    Soak(unsigned seed, std::chrono::milliseconds slack);

    // Takes steps for so long, three at least. A check that fails is a Disappointment.
    void runFor(std::chrono::seconds time);
    // Ends the monitor, says what there was and checks that the monitor's figures have levelled off.
    void finish();

private:
    void take(const Steps::Kind& kind);

    test::ProgramFolder _folder;
    MonitorProgram _monitor;
    MonitorWatch _watch;
    Steps _steps;

    std::map<std::string, int> _taken; // of each kind
    Range _sent;
    std::vector<ProcessFigures> _figures; // after each step
};

} // namespace orvex::soak

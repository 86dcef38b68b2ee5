#pragma once

#include "modem/ModemReader.h"
#include "modem/TechnologyChoice.h"

#include "RunLoop.h"
#include "Source.h"

namespace orvex::korat {

// Streams what a reader knows of a modem, and has it query the modem while a monitor is connected. Reports
// obstacles in one line: no service, no modem, no permission.
class ModemFeed final : public Feed {
public:
    // Without a technology, follows the serving cell's.
    ModemFeed(RunLoop& runLoop, std::unique_ptr<ModemReader> reader, std::optional<std::string> technology,
        bool withMeasurements);

    std::string start() override;
    std::string technology() override;
    std::unique_ptr<Source> open(const std::string& technology) override;
    void setMonitored(bool isMonitored) override;

private:
    void reportWhatChanged();

    RunLoop& _runLoop;
    std::unique_ptr<ModemReader> _reader;
    std::optional<std::string> _technology;
    bool _withMeasurements;
    TechnologyChoice _choice;
    std::string _reportedCondition;
    std::string _reportedCells;
    std::unique_ptr<RunLoop::Timer> _timer;
};

} // namespace orvex::korat

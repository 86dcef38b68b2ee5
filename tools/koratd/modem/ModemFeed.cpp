#include "modem/ModemFeed.h"

#include "modem/IfxReport.h"
#include "modem/ModemSource.h"

#include "Report.h"

#include <utility>

namespace orvex::korat {

namespace {
constexpr std::chrono::seconds kReportPeriod{1};
} // namespace

ModemFeed::ModemFeed(RunLoop& runLoop, std::unique_ptr<ModemReader> reader,
    std::optional<std::string> technology, bool withMeasurements)
    : _runLoop(runLoop)
    , _reader(std::move(reader))
    , _technology(std::move(technology))
    , _withMeasurements(withMeasurements)
{
}

std::string ModemFeed::start()
{
    _timer = _runLoop.startTimer(kReportPeriod, [this] { reportWhatChanged(); });
    return _reader->start();
}

std::string ModemFeed::technology()
{
    return _technology ? *_technology
                       : _choice.follow(_reader->state(), TechnologyChoice::Time::clock::now());
}

std::unique_ptr<Source> ModemFeed::open(const std::string& technology)
{
    return std::make_unique<ModemSource>(*_reader, technology, _withMeasurements);
}

void ModemFeed::setMonitored(bool isMonitored)
{
    if (isMonitored)
        _choice.choose(_reader->state());
    _reader->setAsking(isMonitored);
}

void ModemFeed::reportWhatChanged()
{
    const ModemState& state = _reader->state();
    if (state.condition == Condition::unknown)
        return;
    std::string condition = conditionLine(state);
    if (condition.empty())
        condition = "watching " + state.manufacturer + ' ' + state.model;
    if (std::exchange(_reportedCondition, condition) != condition)
        reportText(condition);
    if (state.cellAnswer == CellAnswer::notAsked) // between two monitors nothing is news
        return;
    const std::string cells = cellLine(state);
    if (std::exchange(_reportedCells, cells) != cells && !cells.empty())
        reportText(cells);
}

} // namespace orvex::korat

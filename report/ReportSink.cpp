#include "ReportSink.h"

namespace orvex {

ReportSink::ReportSink(std::string_view technology)
    : _rules(reportRowsOf(technology))
    , _plots(_rules.plots)
    , _states(_rules.states)
    , _contexts(_rules.contexts)
    , _parts{&_plots, &_states, &_contexts}
{
    for (const ServingCellRule& rule : _rules.servingCells)
        _parts.push_back(_servingCells.emplace_back(std::make_unique<ServingCells>(rule)).get());
    for (const NeighbourRule& rule : _rules.neighbours)
        _parts.push_back(_neighbours.emplace_back(std::make_unique<Neighbours>(rule)).get());
}

void ReportSink::sample(Date time)
{
    const bool isFirst = _clock.samples() == 0;
    const Moment before = _clock.lastSample();
    const Moment& now = _clock.takeSample(time);
    for (ReportPart* part : _parts) {
        if (!isFirst)
            part->settle(before, now);
    }
}

void ReportSink::addRow(std::size_t /*number*/, const TimelineRow& row)
{
    std::vector<ReportPart*>& followers = _partsOfRow.emplace_back();
    for (ReportPart* part : _parts) {
        if (part->addRow(_partsOfRow.size() - 1, row))
            followers.push_back(part);
    }
}

void ReportSink::set(std::size_t number, const std::string& text)
{
    for (ReportPart* part : _partsOfRow[number])
        part->set(number, text, _clock.lastSample());
}

void ReportSink::clear(std::size_t number)
{
    for (ReportPart* part : _partsOfRow[number])
        part->clear(number, _clock.lastSample());
}

void ReportSink::finish()
{
    for (ReportPart* part : _parts)
        part->finish(_clock.lastSample());
}

void ReportSink::writeJson(JsonWriter& json) const
{
    json.member("technologyName", _rules.technologyName);
    _clock.writeJson(json);
    json.key("bands");
    json.beginArray();
    for (const auto& cells : _servingCells)
        cells->writeBand(json);
    _states.writeJson(json);
    json.endArray();
    _plots.writeJson(json);
    json.key("servingCells");
    json.beginArray();
    for (const auto& cells : _servingCells)
        cells->writeJson(json);
    json.endArray();
    json.key("neighbours");
    json.beginArray();
    for (const auto& list : _neighbours)
        list->writeJson(json);
    json.endArray();
    _contexts.writeJson(json);
}

} // namespace orvex

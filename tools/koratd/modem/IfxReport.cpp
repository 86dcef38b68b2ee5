#include "modem/IfxReport.h"

#include "modem/ReportRows.h"

#include "Array.h"
#include "TextFormat.h"

namespace orvex::korat {

namespace {
constexpr Radio kRadiosInOrder[] = {
    Radio::gsm, Radio::umts, Radio::tdscdma, Radio::lte, Radio::nr5g, Radio::cdma};

void addSection(Dictionary& report, const char* name, const ReportRows& rows)
{
    if (!rows.isEmpty())
        report.set(name, rows.value());
}

ReportRows modemRows(const ModemState& state)
{
    ReportRows rows;
    rows.add("Manufacturer", state.manufacturer);
    rows.add("Model", state.model);
    rows.add("Firmware", state.revision);
    rows.add("IMEI", state.imei);
    rows.add("State", state.stateName);
    rows.add("Access Technology", state.accessTechnologies);
    rows.add("Signal Quality", state.signalQuality, " %");
    if (state.modemCount > 1)
        rows.add("Modems", text("%zu; this is the one shown", state.modemCount));
    return rows;
}

ReportRows registrationRows(const Registration& registration)
{
    ReportRows rows;
    rows.add("State", registration.state);
    rows.add("Operator", registration.operatorName);
    const auto network = Network::of(registration.operatorId);
    rows.add("Network", network ? network->text : registration.operatorId);
    return rows;
}

// Of several technologies at a time, each has its own section: "Serving Cell" and "Serving 5G Cell".
void addServingCells(Dictionary& report, const ModemState& state)
{
    const Cell* first = state.servingCell();
    for (const Cell& cell : state.cells) {
        if (!cell.isServing)
            continue;
        ReportRows rows;
        rows.add("Technology", nameOf(cell.radio));
        const ReportRows cellRows = rowsOf(cell);
        for (const auto& [name, value] : *cellRows.dictionary())
            rows.add(name.c_str(), *value.string());
        const std::string name =
            &cell == first ? "Serving Cell" : std::string("Serving ") + nameOf(cell.radio) + " Cell";
        addSection(report, name.c_str(), rows);
    }
}

void addNeighbors(Dictionary& report, const ModemState& state)
{
    for (const Radio radio : kRadiosInOrder) {
        const std::string name = std::string(nameOf(radio)) + " Neighbors";
        auto list = Array::make({name});
        for (const Cell& cell : state.cells) {
            const bool isMeant = cell.radio == radio && !cell.isServing;
            if (const ReportRows rows = rowsOf(cell); isMeant && !rows.isEmpty())
                list->append(rows.value());
        }
        if (list->size() > 1)
            report.set(name, list);
    }
}

ReportRows signalRows(const std::vector<SignalLevel>& signal)
{
    ReportRows rows;
    for (const auto& [name, value, unit] : signal)
        rows.add(name.c_str(), Cell::Level(value), unit);
    return rows;
}

ReportRows locationRows(const Location& location)
{
    ReportRows rows;
    const auto network = Network::of(location.operatorId);
    rows.add("Network", network ? network->text : location.operatorId);
    rows.add("LAC", location.locationArea);
    rows.add("TAC", location.trackingArea);
    rows.add("Cell ID", location.cell);
    return rows;
}

ReportRows simRows(const SimCard& sim)
{
    ReportRows rows;
    rows.add("ICCID", sim.iccid);
    rows.add("IMSI", sim.imsi);
    rows.add("EID", sim.eid);
    rows.add("Operator", sim.operatorName);
    const auto network = Network::of(sim.operatorId);
    rows.add("Home Network", network ? network->text : sim.operatorId);
    rows.add("Own Number", sim.ownNumbers);
    return rows;
}

void addBearers(Dictionary& report, const std::vector<Bearer>& bearers)
{
    auto list = Array::make({"Connections"});
    for (const Bearer& bearer : bearers)
        list->append(rowsOf(bearer).value());
    if (!bearers.empty())
        report.set("Connections", list);
}
} // namespace

std::string conditionLine(const ModemState& state)
{
    switch (state.condition) {
    case Condition::unknown: return "ModemManager is being asked";
    case Condition::noService: return "ModemManager is not running";
    case Condition::noModem: return "There is no modem";
    case Condition::failed: return "The modem has failed: " + state.conditionText;
    case Condition::locked: return "The modem is locked and wants " + state.conditionText;
    case Condition::disabled: return "The modem is not enabled";
    case Condition::enabled: break;
    }
    return {};
}

std::string cellLine(const ModemState& state)
{
    switch (state.cellAnswer) {
    case CellAnswer::notAsked: break;
    case CellAnswer::told:
        return state.cellsLeftOut == 0 ? std::string()
                                       : text("%zu more cells than are shown", state.cellsLeftOut);
    case CellAnswer::notSupported: return "This modem does not tell its cells";
    case CellAnswer::denied: return "Not allowed to ask for cells; orvex-modem.conf allows it";
    case CellAnswer::none: return "The modem does not answer";
    }
    return {};
}

Value ifxReport(const ModemState& state)
{
    auto report = Dictionary::make();
    if (const std::string line = conditionLine(state); !line.empty())
        report->set("Status", line);
    addSection(*report, "Modem", modemRows(state));
    addSection(*report, "Registration", registrationRows(state.registration));
    addServingCells(*report, state);
    addNeighbors(*report, state);
    if (const std::string line = cellLine(state); !line.empty())
        report->set("Cells", line);
    addSection(*report, "Signal", signalRows(state.signal));
    if (state.location)
        addSection(*report, "Location", locationRows(*state.location));
    if (state.sim)
        addSection(*report, "SIM", simRows(*state.sim));
    addBearers(*report, state.bearers);
    return report;
}

} // namespace orvex::korat

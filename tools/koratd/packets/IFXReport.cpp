#include "IFXReport.h"

#include "Array.h"
#include "Dictionary.h"
#include "PropertyList.h"
#include "TextFormat.h"

#include <stdexcept>

namespace orvex::korat {

namespace {
constexpr double kLeastAccessLevel = -106; // dBm, as GSM cells here broadcast it

// A value in a dictionary of its own.
DictionaryRef wrapped(const char* kind, std::string value)
{
    return Dictionary::make({{kind, std::move(value)}});
}

void addRadioRows(Dictionary& rows, const IFXReport::Cell& cell)
{
    const std::string carrier = text("%d", cell.carrier);
    const std::string level = text("%.0f dBm", cell.level);
    if (cell.isUMTS) {
        rows.set("Carrier", wrapped("UARFCN", carrier));
        rows.set("Scrambling Code", text("%d", cell.code));
        rows.set("RSCP", level);
        rows.set("EcN0", text("%.1f dB", cell.ecN0));
    } else {
        rows.set("Carrier", wrapped("ARFCN", carrier));
        rows.set("BSIC", text("%d-%d", cell.code / 8, cell.code % 8));
        rows.set("RxLev", level);
        rows.set("C1", text("%.0f dB", cell.level - kLeastAccessLevel));
    }
}

DictionaryRef servingCell(const IFXReport& report)
{
    const IFXReport::Cell& cell = report.serving;
    auto rows = Dictionary::make({
        {"Technology", cell.isUMTS ? "UMTS" : "GSM"},
        {"Network", wrapped("PLMN", text("%03d-%02d", report.mcc, report.mnc))},
        {"Area", wrapped("LAC", text("%d", cell.areaCode))},
        {"Cell", wrapped("Identity", text("%d", cell.cellID))},
    });
    addRadioRows(*rows, cell);
    rows->set("Transmit Power", report.isConnected ? text("%.0f dBm", report.transmitPower) : "off");
    return rows;
}

ArrayRef neighborCells(const IFXReport& report, bool areUMTS)
{
    auto list = Array::make({"Measured cells"});
    for (const IFXReport::Cell& cell : report.neighbors) {
        if (cell.isUMTS != areUMTS)
            continue;
        auto rows = Dictionary::make();
        addRadioRows(*rows, cell);
        list->append(rows);
    }
    return list;
}

DictionaryRef mobility(const IFXReport& report)
{
    auto changes = Array::make({"Latest first"});
    for (const auto& [time, from, to] : report.cellChanges) {
        changes->append(Dictionary::make({
            {"Time", wrapped("Since power-up", text("%.1f s", time))},
            {"From", text("%d", from)},
            {"To", text("%d", to)},
        }));
    }
    const char* const state = report.isConnected ? "Connected" : "Registered";
    return Dictionary::make({
        {"State",
            Dictionary::make({
                {"MM", state},
                {"GMM", state},
                {"Location Updates", text("%d", report.locationUpdates)},
            })},
        {"Cell Changes", changes},
        {"Forbidden Networks", Array::make({"From the SIM", "001-02", "001-03"})},
    });
}

ArrayRef packetData(const IFXReport& report)
{
    auto list = Array::make({"Contexts"});
    for (const Value& context : *report.contexts) {
        list->append(Dictionary::make({
            {"Context", context},
            {"Name Servers", Array::make({"In order of use", "192.0.2.53", "198.51.100.53"})},
        }));
    }
    return list;
}
} // namespace

LogMessage IFXReport::message(Form form) const
{
    const Value report = Dictionary::make({
        {"Serving Cell", servingCell(*this)},
        {"Neighbours",
            Dictionary::make({{"UMTS", neighborCells(*this, true)}, {"GSM", neighborCells(*this, false)}})},
        {"Timing",
            Dictionary::make({
                {"Frame", wrapped("Number", text("%d", frameNumber))},
                {"Timing Advance", text("%d", timingAdvance)},
                {"Frequency Error", text("%+.0f Hz", frequencyError)},
            })},
        {"Mobility", mobility(*this)},
        {"Radio Resources",
            Dictionary::make({
                {"State", radioState},
                {"Since", wrapped("Duration", text("%.0f s", secondsInState))},
            })},
        {"Packet Data", packetData(*this)},
    });
    auto bytes = form == Form::xml ? propertyListXML(report) : propertyListBinary(report);
    if (!bytes)
        throw std::logic_error("a report of dictionaries, arrays and texts has a property-list form");
    return {std::nullopt, std::move(*bytes)};
}

} // namespace orvex::korat

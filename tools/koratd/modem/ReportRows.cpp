#include "modem/ReportRows.h"

#include "modem/LteBand.h"

#include "TextFormat.h"

namespace orvex::korat {

namespace {
constexpr int kLowestReceiveLevel = -111; // dBm

constexpr struct {
    Radio radio;
    const char* name;
    Cell::Number Cell::*field;
} kNumberRows[] = {
    {Radio::gsm, "LAC", &Cell::areaCode},
    {Radio::gsm, "Cell ID", &Cell::identity},
    {Radio::gsm, "ARFCN", &Cell::channel},
    {Radio::gsm, "Timing Advance", &Cell::timingAdvance},
    {Radio::umts, "LAC", &Cell::areaCode},
    {Radio::umts, "Cell ID", &Cell::identity},
    {Radio::umts, "UARFCN", &Cell::channel},
    {Radio::umts, "Scrambling Code", &Cell::physicalIdentity},
    {Radio::tdscdma, "LAC", &Cell::areaCode},
    {Radio::tdscdma, "Cell ID", &Cell::identity},
    {Radio::tdscdma, "UARFCN", &Cell::channel},
    {Radio::tdscdma, "Cell Parameter ID", &Cell::physicalIdentity},
    {Radio::tdscdma, "Timing Advance", &Cell::timingAdvance},
    {Radio::cdma, "System ID", &Cell::systemId},
    {Radio::cdma, "Network ID", &Cell::networkId},
    {Radio::cdma, "Base Station ID", &Cell::identity},
    {Radio::cdma, "PN Offset", &Cell::physicalIdentity},
    {Radio::cdma, "Pilot Strength", &Cell::pilotStrength},
    {Radio::lte, "TAC", &Cell::areaCode},
    {Radio::lte, "Cell ID", &Cell::identity},
    {Radio::lte, "Physical Cell ID", &Cell::physicalIdentity},
    {Radio::lte, "EARFCN", &Cell::channel},
    {Radio::lte, "Timing Advance", &Cell::timingAdvance},
    {Radio::nr5g, "TAC", &Cell::areaCode},
    {Radio::nr5g, "Cell ID", &Cell::identity},
    {Radio::nr5g, "Physical Cell ID", &Cell::physicalIdentity},
    {Radio::nr5g, "NR-ARFCN", &Cell::channel},
    {Radio::nr5g, "Timing Advance", &Cell::timingAdvance},
};

constexpr struct {
    const char* name;
    Cell::Level Cell::*field;
    const char* unit;
} kLevelRows[] = {
    {"RSRP", &Cell::rsrp, "dBm"},
    {"RSRQ", &Cell::rsrq, "dB"},
    {"SINR", &Cell::sinr, "dB"},
    {"RSCP", &Cell::rscp, "dBm"},
    {"Ec/Io", &Cell::ecio, "dB"},
};

std::string networkText(const std::string& operatorId)
{
    const auto network = Network::of(operatorId);
    return network ? network->text : operatorId;
}

void addGsmRows(ReportRows& rows, const Cell& cell)
{
    if (const auto bsic = cell.physicalIdentity) // network and base station colour code, as engineers say it
        rows.add("BSIC", text("%d-%d", static_cast<int>(*bsic >> 3), static_cast<int>(*bsic & 7)));
    if (const auto level = cell.receiveLevel)
        rows.add("RxLev", text("%d dBm", static_cast<int>(*level) + kLowestReceiveLevel));
}

void addAddresses(
    ReportRows& rows, const char* name, const char* gatewayName, const Bearer::Addresses& addresses)
{
    rows.add(name, addresses.address);
    rows.add(gatewayName, addresses.gateway);
}
} // namespace

void ReportRows::add(const char* name, const std::string& text)
{
    if (!text.empty())
        _rows->set(name, text);
}

void ReportRows::add(const char* name, const std::vector<std::string>& texts)
{
    std::string all;
    for (const std::string& each : texts)
        all += (all.empty() ? "" : ", ") + each;
    add(name, all);
}

void ReportRows::add(const char* name, Cell::Number number, const char* unit)
{
    if (number)
        add(name, std::to_string(*number) + unit);
}

void ReportRows::add(const char* name, Cell::Level level, const char* unit)
{
    if (level)
        add(name, text("%.1f %s", *level, unit));
}

Value ReportRows::value() const
{
    if (_rows->size() != 1)
        return _rows;
    const auto& [name, value] = *_rows->begin();
    return name + ": " + *value.string();
}

ReportRows rowsOf(const Cell& cell)
{
    ReportRows rows;
    rows.add("Network", networkText(cell.operatorId));
    for (const auto& [radio, name, field] : kNumberRows) {
        if (radio == cell.radio)
            rows.add(name, cell.*field);
    }
    if (cell.radio == Radio::gsm)
        addGsmRows(rows, cell);
    if (const auto band = cell.radio == Radio::lte && cell.channel ? lteBandOf(*cell.channel) : std::nullopt)
        rows.add("Band", std::to_string(*band));
    for (const auto& [name, field, unit] : kLevelRows)
        rows.add(name, cell.*field, unit);
    rows.add("Path Loss", cell.pathLoss, " dB");
    for (const auto& [name, text] : cell.others)
        rows.add(name.c_str(), text);
    return rows;
}

ReportRows rowsOf(const Bearer& bearer)
{
    ReportRows rows;
    rows.add("APN", bearer.apn);
    rows.add("State", bearer.isConnected ? "connected" : "not connected");
    rows.add("Interface", bearer.interface);
    addAddresses(rows, "IPv4 Address", "IPv4 Gateway", bearer.ipv4);
    addAddresses(rows, "IPv6 Address", "IPv6 Gateway", bearer.ipv6);
    std::vector<std::string> servers = bearer.ipv4.nameServers;
    servers.insert(servers.end(), bearer.ipv6.nameServers.begin(), bearer.ipv6.nameServers.end());
    rows.add("Name Servers", servers);
    rows.add("Duration", bearer.duration, " s");
    rows.add("Received", bearer.receivedBytes, " bytes");
    rows.add("Sent", bearer.sentBytes, " bytes");
    return rows;
}

} // namespace orvex::korat

#include "modem/ModemPackets.h"

#include "modem/CellRecords.h"
#include "modem/IfxReport.h"

#include "MessageFrame.h"
#include "PropertyList.h"
#include "TelephonyConstants.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace orvex::korat {

namespace {
constexpr LogCode kGsmCell = 0x5134;
constexpr LogCode kLteMeasurement = 0xB179;
constexpr std::size_t kGsmCellLength = 13; // its last 7 bytes are not read
constexpr std::size_t kMostMeasured = 255;

// Little-endian.
template <std::size_t width>
void append(Bytes& bytes, std::uint64_t number)
{
    for (std::size_t i = 0; i < width; ++i)
        bytes.push_back(static_cast<std::uint8_t>(number >> (8 * i)));
}

// Whether each number is known and fits into 16 bits without sign.
template <typename... Numbers>
bool fit16Bits(const Numbers&... numbers)
{
    return ((numbers && std::in_range<std::uint16_t>(*numbers)) && ...);
}

// GSM cell information: ARFCN, BSIC and cell identity, u16 each.
std::optional<Content> gsmCell(const ModemState& state)
{
    const Cell* cell = state.servingCell();
    if (!cell || cell->radio != Radio::gsm
        || !fit16Bits(cell->channel, cell->physicalIdentity, cell->identity))
        return std::nullopt;
    Bytes payload;
    for (const Cell::Number& number : {cell->channel, cell->physicalIdentity, cell->identity})
        append<2>(payload, static_cast<std::uint64_t>(*number));
    payload.resize(kGsmCellLength);
    return Content{kGsmCell, std::move(payload)};
}

struct Measurement {
    std::uint16_t physicalIdentity;
    std::uint16_t rsrp; // 0.25 dB above -140 dBm
    std::uint16_t rsrq; // 0.125 dB above -20 dB
};

std::optional<Measurement> measurementOf(const Cell& cell)
{
    const Cell::Number rsrp =
        cell.rsrp ? Cell::Number(std::llround((*cell.rsrp + 140) / 0.25)) : std::nullopt;
    const Cell::Number rsrq =
        cell.rsrq ? Cell::Number(std::llround((*cell.rsrq + 20) / 0.125)) : std::nullopt;
    if (!fit16Bits(cell.physicalIdentity, rsrp, rsrq))
        return std::nullopt;
    return Measurement{static_cast<std::uint16_t>(*cell.physicalIdentity), static_cast<std::uint16_t>(*rsrp),
        static_cast<std::uint16_t>(*rsrq)};
}

// LTE connected-mode intra-frequency measurement: four bytes not read, u16 EARFCN, serving physical cell
// identity, subframe number (not known: 0), RSRP and RSRQ, u8 numbers of measured and of detected cells; then
// each neighbour of the frequency.
std::optional<Content> lteMeasurement(const ModemState& state)
{
    const Cell* serving = state.servingCell();
    const auto measured = serving && serving->radio == Radio::lte ? measurementOf(*serving) : std::nullopt;
    if (!measured || !fit16Bits(serving->channel))
        return std::nullopt;
    std::vector<Measurement> neighbors;
    for (const Cell& cell : state.cells) {
        const bool isMeant = cell.radio == Radio::lte && !cell.isServing && cell.channel == serving->channel;
        if (const auto neighbor = measurementOf(cell);
            isMeant && neighbor && neighbors.size() < kMostMeasured)
            neighbors.push_back(*neighbor);
    }
    Bytes payload;
    append<4>(payload, 0);
    append<2>(payload, static_cast<std::uint64_t>(*serving->channel));
    append<2>(payload, measured->physicalIdentity);
    append<2>(payload, 0);
    append<2>(payload, measured->rsrp);
    append<2>(payload, measured->rsrq);
    append<1>(payload, neighbors.size());
    append<1>(payload, 0);
    for (const auto& [physicalIdentity, rsrp, rsrq] : neighbors) {
        append<2>(payload, physicalIdentity);
        append<2>(payload, rsrp);
        append<2>(payload, rsrq);
    }
    return Content{kLteMeasurement, std::move(payload)};
}

Content listContent(std::optional<LogCode> code, const Value& list)
{
    return {code, propertyListXML(list).value_or(Bytes{})};
}
} // namespace

std::vector<Content> contentsFor(
    const std::string& technology, const ModemState& state, bool withMeasurements)
{
    if (technology == telephony::kTechnologyIFX)
        return {listContent(std::nullopt, ifxReport(state))};
    std::vector<Content> result;
    result.push_back(listContent(kExtraCodeSimFiles, simFiles(state)));
    result.push_back(listContent(kExtraCodeCellMonitorList, cellRecords(state)));
    result.push_back(listContent(kExtraCodePDPContexts, packetDataContexts(state)));
    if (auto cell = technology == telephony::kTechnologyMRL_GSM ? gsmCell(state) : std::nullopt)
        result.push_back(*std::move(cell));
    const bool isMeasured = withMeasurements && technology == telephony::kTechnologyMRL_LTE;
    if (auto measurement = isMeasured ? lteMeasurement(state) : std::nullopt)
        result.push_back(*std::move(measurement));
    return result;
}

Bytes messageOf(const Content& content, std::uint64_t time)
{
    if (!content.code)
        return content.payload;
    const bool isExtra = *content.code >= kExtraCodeBase;
    const std::size_t length = kPacketHeaderLength + content.payload.size();
    Bytes message;
    message.reserve(length);
    append<1>(message, isExtra ? MessageFrame::kTypeExtra : MessageFrame::kTypeBaseband);
    append<2>(message, length - 1);
    append<2>(message, static_cast<std::uint64_t>(*content.code & 0xFFFF));
    append<8>(message, time);
    message.insert(message.end(), content.payload.begin(), content.payload.end());
    return message;
}

} // namespace orvex::korat

#include "ReportRows.h"

#include "Quantity.h"
#include "TelephonyConstants.h"

#include <charconv>
#include <cmath>
#include <utility>

namespace orvex {

namespace {

constexpr auto kBare = SignalRow::Kind::bare;

const ReportRows& lte()
{
    static const ReportRows rows{
        .technologyName = "LTE",
        // After a cell-monitor list the channel stands in the row UARFCN, which the next report of the
        // serving cell removes.
        .servingCells = {{"Serving cell",
            {{"PCI", "/Serving Cell Info/Physical Cell ID"},
                {"EARFCN", "/Serving Cell Info/UARFCN", "/Serving Cell Info/Download Frequency"},
                {"cell", "/Serving Cell Info/Cell Identity"}},
            {{"RSRP",
                 {{"/Serving Cell Measurements/Measured RSRP", "/Serving Cell Measurements/Physical Cell ID"},
                     {"/Connected mode LTE Intra-frequency Measurement/Serving Filtered RSRP",
                         "/Connected mode LTE Intra-frequency Measurement/Serving Physical Cell ID"}}},
                {"RSRQ",
                    {{"/Serving Cell Measurements/Measured RSRQ",
                         "/Serving Cell Measurements/Physical Cell ID"},
                        {"/Connected mode LTE Intra-frequency Measurement/Serving Filtered RSRQ",
                            "/Connected mode LTE Intra-frequency Measurement/Serving Physical Cell ID"}}}}}},
        .states = {{"Packet data", "/PDP Context Info/*/State"}},
        .plots = {{"RSRP of the serving cell",
                      {{"/Serving Cell Measurements/Measured RSRP"},
                          {"/Serving Cell Measurements/Average RSRP"},
                          {"/Connected mode LTE Intra-frequency Measurement/Serving Filtered RSRP"}}},
            {"RSRQ of the serving cell",
                {{"/Serving Cell Measurements/Measured RSRQ"}, {"/Serving Cell Measurements/Average RSRQ"},
                    {"/Connected mode LTE Intra-frequency Measurement/Serving Filtered RSRQ"}}},
            {"RSSI of the serving cell", {{"/Serving Cell Measurements/Measured RSSI"}}},
            {"RSRP of neighbours", {{"/Neighbor Cells List/*/Measured RSRP"}}},
            {"RSRQ of neighbours", {{"/Neighbor Cells List/*/Measured RSRQ"}}},
            {"RSSI of neighbours", {{"/Neighbor Cells List/*/Measured RSSI"}}},
            {"RSRP of neighbours in connected mode", {{"/Measured Neighbor Cells/*/Filtered RSRP"}}},
            {"RSRQ of neighbours in connected mode", {{"/Measured Neighbor Cells/*/Filtered RSRQ"}}}},
        .neighbours = {{"Neighbor Cells List", "/Neighbor Cells List", "Measured RSRP"},
            {"Measured Neighbor Cells", "/Measured Neighbor Cells", "Filtered RSRP"},
            {"Detected Cells", "/Detected Cells", ""}},
        .contexts = "/PDP Context Info/*",
    };
    return rows;
}

const ReportRows& gsm()
{
    static const ReportRows rows{
        .technologyName = "GSM/UMTS",
        .servingCells = {{"GSM serving cell",
                             {{"cell", "/Serving/GSM Serving Cell/Cell ID"},
                                 {"ARFCN", "/Serving/GSM Serving Cell/ARFCN"}},
                             {{"RSSI", {{"/Serving/GSM Serving Cell/RSSI"}}}}},
            {"UMTS serving cell",
                {{"cell", "/Serving/UMTS RR Info/Cell ID"},
                    {"UARFCN", "/Serving/UMTS RR Info/UARFCN", "/Serving/UMTS RR Info/Downlink Frequency"}},
                {}}},
        .states = {{"RR state", "/Serving/GSM RR Info/RR State"},
            {"RRC state", "/Serving/UMTS RR Info/RRC State"},
            {"MM state, circuit switched", "/Mobility/Process CS/MM State"},
            {"MM state, packet switched", "/Mobility/Process PS/MM State"},
            {"Packet data", "/Packet Data/PDP Context Info/*/State"}},
        .plots = {{"RSSI of the GSM serving cell", {{"/Serving/GSM Serving Cell/RSSI"}}},
            {"RSCP of the active set", {{"/Serving/Active Set/*/RSCP"}}},
            {"Ec/No of the active set", {{"/Serving/Active Set/*/Energy Per Chip"}}},
            {"UMTS transmit power", {{"/Serving/UMTS RR Info/Transmit Power"}}},
            {"Blocks received in error",
                {{"/Serving/BLER/Transport Channels/*/CRC Received in Error", kBare}}, true},
            {"RSSI of GSM neighbours", {{"/Neighbors/Neighboring Cells/*/RSSI"}}},
            {"RSSI of GSM neighbours, as reported without a unit",
                {{"/Neighbors/Neighboring Cells/*/RSSI", kBare}}},
            {"RSSI of ranked GSM neighbours", {{"/Neighbors/GSM Set/*/RSSI"}}},
            {"RSCP of UMTS neighbours", {{"/Neighbors/UMTS Set/*/RSCP"}}},
            {"Ec/No of UMTS neighbours", {{"/Neighbors/UMTS Set/*/Energy Per Chip"}}}},
        .neighbours = {{"Neighboring Cells", "/Neighbors/Neighboring Cells", "RSSI"},
            {"GSM Set", "/Neighbors/GSM Set", "RSSI"}, {"UMTS Set", "/Neighbors/UMTS Set", "RSCP"}},
        .contexts = "/Packet Data/PDP Context Info/*",
    };
    return rows;
}

const ReportRows& utran()
{
    static const ReportRows rows{
        .technologyName = "UTRAN",
        .servingCells = {{"Serving cell",
            {{"cell", "/Serving Cell Info/Cell ID"}, {"UARFCN", "/Serving Cell Info/Downlink UARFCN"}}, {}}},
        .states = {{"RRC state", "/RRC Info/State"}, {"Packet data", "/PDP Context Info/*/State"}},
        .plots = {{"Filter RSCP of neighbours", {{"/Neighbor Cell List/*/Filter RSCP", kBare}}},
            {"SIR", {{"/CCTRCH SIR/*/SIR/*", kBare}}},
            {"BLER", {{"/TRCH BLER/*/TRCH BLER Measurement", kBare}}, true}},
        .neighbours = {{"Neighbor Cell List", "/Neighbor Cell List", "Filter RSCP", kBare}},
        .contexts = "/PDP Context Info/*",
    };
    return rows;
}

const ReportRows& cdma()
{
    static const ReportRows rows{
        .technologyName = "CDMA2000",
        .servingCells = {{"1x serving cell",
                             {{"base station", "/1x System Identity/Base Station ID"},
                                 {"SID", "/1x System Identity/System ID"},
                                 {"NID", "/1x System Identity/Network ID"}},
                             {{"Rx0 AGC", {{"/1x Status/Rx0 AGC"}}}}},
            {"EV-DO serving sector",
                {{"PN", "/EV-DO Status/Serving PN Offset"}, {"channel", "/EV-DO Status/Channel"}},
                {{"Rx AGC 0", {{"/EV-DO Status/Rx AGC 0"}}}}}},
        .states = {{"1x state", "/1x Status/Device State"}, {"EV-DO state", "/EV-DO Status/Device State"},
            {"EV-DO session", "/EV-DO Session/Session State"}},
        .plots = {{"1x AGC", {{"/1x Status/Rx0 AGC"}, {"/1x Status/Rx1 AGC"}, {"/1x Status/Tx AGC"}}},
            {"1x traffic FER", {{"/1x Status/Traffic FER"}}, true},
            {"Ec/Io of 1x pilots", {{"/1x Active Set/Pilots/*"}}},
            {"EV-DO AGC", {{"/EV-DO Status/Rx AGC 0"}, {"/EV-DO Status/Rx AGC 1"}, {"/EV-DO Status/Tx AGC"}}},
            {"EV-DO rates", {{"/EV-DO Status/Forward Link Rate"}, {"/EV-DO Status/Reverse Link Rate"}}, true},
            {"Ec/Io of EV-DO pilots", {{"/EV-DO Active Set/Pilots/*"}}},
            {"C/I of EV-DO fingers", {{"/EV-DO Fingers/Carrier to Interference/*"}}}},
        .neighbours = {{"1x pilots", "/1x Active Set/Pilots", "*"},
            {"EV-DO pilots", "/EV-DO Active Set/Pilots", "*"}},
        .contexts = "",
    };
    return rows;
}

const ReportRows& ifx()
{
    static const ReportRows rows{
        .technologyName = "IFX",
        .servingCells = {{"Serving cell",
            {{"cell", "/Serving Cell/Cell"}, {"carrier", "/Serving Cell/Carrier"},
                {"", "/Serving Cell/Technology"}},
            {{"RSCP", {{"/Serving Cell/RSCP"}}}, {"EcN0", {{"/Serving Cell/EcN0"}}},
                {"RxLev", {{"/Serving Cell/RxLev"}}}}}},
        .states = {{"Radio resources", "/Radio Resources/State"}, {"MM", "/Mobility/State/MM"},
            {"GMM", "/Mobility/State/GMM"}, {"Packet data", "/Packet Data/*/Context/State"}},
        .plots = {{"Level of the serving cell", {{"/Serving Cell/RSCP"}, {"/Serving Cell/RxLev"}}},
            {"EcN0 of the serving cell", {{"/Serving Cell/EcN0"}}},
            {"Transmit power", {{"/Serving Cell/Transmit Power"}}},
            {"RSCP of UMTS neighbours", {{"/Neighbours/UMTS/*/RSCP"}}},
            {"EcN0 of UMTS neighbours", {{"/Neighbours/UMTS/*/EcN0"}}},
            {"RxLev of GSM neighbours", {{"/Neighbours/GSM/*/RxLev"}}},
            {"Frequency error", {{"/Timing/Frequency Error"}}}},
        .neighbours = {{"UMTS", "/Neighbours/UMTS", "RSCP"}, {"GSM", "/Neighbours/GSM", "RxLev"}},
        .contexts = "/Packet Data/*/Context",
    };
    return rows;
}

// "(ref pilot) -7.95 dB" without its remark.
std::string_view withoutRemark(std::string_view text)
{
    const std::size_t end = text.find(") ");
    return text.starts_with('(') && end != std::string_view::npos ? text.substr(end + 2) : text;
}

} // namespace

const ReportRows& reportRowsOf(std::string_view technology)
{
    const std::pair<std::string_view, const ReportRows& (*)()> tables[] = {
        {telephony::kTechnologyMRL_LTE, lte}, {telephony::kTechnologyMRL_GSM, gsm},
        {telephony::kTechnologyMRL_UTRAN2, utran}, {telephony::kTechnologyMRL_CDMA, cdma}};
    for (const auto& [name, rows] : tables) {
        if (name == technology)
            return rows();
    }
    return ifx();
}

bool matches(std::string_view pattern, std::string_view path)
{
    while (!pattern.empty() && !path.empty()) {
        const std::size_t patternEnd = pattern.find('/', 1);
        const std::size_t pathEnd = path.find('/', 1);
        const std::string_view component = pattern.substr(0, patternEnd);
        if (component != "/*" && component != path.substr(0, pathEnd))
            return false;
        pattern = patternEnd == std::string_view::npos ? "" : pattern.substr(patternEnd);
        path = pathEnd == std::string_view::npos ? "" : path.substr(pathEnd);
    }
    return pattern.empty() && path.empty();
}

bool isBlank(std::string_view text)
{
    return text.empty() || text == "N/A" || text == "—";
}

std::optional<SignalValue> signalValueOf(std::string_view text, SignalRow::Kind kind)
{
    if (kind == SignalRow::Kind::quantity) {
        const auto quantity = quantityOf(withoutRemark(text));
        return quantity ? std::optional(SignalValue{quantity->number, std::string(quantity->unit)})
                        : std::nullopt;
    }
    double number = 0;
    const auto [end, error] =
        std::from_chars(text.data(), text.data() + text.size(), number, std::chars_format::fixed);
    if (error != std::errc() || end != text.data() + text.size() || !std::isfinite(number))
        return std::nullopt;
    return SignalValue{number, ""};
}

} // namespace orvex

#include "WCDMATrafficReports.h"

#include <algorithm>
#include <cmath>

namespace orvex::korat {

namespace {
using Carriers = WCDMAHARQPacket::Carriers;
using Process = WCDMAHARQPacket::Process;
using State = WCDMARRCStatePacket::State;

constexpr int kStepsOfReport = 5;
constexpr int kSubframesOfReport = 250; // of 2 ms

constexpr std::size_t kProcesses = 8;      // a block each, in turn
constexpr std::size_t kMIMOProcesses = 16; // two blocks at a time take twice as many

// How much of what could be received is received: 0 in the worst radio conditions, 1 in the best.
double radioQuality(const WCDMALayer& layer)
{
    return std::clamp((layer.serving().ecNo + 20) / 15, 0.0, 1.0);
}

// The network changes the carriers during a transfer.
Carriers carriersAt(int stepInPhase)
{
    constexpr Carriers kOrder[] = {Carriers::single, Carriers::dual, Carriers::mimo};
    return kOrder[stepInPhase / 30 % 3];
}

void receive(std::vector<Process>& processes, std::size_t count, double quality, Randomness& randomness)
{
    while (processes.size() < count)
        processes.push_back({static_cast<int>(processes.size()), 0, 0, 0});
    for (Process& process : processes) {
        const int blocks = randomness.number(1, kSubframesOfReport / static_cast<int>(kProcesses));
        const int blockSize = static_cast<int>(std::lround(4000 + 16000 * quality));
        process.bits += std::int64_t{blocks} * blockSize;
        process.newBlocks += blocks;
        process.blockErrors += static_cast<int>(std::lround(blocks * 0.2 * randomness.share()));
    }
}
} // namespace

std::span<const LogCode> WCDMATrafficReports::codes() const
{
    static constexpr LogCode kCodes[] = {WCDMABlockErrorPacket::kCode, WCDMAHARQPacket::kCode};
    return kCodes;
}

void WCDMATrafficReports::report(const GSMTownMoment& moment, std::vector<LogMessage>& messages)
{
    if (moment.isPhaseStart() && moment.phase.rrc == State::connecting)
        startConnection();
    if (moment.phase.hasConnection() && moment.isEvery(10))
        reportTransportChannels(moment, messages);
    if (moment.phase.rrc == State::cellDCH && moment.isEvery(kStepsOfReport))
        reportHARQ(moment, messages);
}

void WCDMATrafficReports::startConnection()
{
    _channels.clear();
    _primary.clear();
    _secondary.clear();
}

void WCDMATrafficReports::reportTransportChannels(
    const GSMTownMoment& moment, std::vector<LogMessage>& messages)
{
    static constexpr struct {
        int identity;
        int blocksPerSecond;
    } kChannels[] = {{1, 25}, {2, 50}, {24, 100}}; // signalling, two of data
    constexpr std::size_t kSharedChannels = 1;     // without a dedicated channel, signalling alone

    const double errorRate = 0.1 * (1 - radioQuality(moment.wcdma));
    const bool isDedicated = moment.phase.rrc == State::cellDCH;
    const std::size_t count = isDedicated ? std::size(kChannels) : kSharedChannels;
    for (std::size_t i = 0; i < count; ++i) {
        if (_channels.size() == i)
            _channels.push_back({kChannels[i].identity, 0, 0});
        const int blocks = kChannels[i].blocksPerSecond - moment.randomness.number(0, 5);
        _channels[i].blocks += blocks;
        _channels[i].errors +=
            static_cast<int>(std::lround(blocks * errorRate * 2 * moment.randomness.share()));
    }
    WCDMABlockErrorPacket report{100, _channels};
    report.channels.resize(count);
    messages.push_back(report.message(moment.now));
}

void WCDMATrafficReports::reportHARQ(const GSMTownMoment& moment, std::vector<LogMessage>& messages)
{
    WCDMAHARQPacket report;
    report.subframes = moment.isPhaseStart() ? 0 : kSubframesOfReport;
    report.carriers = carriersAt(moment.stepInPhase);
    if (!moment.isPhaseStart()) { // the first report comes before the first block
        const double quality = radioQuality(moment.wcdma);
        const bool isMIMO = report.carriers == Carriers::mimo;
        receive(_primary, isMIMO ? kMIMOProcesses : kProcesses, quality, moment.randomness);
        report.primary = _primary;
        if (report.carriers == Carriers::dual) {
            receive(_secondary, kProcesses, quality, moment.randomness);
            report.secondary = _secondary;
        }
    }
    messages.push_back(report.message(moment.now));
}

} // namespace orvex::korat

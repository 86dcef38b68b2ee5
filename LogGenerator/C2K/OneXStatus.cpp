#include "C2K/OneXStatus.h"

#include "C2K/OneXTrafficFrames.h"
#include "EnumTable.h"
#include "RecordList.h"

#include <cmath>

namespace orvex {

std::optional<LogCode_0x119C_ActiveSet::Pilot> LogCode_0x119C_ActiveSet::pilot(int index) const
{
    if (index < 0 || index >= count())
        throw ArrayOutOfBoundsException();
    const auto fingers = static_cast<std::size_t>(field8(9));
    const std::size_t stride = (6 * fingers + 15) & 0xFFC;
    const std::size_t start = 12 + static_cast<std::size_t>(index) * stride;
    const auto pn = _subpacket.u16(start);
    const auto energy = _subpacket.u16(start + 12 + 4 * fingers);
    if (!pn || !energy)
        return std::nullopt;
    return Pilot{*pn, strengthOf(*energy)};
}

double LogCode_0x119C_ActiveSet::strengthOf(int energy) const
{
    const double m = field16(4);
    const double g = field8(6);
    const int exponent = 2 * field8(7) - 3;
    const double strength = std::ldexp(energy, exponent) / (9 * m * m * g) - 1 / m;
    return std::fmax(strength, kFloor); // also the floor for NaN, the result of a length of zero
}

namespace {

constexpr int kTraffic = 8;

constexpr EnumText kOneXStates[] = {
    {0, "Inactive [0]"},
    {1, "Deep sleep in start state [1]"},
    {2, "Initial state for CDMA operation [2]"},
    {3, "Acquisition [3]"},
    {4, "Sync [4]"},
    {5, "Slew [5]"},
    {6, "Paging [6]"},
    {7, "Slotted mode sleep state [7]"},
    {kTraffic, "Traffic [8]"},
    {9, "UnSlew [9]"},
    {10, "Operation in PCG state [10]"},
    {11, "Powerup state [11]"},
};

// Rows that have values only in traffic.
constexpr const char* kTrafficRows[] = {"k1xRx1BandClass", "k1xRx1ChanNum", "k1xRxAGC1", "k1xTxAGC"};

DeferredText deviceStateText(int state)
{
    return textOrNumberFor(state, kOneXStates, "[Bad Value %d]");
}

DeferredText channelText(int channel)
{
    return DeferredText("%d", channel);
}

DeferredText powerText(double dBm)
{
    return DeferredText("%+.2f dBm", dBm);
}

std::string referenceText(double strength)
{
    return "(ref pilot) " + decibelText(strength);
}

// A field that the packet does not hold leaves its row as it is.
template <typename Field>
void publishField(const Publisher& publisher, const char* internalKey, const std::optional<Field>& field,
    DeferredText (*textOf)(Field))
{
    if (field)
        publisher.publish(internalKey, textOf(*field));
}

void publishTrafficRows(const LogCode_0x119C::RF& rf, const Publisher& publisher)
{
    publishField(publisher, "k1xRx1BandClass", rf.rx1BandClass(), bandClassText);
    publishField(publisher, "k1xRx1ChanNum", rf.rx1Channel(), channelText);
    publishField(publisher, "k1xRxAGC1", rf.rx1AGC(), powerText);
    publishField(publisher, "k1xTxAGC", rf.txAGC(), powerText);
}

void publishActiveSet(const LogCode_0x119C_ActiveSet& set, const Publisher& publisher)
{
    if (!set.isReadable())
        return;
    PilotList pilots;
    for (int index = 0; index < set.count(); ++index) {
        const auto pilot = set.pilot(index);
        if (!pilot)
            break;
        const bool isReference = pilot->pn == set.referencePN();
        pilots.add(
            index, pilot->pn, DeferredText(isReference ? referenceText : decibelText, pilot->strength));
    }
    publisher.publish("k1xActiveSetInfo", pilots.rows());
}

} // namespace

void OneXStatus::decode(Packet packet, Dictionary& state, const Publisher& publisher)
{
    if (!hasMinimumLength<LogCode_0x119C>(packet))
        return;
    const LogCode_0x119C status(packet);
    const auto systemState = status.systemState();
    const auto rf = status.rf();
    const auto activeSet = status.activeSet();
    const auto fingerInfo = status.fingerInfo();
    if (!systemState || !rf || !activeSet || !fingerInfo) {
        systemLog(Priority::warning, "Log code 0x119c: missing subpacket (ss=%d,rf=%d,ai=%d,fi=%d).",
            systemState ? 1 : 0, rf ? 1 : 0, activeSet ? 1 : 0, fingerInfo ? 1 : 0);
        return;
    }
    const auto deviceState = LogCode_0x119C::SystemState(*systemState).deviceState();
    publishField(publisher, "k1xDeviceState", deviceState, deviceStateText);

    const LogCode_0x119C::RF radio(*rf);
    publishField(publisher, "k1xRx0BandClass", radio.rx0BandClass(), bandClassText);
    publishField(publisher, "k1xRx0ChanNum", radio.rx0Channel(), channelText);
    publishField(publisher, "k1xRxAGC0", radio.rx0AGC(), powerText);
    if (deviceState == kTraffic) {
        publishTrafficRows(radio, publisher);
    } else if (deviceState) {
        for (const char* row : kTrafficRows)
            publisher.publish(row, "N/A");
    }

    publishActiveSet(LogCode_0x119C_ActiveSet(*activeSet), publisher);
    if (deviceState && deviceState != kTraffic)
        TrafficFER(state, publisher).endTraffic();
}

} // namespace orvex

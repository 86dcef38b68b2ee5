#pragma once

#include "C2K/C2KLogGenerator.h"
#include "C2K/Publisher.h"

#include "FixedClock.h"
#include "FixedResources.h"
#include "LogPackets.h"
#include "SectionFixture.h"

namespace orvex::test {

// Every internal key that a decoder publishes.
inline const std::vector<const char*> kInternalKeys = {"kChannel", "k1xEVDODeviceState", "kBandClass",
    "kRxAGC0", "kRxAGC1", "kTxAGC", "kServingPNOffset", "kSessionState", "kUATI24", "kColorCode",
    "kActiveSetPilots", "kFingerC2I", "k1xDeviceState", "k1xRx0BandClass", "k1xRx0ChanNum", "k1xRxAGC0",
    "k1xRx1BandClass", "k1xRx1ChanNum", "k1xRxAGC1", "k1xTxAGC", "k1xActiveSetInfo", "k1xTrafficFER",
    "k1xRoamingHome", "kSystemId", "kNetworkId", "kPacketZoneId", "kBaseId", "kProtocolRevision",
    "kFLDataRate", "kRLDataRate"};

// The generator over a display that has a row for every internal key, under that key's name. Rows appear in
// the order in which they are first published.
class C2KFixture {
public:
    C2KFixture()
    {
        clear();
        log.take();
    }

    void clear()
    {
        display = Dictionary::make();
        _lookup = Dictionary::make();
        for (const char* key : kInternalKeys)
            Publisher::addRow(*_lookup, key, key, display);
    }
    void feed(const Bytes& packet) { generator.updateFromLog(packet, _lookup, state); }
    // Of this packet alone.
    RowTexts rowsAfter(const Bytes& packet)
    {
        clear();
        feed(packet);
        return rowsOf(display);
    }
    std::string textAfter(const Bytes& packet, const char* key) { return textOf(rowsAfter(packet), key); }
    RowTexts listAfter(const Bytes& packet, const char* key)
    {
        clear();
        feed(packet);
        return rowsOf((*display)[key].dictionary());
    }

    RecordingLog log;
    FixedResources resources;
    FixedClock clock;
    Dictionary state;
    DictionaryRef display;
    C2KLogGenerator generator{GeneratorEnvironment{resources, clock, {}}};

private:
    DictionaryRef _lookup;
};

// A subpacket with this body behind its header, and the size that it has, or another.
inline Bytes subpacket(std::uint8_t id, const Bytes& body, int size = -1)
{
    const auto length = static_cast<unsigned>(size < 0 ? static_cast<int>(body.size() + 4) : size);
    Bytes result = {id, 0xEE, static_cast<std::uint8_t>(length), static_cast<std::uint8_t>(length >> 8)};
    result.insert(result.end(), body.begin(), body.end());
    return result;
}

// A packet of subpackets with their count, or another.
inline Bytes packetOf(LogCode code, const std::vector<Bytes>& subpackets, int count = -1)
{
    Bytes payload = {
        0xEE, static_cast<std::uint8_t>(count < 0 ? static_cast<int>(subpackets.size()) : count), 0xEE, 0xEE};
    for (const Bytes& bytes : subpackets)
        payload.insert(payload.end(), bytes.begin(), bytes.end());
    return packet(code, payload);
}

} // namespace orvex::test

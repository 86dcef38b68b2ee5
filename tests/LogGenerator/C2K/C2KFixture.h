#pragma once

#include "C2K/C2KLogGenerator.h"
#include "C2K/Publisher.h"

#include "FixedClock.h"
#include "FixedResources.h"
#include "PacketText.h"
#include "RecordingLog.h"
#include "Shown.h"

#include <gtest/gtest.h>

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

    void clear() { showIn(Dictionary::make()); }
    void showIn(const DictionaryRef& rows)
    {
        display = rows;
        _lookup = Dictionary::make();
        for (const char* key : kInternalKeys)
            Publisher::addRow(*_lookup, key, key, display);
    }
    void feed(const Bytes& packet) { generator.updateFromLog(packet, _lookup, state); }
    // Of this packet alone, as packetOfText() reads it: all rows, or one.
    std::string shownAfter(const std::string& packet)
    {
        clear();
        feed(packetOfText(packet));
        return shown(*display);
    }
    std::string textAfter(const std::string& packet, const char* key)
    {
        shownAfter(packet);
        return display->contains(key) ? shown((*display)[key]) : "(absent)";
    }
    // What the log says of the packets since the last call.
    std::string linesNow()
    {
        std::string result;
        for (const std::string& line : log.take())
            result += line;
        return result;
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

} // namespace orvex::test

#pragma once

#include "AppPlatform.h"
#include "ConsoleOutput.h"

#include "FakeTelephony.h"
#include "FixedClock.h"
#include "FixedResources.h"
#include "ManualRunLoop.h"
#include "PacketText.h"

#include "Array.h"
#include "Dictionary.h"

#include <string>

namespace orvex::test {

// Records what is done to the preferences.
class RecordingPreferences final : public Preferences {
public:
    void setValue(const std::string& domain, const std::string& key, const Value& value) override
    {
        done += "set " + domain + ' ' + key + (value == Value(false) ? " false, " : " ?, ");
    }
    void synchronize(const std::string& domain) override { done += "synchronize " + domain + ", "; }
    void postChanged(const std::string& domain, const std::string& key) override
    {
        done += "changed " + domain + ' ' + key;
    }

    std::string done;
};

class RecordingOutput final : public ConsoleOutput {
public:
    void write(std::string_view text) override { _written += text; }
    std::optional<TerminalSize> terminalSize() const override { return size; }
    // What was written since the last call.
    std::string take() { return std::exchange(_written, {}); }

    std::optional<TerminalSize> size;

private:
    std::string _written;
};

constexpr const char* kHomeScreenWrite = "set org.orvex.HomeScreen HXShowGSMRSSI false, synchronize "
                                         "org.orvex.HomeScreen, changed org.orvex.HomeScreen HXShowGSMRSSI";

// A platform whose session decodes LTE packets.
struct SessionFixture {
    SessionFixture()
    {
        resources.templates["LTE"] = Dictionary::make({
            {"Neighbor Measurements", Dictionary::make({{"Version", "-"}, {"E-ARFCN", "-"}})},
            {"Neighbor Cells List", Array::make()},
        });
    }

    AppPlatform platform()
    {
        return {.session = {.runLoop = runLoop,
                    .ports = telephony,
                    .telephony = telephony,
                    .generators = {.resources = resources, .clock = clock, .buildVersion = {}}},
            .preferences = preferences};
    }

    // An idle-mode neighbour report on frequency 6300.
    void deliverNeighbors(std::size_t count)
    {
        Bytes payload = {0x03, 0, 0, 0, 0x9C, 0x18, 0xC0, 0x07};
        payload.resize(payload.size() + 20 * count, 0x55);
        telephony.deliver(packet(0xB180, payload));
    }
    // One refresh of the session.
    void refresh() { runLoop.advance(std::chrono::seconds(2)); }
    // The service has gone and is still absent at the next look-up.
    void loseService()
    {
        telephony.serviceIsAbsent = true;
        telephony.remotePort->valid = false;
    }

    ManualRunLoop runLoop;
    FakeTelephony telephony;
    FixedResources resources;
    FixedClock clock;
    RecordingPreferences preferences;
};

} // namespace orvex::test

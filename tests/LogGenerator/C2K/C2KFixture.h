#pragma once

#include "C2K/C2KLogGenerator.h"
#include "C2K/Publisher.h"

#include "FileStorage.h"
#include "GeneratorFixture.h"
#include "PacketText.h"

namespace orvex::test {

// The generator of CDMA2000 over a display that has a row for every internal key, under that key's name. Rows
// appear in the order in which they are first published.
class C2KFixture {
public:
    C2KFixture()
    {
        const RecordingLog log; // a line for each dictionary
        Dictionary keys;        // every key that the template names
        const auto laidOut = resources.dictionaryNamed("C2KTemplate").dictionary;
        C2KLogGenerator::processTemplate(*laidOut, Dictionary::make(), keys);
        for (const auto& [key, rows] : keys)
            Publisher::addRow(*_lookup, key, key, display);
    }
    void feed(const Bytes& packet) { generator.updateFromLog(packet, _lookup, state); }

    FixedClock clock;
    Dictionary state;
    DictionaryRef display = Dictionary::make();
    FileResources resources{ORVEX_RESOURCES};
    C2KLogGenerator generator{GeneratorEnvironment{resources, clock, {}}};

private:
    DictionaryRef _lookup = Dictionary::make();
};

} // namespace orvex::test

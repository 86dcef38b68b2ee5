#pragma once

#include "C2K/C2KLogGenerator.h"
#include "C2K/Publisher.h"

#include "FileStorage.h"
#include "FixedClock.h"
#include "FixedResources.h"
#include "PacketText.h"
#include "RecordingLog.h"
#include "Shown.h"

#include <gtest/gtest.h>

namespace orvex::test {

// Every internal key that the template names, as the keys of a lookup.
inline const Dictionary& internalKeys()
{
    static const DictionaryRef kLookup = [] {
        auto lookup = Dictionary::make();
        C2KLogGenerator::processTemplate(
            *FileResources(ORVEX_SOURCE_DIR "/resources").dictionaryNamed("C2KTemplate").dictionary,
            Dictionary::make(), *lookup);
        return lookup;
    }();
    return *kLookup;
}

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
    void showIn(const DictionaryRef& container)
    {
        display = container;
        _lookup = Dictionary::make();
        for (const auto& [key, rows] : internalKeys())
            Publisher::addRow(*_lookup, key, key, display);
    }
    void feed(const Bytes& packet) { generator.updateFromLog(packet, _lookup, state); }
    // What this packet alone, as packetOfText() reads it, shows: all rows, or one.
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
    // The log lines since the last call, joined.
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

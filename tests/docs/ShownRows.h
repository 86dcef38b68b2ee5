#pragma once

#include "Captures.h"
#include "FixedClock.h"
#include "FixedResources.h"

#include "Array.h"
#include "Dictionary.h"
#include "FileStorage.h"
#include "LogGenerator.h"
#include "MessageFrame.h"
#include "SystemLog.h"

#include <algorithm>
#include <functional>
#include <map>
#include <memory>
#include <random>
#include <string>
#include <vector>

namespace orvex::test {

using Rows = std::map<std::string, std::string>; // texts by path
using Packets = std::vector<Bytes>;

inline void collect(const Value& value, const std::string& path, Rows& rows)
{
    if (const std::string* text = value.string())
        rows[path] = *text;
    if (const DictionaryRef dictionary = value.dictionary()) {
        for (const auto& [key, child] : *dictionary) {
            if (key == "_sorted")
                continue;
            const std::size_t semicolon = key.find(';'); // INDEX;PN, a pilot
            const std::string below = (path.empty() ? "" : path + " / ") + key.substr(0, semicolon);
            if (semicolon != std::string::npos)
                rows[below + " / PN"] = key.substr(semicolon + 1);
            collect(child, below, rows);
        }
    }
    if (const ArrayRef array = value.array()) {
        for (std::size_t i = 0; i < array->size(); ++i)
            collect((*array)[i], path + " / " + std::to_string(i), rows);
    }
}

// A technology's generator with its template, and the packets of its capture.
class Technology {
public:
    explicit Technology(std::string name)
        : _name(std::move(name))
    {
        installConsole([](std::string_view) {}); // some sections write a line for every packet
        const FileResources files(ORVEX_RESOURCES);
        for (const char* resource : {"C2KTemplate", "LTE", "MRL_GSM", "MRL_UTRAN2"})
            _resources.templates[resource] = files.dictionaryNamed(resource).dictionary;
    }
    ~Technology() { installConsole({}); }
    Technology(const Technology&) = delete;
    Technology& operator=(const Technology&) = delete;

    std::unique_ptr<LogGenerator> generator() const
    {
        return LogGenerator::generatorFromTechnology(_name, {_resources, _clock, {}, 0});
    }
    Rows shownBy(const Packets& packets) const
    {
        Dictionary state;
        const auto decoder = generator();
        for (const Bytes& packet : packets)
            decoder->updateState(state, packet);
        Rows rows;
        collect(state["Display"], "", rows);
        return rows;
    }

    // Packets of the code to write into: from the capture, and some of them with other bytes here and there.
    Packets packetsOf(LogCode code) const
    {
        constexpr std::size_t kOfCapture = 4;
        Packets found;
        for (const Bytes& message : captureOf(_name)) {
            const MessageFrame frame(message);
            if (frame.logCode() == code)
                found.emplace_back(frame.packet().begin(), frame.packet().end());
        }
        std::ranges::stable_sort(found, std::greater(), &Bytes::size);
        const std::size_t taken = std::min(kOfCapture, found.size());
        Packets packets;
        for (std::size_t i = 0; i < taken; ++i) {
            Bytes packet = found[i * found.size() / taken];
            packets.push_back(packet);
            if (i % 3 != 0)
                continue;
            for (std::size_t byte = kPacketHeaderLength; byte < packet.size(); ++byte) {
                if (random() % 4 == 0)
                    packet[byte] = static_cast<std::uint8_t>(random());
            }
            packets.push_back(packet);
        }
        return packets;
    }

    std::uint64_t random() const { return _random(); }

private:
    std::string _name;
    FixedResources _resources;
    FixedClock _clock;
    mutable std::mt19937_64 _random{1}; // the same packets every time
};

} // namespace orvex::test

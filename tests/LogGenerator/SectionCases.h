#pragma once

#include "PacketText.h"
#include "RecordingLog.h"
#include "Shown.h"

#include "ClassIndex.h"
#include "SystemLog.h"

#include <gtest/gtest.h>

#include <cxxabi.h>

#include <map>
#include <memory>

namespace orvex::test {

// Packets for one section, and what it shows in the end: its rows, or the records of its list. Several
// packets, as packetOfText() reads them, are separated by ";".
struct SectionCase {
    const char* section;
    std::string packets;
    std::string shown;       // "#3": three records, whatever they say
    const char* errors = ""; // log lines at error priority, one after the other
};

// The text of one row for each value of one byte: "A|B|7=C" gives those of 0, 1 and 7; all other values
// show the fallback.
struct ValueTexts {
    const char* section;
    LogCode code;
    std::size_t offset;
    const char* row;
    const char* texts;
    const char* fallback = "Unknown";
};

// Feeds the packets into a container and returns the error lines.
inline std::string feed(Base& section, const Value& container, const std::vector<Bytes>& packets)
{
    section.updateSectionRef(container);
    const RecordingLog log;
    for (const Bytes& packet : packets)
        section.updateWithData(packet, (packet[0] == 255 ? kExtraCodeBase : 0) + PacketReader(packet).u16(3));
    std::string errors;
    for (const std::string& line : log.lines)
        errors += line.starts_with("<3>") ? line.substr(3) : "";
    return errors;
}

struct Outcome {
    std::string shown;
    std::string errors;
    std::size_t records; // of a list
};

// The rows that a section writes, or its list when it writes no rows.
inline Outcome outcomeOf(Base& section, const std::vector<Bytes>& packets)
try {
    const auto list = Array::make({"stale"});
    feed(section, list, packets);
    const auto rows = Dictionary::make();
    const std::string errors = feed(section, rows, packets);
    if (!rows->isEmpty())
        return {shown(*rows), errors, 0};
    const bool isLeftAlone = *list == Array({"stale"});
    return {isLeftAlone ? "(nothing)" : list->isEmpty() ? "(empty)" : shown(*list), errors, list->size()};
} catch (...) {
    const std::unique_ptr<char, void (*)(void*)> type(
        abi::__cxa_demangle(abi::__cxa_current_exception_type()->name(), nullptr, nullptr, nullptr),
        std::free);
    return {std::string("throws ") + type.get(), "", 0};
}

// Keeps the sections' console lines out of the test output.
struct QuietConsole {
    QuietConsole()
    {
        installConsole([](std::string_view) {});
    }
    ~QuietConsole() { installConsole({}); }
    QuietConsole(const QuietConsole&) = delete;
    QuietConsole& operator=(const QuietConsole&) = delete;
};

template <typename Index>
void expectShown(const std::vector<SectionCase>& cases)
{
    const QuietConsole quiet;
    for (const auto& [name, texts, expected, expectedErrors] : cases) {
        SCOPED_TRACE(text("%s, %.200s", name, texts.c_str()));
        const Index index; // a new one, as sections remember things
        ASSERT_NE(index.getClass(name), nullptr);
        std::vector<Bytes> packets;
        std::istringstream stream(texts);
        for (std::string packet; std::getline(stream, packet, ';');)
            packets.push_back(packetOfText(packet));
        const auto [shown, errors, records] = outcomeOf(*index.getClass(name), packets);
        EXPECT_EQ(expected[0] == '#' ? "#" + std::to_string(records) : shown, expected);
        EXPECT_EQ(errors, expectedErrors);
    }
}

template <typename Index>
void expectTexts(const std::vector<ValueTexts>& cases)
{
    const QuietConsole quiet;
    const Index index;
    for (const auto& [name, code, offset, row, texts, fallback] : cases) {
        std::map<int, std::string> textsByValue;
        int next = 0;
        std::istringstream stream(texts);
        for (std::string text; std::getline(stream, text, '|'); ++next) {
            if (const auto equals = text.find('='); equals != std::string::npos) {
                next = std::stoi(text);
                text.erase(0, equals + 1);
            }
            textsByValue[next] = text;
        }
        for (int value = 0; value < 256; ++value) {
            Bytes bytes = packet(code, Bytes(40, 0xEE));
            bytes[offset] = static_cast<std::uint8_t>(value);
            const auto rows = Dictionary::make();
            feed(*index.getClass(name), rows, {bytes});
            const auto text = textsByValue.find(value);
            EXPECT_EQ((*rows)[row], Value(text == textsByValue.end() ? fallback : text->second))
                << name << ", " << row << ' ' << value;
        }
    }
}

} // namespace orvex::test

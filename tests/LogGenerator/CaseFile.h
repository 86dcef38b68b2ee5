#pragma once

#include "CaseLines.h"
#include "PacketText.h"

#include <map>
#include <tuple>

namespace orvex::test {

// "[NAME] CODE/MINIMUM CODE ... | ENTRY LINE | other codes": a section, its codes in order, the length below
// which their packets change nothing, the line that it logs for every packet, and that it reports others.
struct SectionPlan {
    explicit SectionPlan(const std::string& heading)
    {
        std::string rest;
        std::tie(name, rest) = divided(heading.substr(1), "]");
        const auto [codeWords, lines] = divided(rest, " | ");
        std::tie(entryLine, otherCodes) = divided(lines, " | ");
        std::istringstream words(codeWords);
        for (std::string word; words >> word;) {
            const auto [code, length] = divided(word, "/");
            codes.push_back(static_cast<LogCode>(std::stol(code, nullptr, 16)));
            minimumLengths.push_back(length.empty() ? 0 : std::stoul(length));
        }
    }

    std::string name;
    std::vector<LogCode> codes;
    std::vector<std::size_t> minimumLengths; // 0: never refused for its length
    std::string entryLine;
    std::string otherCodes;
};

// "PACKETS -> SHOWN" or "PACKETS -> SHOWN !! LOG". Several packets, as packetOfText() reads them, are
// separated by ";"; "7 x PACKET" is as many.
struct PacketCase {
    explicit PacketCase(const std::string& line)
    {
        const auto [texts, outcome] = divided(line, " -> ");
        std::istringstream stream(texts);
        for (std::string text; std::getline(stream, text, ';');)
            add(divided(text, " x "));
        std::tie(shown, log) = divided(outcome, " !! ");
    }

    void add(const std::pair<std::string, std::string>& text)
    {
        const auto& [first, repeated] = text;
        const std::size_t times = repeated.empty() ? 1 : std::stoul(first);
        packets.insert(packets.end(), times, packetOfText(repeated.empty() ? first : repeated));
    }

    std::vector<Bytes> packets;
    std::string shown; // after "…" only a part of it
    std::string log;   // all lines with their priorities, or the texts of the errors alone
};

// "PACKET => ROW: A|B|7=C else D": the text of a row for each value of the byte "??" of a packet, here of 0,
// 1, 7 and of all the others, for which "%d" stands for the value.
struct TextsCase {
    explicit TextsCase(const std::string& line)
    {
        const auto [packetText, rest] = divided(line, " => ");
        const auto [rowName, choice] = divided(rest, ": ");
        const auto [named, others] = divided(choice, " else ");
        std::tie(packet, row, fallback) = std::tie(packetText, rowName, others);
        std::istringstream stream(named);
        int next = 0;
        for (std::string entry; std::getline(stream, entry, '|'); ++next) {
            if (const auto [number, text] = divided(entry, "="); !text.empty()) {
                next = std::stoi(number);
                entry = text;
            }
            texts[next] = entry;
        }
    }

    Bytes packetWith(int value) const
    {
        return packetOfText(std::regex_replace(packet, std::regex(R"(\?\?)"), text("%02X", value)));
    }
    std::string textFor(int value) const
    {
        const auto found = texts.find(value);
        if (found != texts.end())
            return found->second;
        return std::regex_replace(fallback, std::regex("%d"), std::to_string(value));
    }

    std::string packet;
    std::string row;
    std::map<int, std::string> texts;
    std::string fallback;
};

} // namespace orvex::test

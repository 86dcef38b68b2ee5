#pragma once

#include "PacketText.h"

#include <fstream>
#include <map>
#include <regex>
#include <tuple>

namespace orvex::test {

// What stands before and after the separator; all of the text and nothing where there is none.
inline std::pair<std::string, std::string> divided(const std::string& text, std::string_view separator)
{
    const auto place = text.find(separator);
    if (place == std::string::npos)
        return {text, ""};
    return {text.substr(0, place), text.substr(place + separator.size())};
}

// The lines of cases/NAME.txt. Those that begin with "#" are comments, indented ones continue the line before
// them, and "\n" stands for a line break.
inline std::vector<std::string> caseLines(const std::string& name)
{
    static const std::regex kLineBreak(R"(\\n)");
    std::ifstream file(ORVEX_SOURCE_DIR "/tests/LogGenerator/cases/" + name + ".txt");
    std::vector<std::string> lines;
    for (std::string line; std::getline(file, line);) {
        if (line.empty() || line[0] == '#')
            continue;
        line = std::regex_replace(line, kLineBreak, "\n");
        if (line[0] == ' ')
            lines.back() += line.substr(line.find_first_not_of(' ') - 1);
        else
            lines.push_back(line);
    }
    if (lines.empty())
        throw std::runtime_error(name + ".txt: no cases");
    return lines;
}

// "PACKETS -> SHOWN" or "PACKETS -> SHOWN !! LOG". Several packets, as packetOfText() reads them, are
// separated by ";".
struct PacketCase {
    explicit PacketCase(const std::string& line)
    {
        const auto [texts, outcome] = divided(line, " -> ");
        std::istringstream stream(texts);
        for (std::string text; std::getline(stream, text, ';');)
            packets.push_back(packetOfText(text));
        std::tie(shown, log) = divided(outcome, " !! ");
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

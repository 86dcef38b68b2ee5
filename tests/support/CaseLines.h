#pragma once

#include <fstream>
#include <regex>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace orvex::test {

// What stands before and after the separator; all of the text and nothing where there is none.
inline std::pair<std::string, std::string> divided(const std::string& text, std::string_view separator)
{
    const auto place = text.find(separator);
    if (place == std::string::npos)
        return {text, ""};
    return {text.substr(0, place), text.substr(place + separator.size())};
}

// The lines of a file of cases in tests/. Those that begin with "#" are comments, indented ones continue the
// line before them, and "\n" stands for a line break.
inline std::vector<std::string> caseLines(const std::string& path)
{
    static const std::regex kLineBreak(R"(\\n)");
    std::ifstream file(ORVEX_TESTS "/" + path);
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
        throw std::runtime_error(path + ": no cases");
    return lines;
}

} // namespace orvex::test

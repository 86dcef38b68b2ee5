// orvex-decode --timeline against the tree; transcripts/timeline.txt has the rest.

#include "Captures.h"
#include "DecodeProgram.h"

#include <nlohmann/json.hpp>

#include <map>
#include <regex>
#include <set>

namespace orvex::test {
namespace {

using Rows = std::multiset<std::string>; // "path=text", with "*" for numbers

void addRows(const nlohmann::json& node, Rows& rows)
{
    static const std::regex kNumbers("/[0-9]+(?=/|$)");
    if (node.contains("value"))
        rows.insert(std::regex_replace(node["path"].get<std::string>(), kNumbers, "/*") + '='
            + node["value"].get<std::string>());
    for (const auto& child : node.value("children", nlohmann::json::array()))
        addRows(child, rows);
}

TEST_F(DecodeProgram, TimelineEndsWithTheRowsOfTheTree)
{
    for (const std::string technology : kTechnologies) {
        const QString capture = QString::fromStdString(capturePath(technology));
        ASSERT_EQ(decode({"--timeline", name("out.csv"), "--every", "0.7", capture}).status, 0);
        std::map<std::pair<std::string, std::string>, std::optional<std::string>> last;
        for (const auto& record : recordsOf(contentsOf("out.csv")))
            last[{record.at(1).value(), record.at(2).value_or("")}] = record.at(3);
        Rows shown;
        for (const auto& [row, text] : last) {
            if (text)
                shown.insert(row.first + '=' + *text);
        }
        Rows tree;
        addRows(nlohmann::json::parse(decode({"--format", "json", capture}).output)["tree"], tree);
        EXPECT_EQ(shown, tree) << technology;
        EXPECT_GT(last.size(), tree.size()) << technology;
    }
}

} // namespace
} // namespace orvex::test

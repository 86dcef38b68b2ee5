// orvex-decode --report: the data of the page, against the table of --timeline.

#include "Captures.h"
#include "DecodeProgram.h"

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

#include <cstdlib>
#include <filesystem>
#include <map>
#include <regex>

namespace orvex::test {
namespace {

using nlohmann::json;
using testing::HasSubstr;
using testing::Not;

// What a row showed when, as milliseconds since 1970 and text, number and unit.
struct Change {
    std::int64_t time;
    std::string text;
    std::string number;
};
using Rows = std::map<std::pair<std::string, std::string>, std::vector<Change>>;
using Points = std::vector<std::pair<std::int64_t, std::optional<double>>>;

std::int64_t millisecondsOf(const std::string& timestamp)
{
    std::tm parts{};
    ::strptime(timestamp.c_str(), "%Y-%m-%dT%H:%M:%S", &parts);
    return std::int64_t{::timegm(&parts)} * 1000 + std::stoi(timestamp.substr(20, 3));
}

Rows rowsOf(const std::string& csv)
{
    Rows rows;
    for (const auto& record : recordsOf(csv)) {
        rows[{record.at(1).value(), record.at(2).value_or("")}].push_back(
            {millisecondsOf(record.at(0).value()), record.at(3).value_or(""), record.at(4).value_or("")});
    }
    return rows;
}

// In a plot without a unit, a bare number. Else the number of the table, which has none after a remark.
std::optional<double> numberOf(const Change& change, bool hasUnit)
{
    static const std::regex bare(R"(-?\d+(\.\d+)?)");
    static const std::regex remarked(R"(\([^)]*\) ([-+]?\d+\.\d+) dB)");
    std::smatch match;
    if (!hasUnit)
        return std::regex_match(change.text, bare) ? std::optional(std::stod(change.text)) : std::nullopt;
    if (std::regex_match(change.text, match, remarked))
        return std::stod(match[1]);
    return change.number.empty() ? std::nullopt : std::optional(std::stod(change.number));
}

// Without what says again that there is no number.
Points pointsOf(const std::vector<Change>& changes, bool hasUnit)
{
    Points points;
    for (const Change& change : changes) {
        const auto number = numberOf(change, hasUnit);
        if (number || (!points.empty() && points.back().second))
            points.emplace_back(change.time, number);
    }
    return points;
}

// Of a line of the page, in the capture's own time.
Points pointsOf(const json& line, const json& shifts)
{
    Points points;
    std::int64_t position = 0;
    for (std::size_t i = 0; i < line["steps"].size(); ++i) {
        position += line["steps"][i].get<std::int64_t>();
        std::int64_t shift = 0;
        for (const json& entry : shifts)
            shift = entry[0] <= position ? entry[1].get<std::int64_t>() : shift;
        const json& number = line["numbers"][i];
        points.emplace_back(
            position - shift, number.is_null() ? std::nullopt : std::optional<double>(number));
    }
    return points;
}

Bytes propertyList(const std::string& entries)
{
    const std::string list = "<plist><dict>" + entries + "</dict></plist>";
    return {list.begin(), list.end()};
}

class ReportTest : public DecodeProgram {
protected:
    Result report(const QString& input, const QStringList& arguments = {}) const
    {
        return decode(
            QStringList{"--report", name("out.html"), "--timeline", name("out.csv"), input} << arguments);
    }
    json data() const
    {
        const std::string page = contentsOf("out.html");
        const std::string begin = "id=\"data\">";
        const auto first = page.find(begin) + begin.size();
        return json::parse(page.substr(first, page.find("</script>", first) - first));
    }
    // Compares every line of every plot, and returns how many there are.
    std::size_t comparePlots() const
    {
        const json page = data();
        const Rows rows = rowsOf(contentsOf("out.csv"));
        std::size_t count = 0;
        for (const json& plot : page["plots"]) {
            const std::string unit = plot["unit"];
            for (const json& line : plot["lines"]) {
                const auto row = rows.find({line["path"], line["key"]});
                if (row == rows.end()) {
                    ADD_FAILURE() << line["path"] << line["key"];
                    continue;
                }
                EXPECT_EQ(pointsOf(line, page["shifts"]), pointsOf(row->second, !unit.empty()))
                    << line["path"] << line["key"];
                ++count;
            }
        }
        return count;
    }
    QString serving(const char* file, const std::vector<int>& seconds) const
    {
        PcapWriter writer(path(file));
        for (std::size_t i = 0; i < seconds.size(); ++i)
            writer.write(
                propertyList("<key>Serving Cell</key><dict><key>RSCP</key><string>-" + std::to_string(60 + i)
                    + " dBm</string><key>Cell</key><string>1</string></dict>"),
                kTime + std::chrono::seconds(seconds[i]));
        return name(file);
    }
};

TEST_F(ReportTest, PlotsTheNumbersOfTheTimeline)
{
    // A row that the templates no longer have would leave its line, plot, band or list out.
    const struct {
        const char* technology;
        std::size_t lines, plots, bands, lists, contexts;
    } cases[] = {{"MRL_LTE", 297, 8, 3, 3, 2}, {"MRL_GSM", 265, 10, 8, 3, 2}, {"MRL_UTRAN2", 177, 3, 4, 1, 2},
        {"MRL_CDMA", 53, 7, 5, 2, 0}, {"IFX", 29, 7, 6, 2, 2}};
    for (const auto& [technology, lines, plots, bands, lists, contexts] : cases) {
        const Result result = report(QString::fromStdString(capturePath(technology)));
        EXPECT_EQ(result.status, 0);
        EXPECT_EQ(result.errors, "");
        EXPECT_EQ(comparePlots(), lines) << technology;
        const json page = data();
        EXPECT_EQ(page["plots"].size(), plots) << technology;
        EXPECT_EQ(page["bands"].size(), bands) << technology;
        EXPECT_EQ(page["contexts"]["rows"].size(), contexts) << technology;
        std::size_t shownLists = 0;
        for (const json& list : page["neighbours"])
            shownLists += list["cells"].empty() ? 0U : 1U;
        EXPECT_EQ(shownLists, lists) << technology;
        for (const json& group : page["servingCells"])
            EXPECT_GT(group["cells"].size(), 1) << technology;
    }
}

TEST_F(ReportTest, NamesNoAddressAndKeepsHostileTextsTexts)
{
    const std::string hostile = "</script><img src=x onerror=alert(1)><!--<script>&amp;";
    std::string escaped = std::regex_replace(hostile, std::regex("&"), "&amp;");
    escaped = std::regex_replace(escaped, std::regex("<"), "&lt;");
    const auto list =
        propertyList("<key>Packet Data</key><array><string>0</string><dict><key>Context</key><dict>"
                     "<key>Context ID</key><string>5</string><key>APN</key><string>"
            + escaped + "</string></dict><key>x</key><string>" + escaped + "</string></dict></array>");
    ASSERT_EQ(report(capture("<b>&.pcap", {list})).status, 0);
    const json page = data();
    EXPECT_EQ(page["name"], "<b>&.pcap");
    EXPECT_EQ(page["contexts"]["rows"].at(0)["texts"][2], hostile);
    EXPECT_THAT(page["tree"].dump(), HasSubstr("onerror"));

    const std::string html = contentsOf("out.html");
    const std::regex scriptEnds("</script", std::regex::icase);
    using Matches = std::sregex_iterator;
    EXPECT_EQ(std::distance(Matches(html.begin(), html.end(), scriptEnds), Matches()), 3);
    EXPECT_THAT(html, Not(HasSubstr("<img")));
    EXPECT_THAT(html, Not(HasSubstr("://")));
    EXPECT_FALSE(
        std::regex_search(html, std::regex(R"(<(link|iframe|object|embed|base)\b|<script[^>]*\bsrc)")));
    EXPECT_THAT(html, HasSubstr("content=\"default-src 'none'; script-src 'sha256-"));
    EXPECT_THAT(html, HasSubstr("Permission is hereby granted")); // the licence of the library
}

TEST_F(ReportTest, FollowsAClockThatIsSetBackAndShowsWhatCanBeRead)
{
    const QString back = serving("back.pcap", {3000, 3004, 3008, 0, 2, 4, 1, 9});
    const Result set = report(back);
    EXPECT_EQ(set.status, 0);
    EXPECT_EQ(std::ranges::count(set.errors, '\n'), 1) << set.errors;
    EXPECT_EQ(comparePlots(), 1);
    EXPECT_EQ(data()["shifts"].size(), 2);
    EXPECT_THAT(data()["notes"].at(0), HasSubstr("the clock goes back by"));

    std::filesystem::resize_file(path("back.pcap"), std::filesystem::file_size(path("back.pcap")) - 5);
    const Result cut = report(back, {"--quiet"});
    EXPECT_EQ(cut.status, 1);
    EXPECT_THAT(cut.errors, HasSubstr("(after 7 whole messages)\n"));
    EXPECT_EQ(data()["messages"], 7);
}

} // namespace
} // namespace orvex::test

// orvex-decode --timeline: when the display is sampled, and what becomes of the file when something goes
// wrong.

#include "Captures.h"
#include "DecodeProgram.h"

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

#include <algorithm>
#include <cstdint>
#include <filesystem>
#include <map>
#include <regex>
#include <set>
#include <sstream>
#include <utility>

namespace orvex::test {
namespace {

using std::chrono::milliseconds;
using testing::HasSubstr;

// A display of IFX with one row that changes.
Bytes level(int number)
{
    const std::string list = "<plist><dict><key>Level</key><string>" + std::to_string(number)
        + " dBm</string><key>Cell</key><string></string></dict></plist>";
    return {list.begin(), list.end()};
}

class TimelineTest : public DecodeProgram {
protected:
    // Messages at these times after kTime, with the levels 0, 1, 2, …
    QString levels(const char* file, const std::vector<milliseconds>& times) const
    {
        PcapWriter writer(path(file));
        for (std::size_t i = 0; i < times.size(); ++i)
            writer.write(level(static_cast<int>(i)), kTime + times[i]);
        return name(file);
    }
    Result timeline(const QString& input, QStringList arguments = {}) const
    {
        return decode(QStringList{"--technology", "IFX", "--timeline", name("out.csv"), input} << arguments);
    }
    // The levels in the table: "13:20 3" for 22:13:20.654 and "3 dBm".
    std::string sampled() const
    {
        std::istringstream lines(contentsOf("out.csv"));
        std::string result;
        for (std::string line; std::getline(lines, line);) {
            if (const auto row = line.find(",/Level,,"); row != std::string::npos)
                result += line.substr(14, 9) + ' ' + line.substr(row + 9, 1) + '\n';
        }
        return result;
    }
};

TEST_F(TimelineTest, SamplesByTheClockOfTheCapture)
{
    const struct {
        const char* name;
        std::vector<std::int64_t> times; // milliseconds
        QStringList arguments;
        const char* levels;
        const char* note;
    } cases[] = {
        {"before the message at the tick, and at the end", {0, 1999, 2000, 3000}, {},
            "13:22.654 1\n13:23.654 3\n", ""},
        {"a gap takes no samples, ticks keep their step", {0, 6500, 7900, 8000}, {},
            "13:22.654 0\n13:28.654 2\n13:28.654 3\n", ""},
        {"as often as wanted", {0, 100, 250, 300}, {"--every", "0.1"},
            "13:20.754 0\n13:20.854 1\n13:20.954 2\n13:20.954 3\n", ""},
        {"messages a little late", {0, 1500, 600}, {}, "13:22.154 2\n", ""},
        {"the clock set back, twice", {3000, 4000, 0, 2500, 100, 200}, {},
            "13:24.654 1\n13:22.654 2\n13:23.154 3\n13:20.854 5\n",
            "the clock goes back by 4.000 s at message 3, and 1 times after that; times are as captured"},
        {"messages without a time", {-1'700'000'000'000, 0, 2000, -1'700'000'000'000}, {},
            "13:22.654 1\n13:22.654 3\n", ""},
    };
    for (const auto& [name, times, arguments, levels, note] : cases) {
        const QString capture = this->levels("in.pcap", {times.begin(), times.end()});
        const Result result = timeline(capture, arguments);
        EXPECT_EQ(result.status, 0) << name << result.errors;
        EXPECT_EQ(sampled(), levels) << name;
        EXPECT_EQ(result.errors, *note ? "orvex-decode: " + capture.toStdString() + ": " + note + "\n" : "")
            << name;
    }
    EXPECT_THAT(contentsOf("out.csv"),
        testing::StartsWith("time,path,key,text,number,unit\r\n"
                            "2023-11-14T22:13:22.654Z,/Level,,1 dBm,1,dBm\r\n"
                            "2023-11-14T22:13:22.654Z,/Cell,,\"\",,\r\n"));
}

TEST_F(TimelineTest, FailsInOneLineAndLeavesNothingHalfWritten)
{
    const QString good = levels("good.pcap", {milliseconds(0), milliseconds(3000)});
    const QString drive = QString::fromStdString(capturePath("MRL_LTE"));
    const QString undated = levels("undated.pcap", {milliseconds(-1'700'000'000'000)});
    std::filesystem::copy_file(path("good.pcap"), path("cut.pcap"));
    std::filesystem::resize_file(path("cut.pcap"), std::filesystem::file_size(path("cut.pcap")) - 5);
    std::filesystem::create_directory(path("folder"));
    const auto files = [this] {
        using Entries = std::filesystem::directory_iterator;
        return std::distance(Entries(path("")), Entries());
    };

    const struct {
        const char* name;
        const char* technology;
        QString input;
        QString output;
        int status;
        const char* error;
    } cases[] = {
        {"a full disk", "MRL_LTE", drive, "/dev/full", 1, "/dev/full: No space left on device"},
        {"no such folder", "IFX", good, name("none/out.csv"), 1, "none/out.csv: No such file or directory"},
        {"a folder", "IFX", good, name("folder"), 1, "folder: Is a directory"},
        {"no times", "IFX", undated, name("out.csv"), 1, "undated.pcap: no message has a time"},
        {"no messages", "IFX", capture("empty.pcap", {}), name("out.csv"), 1, "no message has a time"},
        {"another technology", "IFX", drive, name("out.csv"), 1, "does not look like IFX"},
        {"the input", "IFX", good, good, 2, "are the same file"},
    };
    for (const auto& [name, technology, input, output, status, error] : cases) {
        std::ofstream(path("out.csv")) << "old";
        const auto before = files();
        const Result result = decode({"--technology", technology, "--timeline", output, input});
        EXPECT_EQ(result.status, status) << name;
        EXPECT_THAT(result.errors, HasSubstr(error)) << name;
        EXPECT_EQ(std::ranges::count(result.errors, '\n'), 1) << name << result.errors;
        EXPECT_EQ(contentsOf("out.csv"), "old") << name;
        EXPECT_EQ(files(), before) << name;
    }

    // What could be read of a cut capture is in the table, as it is in the tree.
    const Result cut = timeline(name("cut.pcap"));
    EXPECT_EQ(cut.status, 1);
    EXPECT_THAT(cut.errors, HasSubstr("(after 1 whole messages)\n"));
    EXPECT_EQ(sampled(), "13:20.654 0\n");

    // A killed program leaves the older table alone.
    const auto before = files();
    Program killed(folder, ORVEX_DECODE, {"--technology", "IFX", "--timeline", name("out.csv"), "-"});
    EXPECT_TRUE(waitUntil([&] { return files() > before; }));
    killed.kill();
    EXPECT_EQ(sampled(), "13:20.654 0\n");
}

using Records = std::vector<std::vector<std::string>>;

// The fields of each line. An empty field without quotes is "NULL".
Records recordsOf(const std::string& csv)
{
    Records records(1);
    std::string field = "NULL";
    for (std::size_t i = 0; i < csv.size(); ++i) {
        const bool ends = csv[i] == ',' || csv[i] == '\r';
        if (csv[i] == '"') {
            field.clear();
            while (csv[++i] != '"' || csv[++i] == '"') // two are one
                field += csv[i];
            --i;
        } else if (ends) {
            records.back().push_back(std::exchange(field, "NULL"));
        } else if (csv[i] == '\n') {
            records.emplace_back();
        } else {
            field = (field == "NULL" ? "" : field) + csv[i];
        }
    }
    records.pop_back();
    return records;
}

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

TEST_F(TimelineTest, EndsWithTheRowsOfTheTree)
{
    for (const std::string technology : kTechnologies) {
        const QString capture = QString::fromStdString(capturePath(technology));
        ASSERT_EQ(decode({"--timeline", name("out.csv"), "--every", "0.7", capture}).status, 0);
        std::map<std::pair<std::string, std::string>, std::string> last;
        const Records records = recordsOf(contentsOf("out.csv"));
        for (const auto& record : records)
            last[{record.at(1), record.at(2)}] = record.at(3);
        last.erase({"path", "key"});
        Rows shown;
        for (const auto& [row, text] : last) {
            if (text != "NULL")
                shown.insert(row.first + '=' + text);
        }
        Rows tree;
        addRows(nlohmann::json::parse(decode({"--format", "json", capture}).output)["tree"], tree);
        EXPECT_EQ(shown, tree) << technology;
        EXPECT_GT(last.size(), tree.size()) << technology;
    }
}

TEST_F(TimelineTest, RefusesWhatItWouldIgnore)
{
    const QString capture = levels("in.pcap", {milliseconds(0)});
    const struct {
        QStringList arguments;
        const char* error;
    } cases[] = {
        {{"--timeline", "x.csv", "--path", "/"}, "--timeline cannot be combined with --path."},
        {{"--every", "2"}, "--every goes with --timeline."},
        {{"--timeline", "x.csv", "--every", "0.05"}, "--every takes seconds, from 0.1 to 86400."},
        {{"--timeline", "x.csv", "--every", "2s"}, "--every takes seconds, from 0.1 to 86400."},
        {{"--timeline", "x.csv", "--field", "Level"}, "--field takes a path that begins with '/'."},
        {{"--timeline", "x.csv", capture}, "--timeline FILE.csv goes with one capture."},
    };
    for (const auto& [arguments, error] : cases) {
        const Result result = decode(QStringList{capture} << arguments);
        EXPECT_EQ(result.status, 2);
        EXPECT_THAT(result.errors, testing::StartsWith("orvex-decode: " + std::string(error) + "\n"));
    }
    const Result fields =
        decode({"--technology", "IFX", "--timeline", "-", "--field", "/Level", "--field", "/None", capture});
    EXPECT_EQ(
        fields.output, "time,path,key,text,number,unit\r\n2023-11-14T22:13:20.654Z,/Level,,0 dBm,0,dBm\r\n");
    EXPECT_THAT(fields.errors, testing::EndsWith(": nothing was shown at /None\n"));
}

} // namespace
} // namespace orvex::test
